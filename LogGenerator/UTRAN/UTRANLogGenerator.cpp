#include "LogGenerator/UTRAN/UTRANLogGenerator.h"

#include "LogGenerator/UTRAN/UTRANClassIndex.h"
#include "platform/services/Services.h"

#include <algorithm>
#include <filesystem>
#include <utility>

namespace orvane
{

namespace
{

// Deliberate: the whole path counts, folders included.
bool isUtranPath(const std::string& path)
{
    constexpr std::string_view kWord = "UTRAN";
    const auto equalsRegardlessOfCase = [](char inPath, char inWord) {
        return inPath == inWord || inPath == inWord - 'A' + 'a';
    };
    return std::search(path.begin(), path.end(), kWord.begin(), kWord.end(),
                       equalsRegardlessOfCase) != path.end();
}

} // namespace

void UTRANLogGenerator::init()
{
    const std::vector<std::string> paths = Services::current().resources().pathsOfType("plist");
    const auto path = std::find_if(paths.begin(), paths.end(), isUtranPath);
    // Deliberate: without a template the base is not initialised, and nothing is logged.
    if (path == paths.end())
        return;
    auto index = std::make_shared<UTRANClassIndex>();
    index->init();
    initWithPListName(std::filesystem::path(*path).stem().string(), std::move(index));
    logError("Created UTRANLogGenerator object");
}

std::unique_ptr<LogGenerator> UTRANLogGenerator::generator()
{
    auto generator = std::make_unique<UTRANLogGenerator>();
    generator->init();
    return generator;
}

} // namespace orvane

#include "platform/services/FileSystem.h"

#include <cstdio>
#include <filesystem>
#include <memory>

namespace orvane
{

namespace
{

struct FileCloser {
    void operator()(std::FILE* file) const { std::fclose(file); }
};

} // namespace

std::string FileSystem::located(std::string_view path) const
{
    std::string whole = _root;
    while (whole.ends_with('/'))
        whole.pop_back();
    return whole + std::string(path);
}

bool FileSystem::exists(std::string_view path) const
{
    std::error_code error;
    return std::filesystem::exists(located(path), error);
}

std::optional<Bytes> readFile(const std::string& path, std::size_t limit)
{
    std::error_code error;
    if (std::filesystem::is_directory(path, error))
        return std::nullopt;
    const std::unique_ptr<std::FILE, FileCloser> file(std::fopen(path.c_str(), "rb"));
    if (!file)
        return std::nullopt;
    Bytes content;
    std::uint8_t block[65536];
    while (const std::size_t count = std::fread(block, 1, sizeof block, file.get())) {
        if (count > limit - content.size())
            return std::nullopt;
        content.insert(content.end(), block, block + count);
    }
    if (std::ferror(file.get()) != 0)
        return std::nullopt;
    return content;
}

bool writeFile(const std::string& path, ByteView content)
{
    std::FILE* file = std::fopen(path.c_str(), "wb");
    if (!file)
        return false;
    const bool written =
        content.empty() || std::fwrite(content.data(), 1, content.size(), file) == content.size();
    // Closing writes what is still buffered, so a full disk may show only here.
    const bool closed = std::fclose(file) == 0;
    if (written && closed)
        return true;
    // Half a file could be taken for a whole one. What stood there before is gone already.
    std::error_code error;
    if (std::filesystem::is_regular_file(path, error))
        std::filesystem::remove(path, error);
    return false;
}

} // namespace orvane

#include "LogGenerator/LTE/LTELogGenerator.h"

#include "LogGenerator/LTE/LTEClassIndex.h"
#include "platform/services/SystemLog.h"

#include <utility>

namespace orvane
{

LTELogGenerator::~LTELogGenerator()
{
    logWarning("LTELogGenerator is destructed %p", static_cast<void*>(this));
}

void LTELogGenerator::init()
{
    logError("Creating LTELogGenerator object");
    auto index = std::make_shared<LTEClassIndex>();
    index->init();
    initWithPListName("LTE", std::move(index));
}

std::unique_ptr<LogGenerator> LTELogGenerator::generator()
{
    auto generator = std::make_unique<LTELogGenerator>();
    generator->init();
    return generator;
}

} // namespace orvane

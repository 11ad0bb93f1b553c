#include "LogGenerator/LTE/LTELogGenerator.h"

#include "LogGenerator/LTE/LTEClassIndex.h"
#include "platform/SystemLog.h"

namespace orvane
{

LTELogGenerator::~LTELogGenerator()
{
    logWarning("LTELogGenerator is destructed %p", static_cast<void*>(this));
}

void LTELogGenerator::init()
{
    logError("Creating LTELogGenerator object");
    initWithPListName("LTE", std::make_shared<LTEClassIndex>());
}

std::unique_ptr<LogGenerator> LTELogGenerator::generator()
{
    auto generator = std::make_unique<LTELogGenerator>();
    generator->init();
    return generator;
}

} // namespace orvane

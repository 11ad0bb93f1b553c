#include "LogGenerator/GSM/VRN_GSMLogGenerator.h"

#include "LogGenerator/GSM/VRN_GSMClassIndex.h"
#include "platform/services/SystemLog.h"

#include <utility>

namespace orvane
{

VRN_GSMLogGenerator::~VRN_GSMLogGenerator()
{
    logWarning("VRN_GSMLogGenerator is destructed %p", static_cast<void*>(this));
}

void VRN_GSMLogGenerator::init()
{
    logError("Creating VRN_GSMLogGenerator object");
    auto index = std::make_shared<VRN_GSMClassIndex>();
    index->init();
    initWithPListName("VRN_GSM", std::move(index));
}

std::unique_ptr<LogGenerator> VRN_GSMLogGenerator::generator()
{
    auto generator = std::make_unique<VRN_GSMLogGenerator>();
    generator->init();
    return generator;
}

} // namespace orvane

#include "LogGenerator/C2K/C2KLogGenerator.h"
#include "LogGenerator/GSM/GSMLogGenerator.h"
#include "LogGenerator/GSM/VRN_GSMLogGenerator.h"
#include "LogGenerator/LTE/LTELogGenerator.h"
#include "LogGenerator/LogGenerator.h"
#include "LogGenerator/UTRAN/UTRANLogGenerator.h"
#include "platform/base/PropertyValue.h"
#include "platform/base/TelephonyConstants.h"

namespace orvane
{

namespace
{

struct Factory {
    const char* technology;
    std::unique_ptr<LogGenerator> (*generator)();
};

constexpr Factory kFactories[] = {
    {kTSLogChannelTechnology_IFX,           GSMLogGenerator::generator    },
    {kTSLogChannelTechnology_Varnel_GSM,    VRN_GSMLogGenerator::generator},
    {kTSLogChannelTechnology_Varnel_CDMA,   C2KLogGenerator::generator    },
    {kTSLogChannelTechnology_Varnel_LTE,    LTELogGenerator::generator    },
    {kTSLogChannelTechnology_Varnel_UTRAN2, UTRANLogGenerator::generator  },
};

} // namespace

std::unique_ptr<LogGenerator> LogGenerator::generatorFromTechnology(const PropertyValue& technology)
{
    const std::string* identifier = technology.asString();
    if (!identifier)
        return nullptr;
    for (const Factory& known : kFactories)
        if (*identifier == known.technology)
            return known.generator();
    return nullptr;
}

} // namespace orvane

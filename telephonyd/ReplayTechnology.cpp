#include "telephonyd/ReplayTechnology.h"

#include "LogGenerator/DlfReader.h"
#include "LogGenerator/LogGenerator.h"
#include "platform/Services.h"
#include "platform/TelephonyServer.h"

#include <map>
#include <set>

namespace orvane
{

namespace
{

struct Technology {
    const char* name;
    const char* constant;
};

constexpr Technology kTechnologies[] = {
    {"lte",         kTSLogChannelTechnology_Varnel_LTE   },
    {"umts",        kTSLogChannelTechnology_Varnel_GSM   },
    {"utran",       kTSLogChannelTechnology_Varnel_UTRAN2},
    {"cdma",        kTSLogChannelTechnology_Varnel_CDMA  },
    {"cellmonitor", kTSLogChannelTechnology_IFX          },
};

constexpr std::uint16_t kVersionReport = 0x1FFD;
constexpr std::uint8_t kModemItem = 1;

// Generators tell of their coming and going, which means nothing here.
class Silence
{
public:
    Silence()
    {
        Services::current().setLog(&_nothing);
        Services::current().setConsole(nullptr);
    }
    ~Silence()
    {
        Services::current().setLog(&_log);
        Services::current().setConsole(&_console);
    }
    Silence(const Silence&) = delete;
    Silence& operator=(const Silence&) = delete;

private:
    NullLog _nothing;
    SystemLog& _log = Services::current().log();
    Console& _console = Services::current().console();
};

std::map<std::uint32_t, std::uint64_t> modemItemsByCode(ByteView file)
{
    std::map<std::uint32_t, std::uint64_t> counts;
    DlfReader reader(file);
    while (const auto item = reader.next())
        if (item->logCode != kVersionReport && item->type == kModemItem)
            ++counts[item->logCode];
    return counts;
}

std::set<std::uint32_t> codesOf(const LogGenerator& generator)
{
    std::set<std::uint32_t> codes;
    const PropertyValue command = generator.getStartCommand();
    if (const PropertyArray* array = command["SetVarnelLogCodes"].asArray())
        for (const PropertyValue& element : *array)
            if (const auto code = element.asInteger())
                codes.insert(static_cast<std::uint32_t>(*code));
    return codes;
}

} // namespace

std::optional<std::string> technologyOfLog(ByteView file)
{
    const auto counts = modemItemsByCode(file);
    const Silence silence;
    std::optional<std::string> best;
    std::uint64_t bestItems = 0;
    std::size_t bestCodes = 0;
    for (const Technology& technology : kTechnologies) {
        const auto generator = LogGenerator::generatorFromTechnology(technology.constant);
        if (!generator)
            continue;
        const std::set<std::uint32_t> codes = codesOf(*generator);
        std::uint64_t items = 0;
        for (const auto& [code, count] : counts)
            items += codes.contains(code) ? count : 0;
        if (items > bestItems || (items > 0 && items == bestItems && codes.size() < bestCodes)) {
            best = technology.constant;
            bestItems = items;
            bestCodes = codes.size();
        }
    }
    return best;
}

std::optional<std::string> technologyNamed(std::string_view name)
{
    for (const Technology& technology : kTechnologies)
        if (name == technology.name)
            return technology.constant;
    return std::nullopt;
}

std::string technologyNames()
{
    std::string names;
    for (const Technology& technology : kTechnologies)
        names += (names.empty() ? "" : ", ") + std::string(technology.name);
    return names;
}

} // namespace orvane

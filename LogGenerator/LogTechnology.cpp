#include "LogGenerator/LogTechnology.h"

#include "LogGenerator/LogGenerator.h"
#include "LogGenerator/Silence.h"
#include "LogGenerator/StateKeys.h"
#include "dlf/VersionReport.h"
#include "platform/base/Bytes.h"
#include "platform/base/LogMessage.h"
#include "platform/base/PropertyValue.h"
#include "platform/base/Technology.h"
#include "platform/base/TelephonyConstants.h"

#include <set>

namespace orvane
{

namespace
{

std::set<std::uint16_t> codesOf(const LogGenerator& generator)
{
    std::set<std::uint16_t> codes;
    const PropertyValue command = generator.getStartCommand();
    if (const PropertyArray* array = command[kSetModemLogCodesKey].asArray())
        for (const PropertyValue& element : *array)
            if (const auto code = element.asInteger())
                codes.insert(static_cast<std::uint16_t>(*code));
    return codes;
}

} // namespace

void TechnologyFinder::take(const DlfItem& item)
{
    if (item.logCode != kDlfVersionReportCode && item.type == kModemItem)
        ++_itemsByCode[item.logCode];
}

std::optional<std::string> TechnologyFinder::technology() const
{
    // Generators tell of their coming and going, which means nothing here.
    const Silence silence;
    std::optional<std::string> best;
    std::uint64_t bestItems = 0;
    std::size_t bestCodes = 0;
    for (const Technology& technology : kTechnologies) {
        const auto generator = LogGenerator::generatorFromTechnology(technology.constant);
        if (!generator)
            continue;
        const std::set<std::uint16_t> codes = codesOf(*generator);
        std::uint64_t items = 0;
        for (const auto& [code, count] : _itemsByCode)
            items += codes.contains(code) ? count : 0;
        if (items > bestItems || (items > 0 && items == bestItems && codes.size() < bestCodes)) {
            best = technology.constant;
            bestItems = items;
            bestCodes = codes.size();
        }
    }
    return best;
}

std::optional<std::string> technologyOfItems(DlfReader reader)
{
    TechnologyFinder finder;
    while (const auto item = reader.next())
        finder.take(*item);
    return finder.technology();
}

std::optional<std::string> technologyOfLog(ByteView file)
{
    return technologyOfItems(DlfReader(file));
}

} // namespace orvane

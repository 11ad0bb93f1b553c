#include "insight/ServingCell.h"

#include "platform/base/TelephonyConstants.h"

namespace orvane
{

namespace
{

constexpr const char* kLteRows[] = {"Physical Cell ID", "Download Frequency", "Cell Identity"};
constexpr ServingCellGroup kLte[] = {
    {"Serving Cell Info", kLteRows},
};

constexpr const char* kUtranRows[] = {"Cell ID", "Downlink UARFCN"};
constexpr ServingCellGroup kUtran[] = {
    {"Serving Cell Info", kUtranRows},
};

constexpr const char* kGsmRows[] = {"Cell ID", "ARFCN", "BSIC"};
constexpr const char* kUmtsRows[] = {"Cell ID", "Downlink Frequency"};
constexpr ServingCellGroup kGsmAndUmts[] = {
    {"GSM Serving Cell", kGsmRows },
    {"UMTS RR Info",     kUmtsRows},
};

constexpr const char* kOneXRows[] = {"02;System ID", "03;Network ID", "04;Base ID"};
constexpr const char* kEvdoRows[] = {"04;Channel", "08;Serving PN Offset"};
constexpr ServingCellGroup kCdma[] = {
    {"03;System Identity", kOneXRows},
    {"02;1xEV-DO",         kEvdoRows},
};

struct TechnologyGroups {
    const char* technology;
    std::span<const ServingCellGroup> groups;
};

constexpr TechnologyGroups kTechnologies[] = {
    {kTSLogChannelTechnology_Varnel_LTE,    kLte       },
    {kTSLogChannelTechnology_Varnel_UTRAN2, kUtran     },
    {kTSLogChannelTechnology_Varnel_GSM,    kGsmAndUmts},
    {kTSLogChannelTechnology_Varnel_CDMA,   kCdma      },
};

// Whether a row tells a cell: not where the generators show that there is none.
bool isKnown(const PropertyValue& row)
{
    if (const Reading* reading = row.asReading())
        return reading->description->format->showsNumber(reading->raw);
    const std::string* text = row.asString();
    return text && !text->empty() && *text != "Invalid Value";
}

} // namespace

ServingCell::ServingCell(std::string_view technology)
{
    for (const TechnologyGroups& known : kTechnologies)
        if (technology == known.technology)
            _groups = known.groups;
    std::size_t rows = 0;
    for (const ServingCellGroup& group : _groups)
        rows += group.rows.size();
    _known.resize(rows);
}

bool ServingCell::note(const PropertyValue& display)
{
    bool isAnother = false;
    auto known = _known.begin();
    for (const ServingCellGroup& group : _groups) {
        const PropertyValue& shown = display[group.group];
        // Rows of a cell may become known one by one: only the first makes it another cell.
        bool wasKnown = false;
        bool isNew = false;
        for (const char* row : group.rows) {
            const PropertyValue& value = shown[row];
            if (isKnown(value) && value != *known) {
                isAnother = isAnother || *known;
                isNew = true;
                *known = value;
            } else {
                wasKnown = wasKnown || *known;
            }
            ++known;
        }
        isAnother = isAnother || (isNew && !wasKnown);
    }
    return isAnother;
}

} // namespace orvane

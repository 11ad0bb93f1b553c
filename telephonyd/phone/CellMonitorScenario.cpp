#include "telephonyd/phone/CellMonitorScenario.h"

#include "platform/base/Bytes.h"
#include "platform/base/PropertyValue.h"
#include "platform/base/TelephonyConstants.h"
#include "platform/plist/PropertyList.h"
#include "telephonyd/phone/EachSite.h"
#include "telephonyd/phone/LTETown.h"

#include <algorithm>
#include <cmath>

namespace orvane
{

namespace
{

using std::chrono::milliseconds;

constexpr milliseconds kListEvery{1000};
constexpr Phases::Range kCallFor{10, 30};
constexpr Phases::Range kNoCallFor{12, 30};

constexpr std::size_t kMostNeighbours = 6; // as many as a phone reports
constexpr double kLeastHeard = -110;       // dBm at which a neighbour can still be told
constexpr double kLeastLevel = -105;       // to camp on a cell, in dBm
constexpr double kReselectOffset = 6;      // dB that the cells of the higher band are preferred by

struct Site {
    double eastMetres;
    double northMetres;
    std::uint16_t channel; // ARFCN; from 512 on those of the higher band
    std::uint8_t networkColour;
    std::uint8_t baseColour;
    std::uint16_t cellIdentity;
    std::uint16_t locationArea;
};

constexpr Site kTown[] = {
    {150,  180,  22,  3, 0, 11001, 4101},
    {520,  -160, 634, 3, 1, 11002, 4101},
    {910,  170,  41,  3, 4, 11011, 4101},
    {1300, -150, 702, 3, 2, 11012, 4101},
    {1660, 190,  29,  3, 7, 11021, 4101},
    {1960, -90,  666, 3, 5, 11022, 4101},
    {1960, 470,  57,  3, 3, 11031, 4102},
    {1720, 780,  641, 3, 6, 11032, 4102},
    {2210, 1060, 35,  3, 1, 12001, 4102},
    {2760, 1010, 691, 3, 0, 12002, 4102},
    {2790, 1550, 48,  3, 2, 12011, 4102},
    {2360, 1930, 24,  3, 5, 12012, 4102},
    {1780, 1660, 53,  3, 4, 13001, 4103},
    {1150, 1930, 38,  3, 6, 13002, 4103},
    {650,  1450, 61,  3, 3, 13011, 4103},
    {-120, 760,  44,  3, 7, 13012, 4103},
};

constexpr double kLevelAt100Metres = -74;
constexpr auto kMasts = ofEach(kTown, [](const Site& site) {
    return DriveCell{site.eastMetres, site.northMetres, site.channel, kLevelAt100Metres};
});

std::string decibels(double value, const char* unit)
{
    return std::to_string(std::lround(value)) + unit;
}

std::string band(const Site& site) { return site.channel >= 512 ? "DCS 1800" : "GSM 900"; }

// Network and base station colour code.
std::string colours(const Site& site)
{
    return std::to_string(site.networkColour) + "-" + std::to_string(site.baseColour);
}

double reselection(const Site& site, double level)
{
    return level - kLeastLevel + (site.channel >= 512 ? kReselectOffset : 0);
}

// The viewer shows such a dictionary as its value.
PropertyValue only(const char* key, std::string value)
{
    return PropertyValue::dictionaryOf({
        {key, std::move(value)}
    });
}

} // namespace

CellMonitorScenario::CellMonitorScenario(std::uint64_t seed)
    : DrivenScenario(kTSLogChannelTechnology_IFX, {kMasts, kLTETownRoad, seed}),
      _call(kCallFor, kNoCallFor, false, seed + 1)
{
}

void CellMonitorScenario::next()
{
    const bool callChanged = _call.advance(now());
    const bool cellChanged = _drive.step(_call.isOn());
    if (callChanged || cellChanged || isDue(kListEvery))
        add(cellList());
}

PhoneMessage CellMonitorScenario::cellList() const
{
    const PropertyValue list = PropertyValue::dictionaryOf({
        {"Network",        network()       },
        {"Serving Cell",   servingCell()   },
        {"Neighbor Cells", neighbourCells()},
    });
    return {PhoneMessage::Kind::Bare, 0, xmlPropertyListBytes(list).value_or(Bytes())};
}

PropertyValue CellMonitorScenario::network() const
{
    const PropertyValue registration = PropertyValue::dictionaryOf({
        {"Calls", "Home"},
        {"Data",  "Home"},
    });
    return PropertyValue::dictionaryOf({
        {"Country Code", "001"       },
        {"Network Code", "01"        },
        {"Name",         only("Short", "Test Network")},
        {"Location Area",              std::to_string(kTown[_drive.serving()].locationArea)           },
        {"Registration",              registration },
    });
}

PropertyValue CellMonitorScenario::servingCell() const
{
    constexpr double kMetresATimingStep = 554;
    const Site& site = kTown[_drive.serving()];
    const double level = _drive.averageLevel(_drive.serving());
    PropertyValue cell = PropertyValue::newDictionary();
    PropertyDictionary& rows = *cell.asDictionary();
    rows.set("Mode", _call.isOn() ? "Dedicated" : "Idle");
    rows.set("Band", band(site));
    rows.set("Channel", only("ARFCN", std::to_string(site.channel)));
    rows.set("BSIC", colours(site));
    rows.set("Cell Identity", std::to_string(site.cellIdentity));
    rows.set("Received Level", only("Average", decibels(level, " dBm")));
    if (_call.isOn()) {
        // By what the level says of the distance.
        const double metres = 100 * std::pow(10, (-74 - level) / 36);
        const int errors = std::clamp(static_cast<int>((-84 - level) / 3), 0, 7);
        rows.set("Received Quality", std::to_string(errors));
        rows.set("Timing Advance", std::to_string(std::lround(metres / kMetresATimingStep)));
    } else {
        rows.set("C1", decibels(level - kLeastLevel, " dB"));
        rows.set("C2", decibels(reselection(site, level), " dB"));
    }
    return cell;
}

// The viewer leaves out the first element.
PropertyValue CellMonitorScenario::neighbourCells() const
{
    auto found = _drive.neighbours();
    std::erase_if(found, [this](std::size_t neighbour) {
        return _drive.averageLevel(neighbour) < kLeastHeard;
    });
    found.resize(std::min(found.size(), kMostNeighbours));
    PropertyValue cells = PropertyValue::arrayOf({only("Count", std::to_string(found.size()))});
    for (const std::size_t neighbour : found) {
        const Site& site = kTown[neighbour];
        const double level = _drive.averageLevel(neighbour);
        cells.asArray()->append(PropertyValue::dictionaryOf({
            {"Channel",      only("ARFCN", std::to_string(site.channel))},
            {      "BSIC", colours(site)            },
            { "Received Level",      only("Average",                  decibels(level,               " dBm"))},
            {   "C2",        decibels(reselection(site,                    level),                              " dB")},
        }));
    }
    return cells;
}

} // namespace orvane

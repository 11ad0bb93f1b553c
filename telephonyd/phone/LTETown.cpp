#include "telephonyd/phone/LTETown.h"

#include "telephonyd/phone/EachSite.h"

namespace orvane
{

namespace
{

struct Layer {
    std::uint16_t earfcn;
    std::uint8_t band;
    std::uint8_t resourceBlocks;
    std::uint8_t antennas;
    std::uint8_t priority;
};

constexpr std::uint16_t kUplinkOffset = 18000;

constexpr Layer kCentre{1444, 3, 100, 4, 6};
constexpr Layer kStation{6300, 20, 50, 2, 4};
constexpr Layer kHarbour{300, 1, 75, 4, 5};
constexpr Layer kSuburb{3600, 8, 25, 2, 4};
constexpr Layer kFields{9450, 28, 6, 1, 2};
constexpr Layer kVillage{3752, 8, 15, 2, 3};

struct Site {
    double eastMetres;
    double northMetres;
    double levelAt100Metres;
    Layer layer;
    std::uint16_t physicalCellId;
    std::uint32_t cellIdentity;
    std::uint16_t trackingAreaCode;
};

constexpr Site kSites[] = {
    {150,  120,  -80, kCentre,  12,  0x01A2B00, 4101},
    {560,  -110, -80, kCentre,  48,  0x01A2B01, 4101},
    {960,  90,   -79, kCentre,  301, 0x01A2C00, 4101},
    {1380, -80,  -80, kCentre,  337, 0x01A2C01, 4101},
    {1780, -60,  -81, kCentre,  150, 0x01A2D02, 4101},
    {1700, 400,  -79, kStation, 77,  0x01B0100, 4101},
    {1930, 800,  -79, kStation, 221, 0x01B0101, 4102},
    {1350, 520,  -83, kStation, 404, 0x01B0102, 4101},
    {2360, 1010, -79, kHarbour, 5,   0x01C3300, 4102},
    {2690, 1300, -79, kHarbour, 17,  0x01C3301, 4102},
    {2480, 1690, -80, kHarbour, 29,  0x01C3302, 4102},
    {2050, 1880, -79, kSuburb,  468, 0x01D0A00, 4102},
    {1560, 1740, -79, kSuburb,  479, 0x01D0A01, 4102},
    {1080, 1890, -79, kSuburb,  490, 0x01D0A02, 4103},
    {880,  1480, -80, kFields,  90,  0x01E5500, 4103},
    {700,  1060, -80, kFields,  91,  0x01E5501, 4103},
    {290,  930,  -79, kVillage, 256, 0x01F1100, 4103},
    {-90,  700,  -79, kVillage, 257, 0x01F1101, 4103},
    {110,  390,  -81, kVillage, 503, 0x01F1102, 4101},
};

} // namespace

constexpr std::array<LTECell, kLTETownCells> kLTETown = ofEach(kSites, [](const Site& site) {
    const Layer& layer = site.layer;
    return LTECell{site.physicalCellId,
                   layer.earfcn,
                   static_cast<std::uint16_t>(layer.earfcn + kUplinkOffset),
                   layer.band,
                   layer.resourceBlocks,
                   site.cellIdentity,
                   site.trackingAreaCode,
                   layer.antennas,
                   layer.priority};
});
constexpr std::array<DriveCell, kLTETownCells> kLTETownMasts = ofEach(kSites, [](const Site& site) {
    return DriveCell{site.eastMetres, site.northMetres, site.layer.earfcn, site.levelAt100Metres};
});
constexpr std::array<RoadPoint, 8> kLTETownRoad = {
    {
     {0, 0},
     {1800, 0},
     {1800, 900},
     {2600, 900},
     {2600, 1800},
     {800, 1800},
     {800, 1000},
     {0, 1000},
     }
};

} // namespace orvane

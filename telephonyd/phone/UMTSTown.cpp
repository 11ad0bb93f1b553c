#include "telephonyd/phone/UMTSTown.h"

#include "telephonyd/phone/EachSite.h"

namespace orvane
{

namespace
{

struct Site {
    double eastMetres;
    double northMetres;
    double levelAt100Metres;
    UMTSTownCell cell;
};

// The UMTS channels are among those that lie between the usual ones, numbered from 412 on. The GSM
// network of the same masts goes by the same channel and code numbers.
constexpr Site kSites[] = {
    {-40,  60,   -79, {false, 142, 18, 11051, 1005, 1}   },
    {210,  -60,  -80, {false, 157, 21, 11052, 1005, 1}   },
    {430,  80,   -80, {false, 171, 23, 11060, 1005, 2}   },
    {150,  330,  -80, {false, 186, 34, 11071, 1005, 1}   },
    {420,  400,  -81, {false, 199, 37, 11072, 1005, 2}   },
    {640,  200,  -84, {false, 214, 45, 11080, 1005, 2}   },
    {760,  40,   -80, {true, 612, 9, 0x0513A01, 1006, 1} },
    {980,  -140, -78, {true, 612, 26, 0x0513A02, 1006, 1}},
    {1130, 150,  -79, {true, 612, 41, 0x0513B01, 1006, 1}},
    {1290, -70,  -79, {true, 612, 57, 0x0513B02, 1006, 1}},
    {1330, 260,  -78, {true, 637, 12, 0x0513C01, 1006, 2}},
    {1100, 420,  -79, {true, 637, 30, 0x0513C02, 1006, 2}},
    {900,  310,  -79, {true, 612, 62, 0x0513D01, 1006, 2}},
    {830,  480,  -83, {true, 612, 3, 0x0513D02, 1006, 2} },
};

} // namespace

constexpr std::array<UMTSTownCell, kUMTSTownCells> kUMTSTown =
    ofEach(kSites, [](const Site& site) { return site.cell; });
constexpr std::array<DriveCell, kUMTSTownCells> kUMTSTownMasts = ofEach(kSites, [](const Site&
                                                                                       site) {
    return DriveCell{site.eastMetres, site.northMetres, site.cell.channel, site.levelAt100Metres};
});
constexpr std::array<RoadPoint, 6> kUMTSTownRoad = {
    {
     {1250, 0},
     {1250, 340},
     {560, 360},
     {0, 300},
     {0, 0},
     {600, 20},
     }
};

} // namespace orvane

#include "telephonyd/phone/UTRANTown.h"

#include "telephonyd/phone/EachSite.h"

namespace orvane
{

namespace
{

struct Site {
    double eastMetres;
    double northMetres;
    double levelAt100Metres;
    UTRANCell cell;
};

constexpr Site kSites[] = {
  // the centre
    {140,  -70,  -78, {10055, 34, 12, 0x0A31B00, 4101, 1, 0} },
    {610,  90,   -78, {10055, 34, 27, 0x0A31B01, 4101, 1, 0} },
    {1040, -90,  -77, {10055, 34, 63, 0x0A31C00, 4101, 1, 0} },
    {1060, 150,  -82, {10063, 34, 88, 0x0A31C01, 4101, 1, 2} },
    {1460, 80,   -78, {10055, 34, 101, 0x0A31D00, 4101, 1, 0}},
    {1870, 110,  -79, {10055, 34, 45, 0x0A31D01, 4101, 1, 0} },
 // the station and the harbour
    {1730, 540,  -78, {10063, 34, 76, 0x0A42100, 4101, 2, 0} },
    {1990, 830,  -78, {10063, 34, 119, 0x0A42101, 4102, 2, 0}},
    {2420, 960,  -78, {10063, 34, 8, 0x0A42200, 4102, 2, 2}  },
    {2670, 1390, -77, {10063, 34, 31, 0x0A42201, 4102, 2, 0} },
    {2510, 1850, -78, {9412, 39, 54, 0x0A42300, 4102, 2, 0}  },
    {2080, 1730, -78, {9412, 39, 97, 0x0A42301, 4102, 2, 0}  },
 // the fields and the village
    {1610, 1890, -77, {9412, 39, 110, 0x0B50A00, 4103, 3, 0} },
    {1120, 1720, -77, {9412, 39, 3, 0x0B50A01, 4103, 3, 0}   },
    {710,  1430, -77, {9412, 39, 70, 0x0B50B00, 4103, 3, 4}  },
    {440,  1080, -77, {9404, 39, 19, 0x0B50B01, 4103, 3, 0}  },
    {-60,  610,  -77, {9404, 39, 84, 0x0B50C00, 4103, 3, 0}  },
};

} // namespace

constexpr std::array<UTRANCell, kUTRANTownCells> kUTRANTown =
    ofEach(kSites, [](const Site& site) { return site.cell; });
constexpr std::array<DriveCell, kUTRANTownCells> kUTRANTownMasts = ofEach(kSites, [](const Site&
                                                                                         site) {
    return DriveCell{site.eastMetres, site.northMetres, site.cell.channel, site.levelAt100Metres};
});

} // namespace orvane

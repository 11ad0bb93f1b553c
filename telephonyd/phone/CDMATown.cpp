#include "telephonyd/phone/CDMATown.h"

#include "telephonyd/phone/EachSite.h"

namespace orvane
{

namespace
{

constexpr double kLevelAt100Metres = -73;

constexpr CDMAArea kCentre{0, 384, 1, 475, 31001, 12, 7, 41, 0};
constexpr CDMAArea kHarbour{0, 384, 1, 475, 31001, 13, 8, 42, 0};
// Another operator's, on carriers of its own.
constexpr CDMAArea kVillage{1, 350, 1, 375, 31044, 1, 90, 167, 8};

struct Site {
    double eastMetres;
    double northMetres;
    CDMACell cell;
};

constexpr Site kSites[] = {
    {180,  210,  {kCentre, 12, 1201}  },
    {640,  -190, {kCentre, 180, 1202} },
    {1090, 230,  {kCentre, 348, 1203} },
    {1520, -200, {kCentre, 24, 1211}  },
    {2010, 130,  {kCentre, 192, 1212} },
    {1580, 560,  {kCentre, 360, 1213} },
    {2030, 720,  {kHarbour, 36, 1301} },
    {2420, 1120, {kHarbour, 204, 1302}},
    {2810, 1420, {kHarbour, 372, 1303}},
    {2410, 1990, {kHarbour, 48, 1311} },
    {1850, 1620, {kHarbour, 216, 1312}},
    {1330, 1990, {kVillage, 384, 41}  },
    {610,  1640, {kVillage, 60, 42}   },
    {480,  1190, {kVillage, 228, 43}  },
    {-200, 640,  {kVillage, 396, 44}  },
};

} // namespace

constexpr std::array<CDMACell, kCDMATownCells> kCDMATown =
    ofEach(kSites, [](const Site& site) { return site.cell; });
constexpr std::array<DriveCell, kCDMATownCells> kCDMATownMasts =
    ofEach(kSites, [](const Site& site) {
        return DriveCell{site.eastMetres, site.northMetres, site.cell.area.oneXChannel,
                         kLevelAt100Metres};
    });

} // namespace orvane

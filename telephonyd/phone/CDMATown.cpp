#include "telephonyd/phone/CDMATown.h"

namespace orvane
{

namespace
{

constexpr CDMAArea kCentre{0, 384, 1, 475, 31001, 12, 7, 41, 0};
constexpr CDMAArea kHarbour{0, 384, 1, 475, 31001, 13, 8, 42, 0};
// Another operator's, on carriers of its own.
constexpr CDMAArea kVillage{1, 350, 1, 375, 31044, 1, 90, 167, 8};

struct Site {
    double eastMetres;
    double northMetres;
    CDMACell cell;
};

constexpr std::array<Site, kCDMATownCells> kSites = {
    {
     {180, 210, {kCentre, 12, 1201}},
     {640, -190, {kCentre, 180, 1202}},
     {1090, 230, {kCentre, 348, 1203}},
     {1520, -200, {kCentre, 24, 1211}},
     {2010, 130, {kCentre, 192, 1212}},
     {1580, 560, {kCentre, 360, 1213}},
     {2030, 720, {kHarbour, 36, 1301}},
     {2420, 1120, {kHarbour, 204, 1302}},
     {2810, 1420, {kHarbour, 372, 1303}},
     {2410, 1990, {kHarbour, 48, 1311}},
     {1850, 1620, {kHarbour, 216, 1312}},
     {1330, 1990, {kVillage, 384, 41}},
     {610, 1640, {kVillage, 60, 42}},
     {480, 1190, {kVillage, 228, 43}},
     {-200, 640, {kVillage, 396, 44}},
     }
};

constexpr std::array<CDMACell, kCDMATownCells> townCells()
{
    std::array<CDMACell, kCDMATownCells> cells{};
    for (std::size_t i = 0; i < kSites.size(); ++i)
        cells[i] = kSites[i].cell;
    return cells;
}

constexpr std::array<DriveCell, kCDMATownCells> townMasts()
{
    constexpr double kLevelAt100Metres = -73;
    std::array<DriveCell, kCDMATownCells> masts{};
    for (std::size_t i = 0; i < kSites.size(); ++i)
        masts[i] = {kSites[i].eastMetres, kSites[i].northMetres, kSites[i].cell.area.oneXChannel,
                    kLevelAt100Metres};
    return masts;
}

} // namespace

constexpr std::array<CDMACell, kCDMATownCells> kCDMATown = townCells();
constexpr std::array<DriveCell, kCDMATownCells> kCDMATownMasts = townMasts();

} // namespace orvane

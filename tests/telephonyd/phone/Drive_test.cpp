#include "telephonyd/phone/Drive.h"

#include <gmock/gmock.h>

#include <cmath>

namespace orvane
{
namespace
{

using namespace std::chrono_literals;
using testing::ElementsAre;

constexpr DriveCell kCells[] = {
    {0,    50,  1, -80},
    {800,  50,  1, -80},
    {1600, 50,  2, -80},
    {9999, 999, 1, -80}, // out of range
};
constexpr RoadPoint kRoad[] = {
    {0,    0},
    {1600, 0},
};

TEST(DriveTest, BeginsOnTheStrongestCell)
{
    const Drive drive(kCells, kRoad, 1);
    for (std::size_t i = 0; i < std::size(kCells); ++i)
        EXPECT_LE(drive.level(i), drive.level(drive.serving()));
}

TEST(DriveTest, VisitsTheCellsAlongTheRoad)
{
    Drive drive(kCells, kRoad, 1);
    std::vector<std::size_t> visited = {drive.serving()};
    for (int i = 0; i < 25 * 240; ++i)
        if (drive.step(false))
            visited.push_back(drive.serving());
    const auto begin =
        visited.front() == 0 ? visited.begin() : std::find(visited.begin(), visited.end(), 0);
    ASSERT_GE(visited.end() - begin, 3);
    EXPECT_THAT(std::vector(begin, begin + 3), ElementsAre(0, 1, 2));
}

TEST(DriveTest, AnotherCellMustBeBetterForAWhile)
{
    Drive drive(kCells, kRoad, 3);
    auto betterFor = 0ms;
    int changes = 0;
    for (int i = 0; i < 25 * 240; ++i) {
        const std::size_t before = drive.serving();
        const bool changed = drive.step(false);
        bool isBetter = false;
        for (std::size_t cell = 0; cell < std::size(kCells); ++cell)
            isBetter |= drive.averageLevel(cell) >= drive.averageLevel(before) + 3;
        betterFor = isBetter ? betterFor + Drive::kStep : 0ms;
        if (changed) {
            EXPECT_GE(betterFor, 1s);
            EXPECT_NE(drive.serving(), before);
            betterFor = 0ms;
            ++changes;
        }
    }
    EXPECT_GE(changes, 2);
}

TEST(DriveTest, ABusyPhoneChangesSooner)
{
    Drive idle(kCells, kRoad, 1);
    Drive busy(kCells, kRoad, 1);
    int idleSteps = 1;
    int busySteps = 1;
    while (!idle.step(false))
        ASSERT_LT(++idleSteps, 10000);
    while (!busy.step(true))
        ASSERT_LT(++busySteps, 10000);
    EXPECT_LT(busySteps, idleSteps);
}

TEST(DriveTest, LevelsChangeSmoothlyWithinTheirRange)
{
    Drive drive(kCells, kRoad, 5);
    std::vector<double> before(std::size(kCells));
    double least = 0;
    double most = -200;
    for (int i = 0; i < 25 * 240; ++i) {
        drive.step(false);
        for (std::size_t cell = 0; cell < std::size(kCells); ++cell) {
            const double level = drive.level(cell);
            EXPECT_GE(level, Drive::kWeakest);
            EXPECT_LE(level, Drive::kStrongest);
            if (i > 0) {
                EXPECT_LT(std::abs(level - before[cell]), 1.0);
            }
            before[cell] = level;
        }
        least = std::min(least, drive.averageLevel(0));
        most = std::max(most, drive.averageLevel(0));
    }
    EXPECT_LT(least, -110);
    EXPECT_GT(most, -80);
    EXPECT_EQ(drive.averageLevel(3), Drive::kWeakest);
}

TEST(DriveTest, NeighboursAreTheOthersThatAreHeardStrongestFirst)
{
    Drive drive(kCells, kRoad, 1);
    std::size_t least = 9;
    std::size_t most = 0;
    for (int i = 0; i < 25 * 240; ++i) {
        drive.step(false);
        const auto neighbours = drive.neighbours();
        for (std::size_t n = 0; n < neighbours.size(); ++n) {
            EXPECT_NE(neighbours[n], drive.serving());
            EXPECT_NE(neighbours[n], 3U);
            if (n > 0) {
                EXPECT_LE(drive.averageLevel(neighbours[n]), drive.averageLevel(neighbours[n - 1]));
            }
        }
        for (const std::size_t cell : drive.neighboursOn(2))
            EXPECT_EQ(cell, 2U);
        least = std::min(least, neighbours.size());
        most = std::max(most, neighbours.size());
    }
    EXPECT_LT(least, most); // cells appear and disappear
}

} // namespace
} // namespace orvane

#pragma once

#include <chrono>
#include <cstdint>
#include <optional>
#include <span>
#include <vector>

namespace orvane
{

// A cell as the drive sees it: where its mast stands, which channel it sends on, and how strong it
// is 100 m away.
struct DriveCell {
    double eastMetres;
    double northMetres;
    std::uint32_t channel;
    double levelAt100Metres; // dBm
};

// Where the road turns. It leads from the last point back to the first.
struct RoadPoint {
    double eastMetres;
    double northMetres;
};

// A phone that is driven along a circular road: how well it receives each cell, and which cell
// serves it. All of it follows from the cells, the road, the seed and the number of steps.
class Drive
{
public:
    static constexpr std::chrono::milliseconds kStep{40};
    // What levels are kept within, in dBm.
    static constexpr double kWeakest = -120;
    static constexpr double kStrongest = -75;

    // The cells and the road must outlive it. There must be at least one cell and two road points.
    Drive(std::span<const DriveCell> cells, std::span<const RoadPoint> road, std::uint64_t seed);

    // Drives for kStep. A busy phone (in a call or moving data) changes cells sooner. Returns
    // whether it changed to another cell.
    bool step(bool isBusy);

    [[nodiscard]] std::size_t serving() const { return _serving; }
    // How strong the cell is right now, and how strong on the average of the last second, in dBm.
    [[nodiscard]] double level(std::size_t cell) const { return _states[cell].level; }
    [[nodiscard]] double averageLevel(std::size_t cell) const { return _states[cell].average; }
    // The other cells that can be heard, the strongest first.
    [[nodiscard]] std::vector<std::size_t> neighbours() const;
    // Of those only the ones on the channel.
    [[nodiscard]] std::vector<std::size_t> neighboursOn(std::uint32_t channel) const;

private:
    // A variation of the level around the one that distance gives, as from hills, houses and
    // lorries.
    struct Fading {
        double decibels;
        double secondsPerCycle;
        double phase;
    };
    struct CellState {
        std::vector<Fading> fadings;
        double level = 0;
        double average = 0;
        bool isHeard = false;
        std::chrono::milliseconds betterFor{0}; // than the serving cell, at a stretch
    };

    void move();
    void listen(bool isFirst);
    std::optional<std::size_t> betterCell(bool isBusy);
    [[nodiscard]] double levelByDistance(const DriveCell& cell) const;

    std::span<const DriveCell> _cells;
    std::span<const RoadPoint> _road;
    std::vector<CellState> _states;
    std::chrono::milliseconds _now{0};
    std::size_t _leg = 0; // of the road
    double _metresOnLeg = 0;
    std::size_t _serving = 0;
};

} // namespace orvane

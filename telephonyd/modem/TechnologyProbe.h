#pragma once

#include "platform/services/Lifetime.h"
#include "platform/services/MainQueue.h"
#include "telephonyd/modem/DiagnosticPort.h"

#include <chrono>
#include <cstdint>
#include <functional>
#include <string>
#include <vector>

namespace orvane
{

// Finds out which technology a modem serves: has one or two frequent log codes of each technology
// switched on for kTurn in turn, until one of them gives an item.
class TechnologyProbe
{
public:
    static constexpr std::chrono::seconds kTurn{1};

    // Asks for these codes to be switched on, in addition to all others; none: no more. settled()
    // is to be called once they are.
    using Watch = std::function<void(const LogCodes& codes)>;

    // The queue is not owned and must outlive the probe.
    TechnologyProbe(MainQueue& queue, Watch watch);

    // Begins with the technology of that constant, if it is one; then the others, round after
    // round. Does nothing while it is running.
    void start(const std::string& firstTechnology);
    void stop();
    [[nodiscard]] bool isRunning() const { return _isRunning; }
    // How many times each technology has had its turn since start().
    [[nodiscard]] unsigned rounds() const { return _rounds; }

    // The codes that are to be watched are switched on, or the modem has none of them.
    void settled();
    // Whether an item of that code shows the technology whose turn it is.
    [[nodiscard]] bool isShownBy(std::uint16_t code) const;
    // The constant of the technology whose turn it is; empty when the probe is not running.
    [[nodiscard]] std::string technology() const;

private:
    struct Candidate {
        const char* technology;
        LogCodes codes;
    };

    void beginTurn();
    void endTurn();

    MainQueue& _queue;
    Watch _watch;
    std::vector<Candidate> _candidates; // in the order of their turns
    std::size_t _current = 0;
    bool _isRunning = false;
    bool _isWatching = false; // the current codes are on
    unsigned _rounds = 0;
    std::uint64_t _turn = 0; // tells the end of a turn from that of those before
    const Lifetime _lifetime;
};

} // namespace orvane

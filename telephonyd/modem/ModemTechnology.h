#pragma once

#include "platform/services/Lifetime.h"
#include "platform/services/MainQueue.h"
#include "telephonyd/modem/TechnologyProbe.h"

#include <chrono>
#include <cstdint>
#include <functional>
#include <optional>
#include <string>

namespace orvane
{

// Which technology a modem serves: what was named on the command line, or else what a service tells
// of the modem, or else what probing finds.
//
// Probing begins when a client asks and the answer is not known. What was found stays known until
// the modem goes away, and is the answer until it is back. A modem that has come back is probed
// again when a client asks, and when it has given those who listen no item for kSilence; a silent
// modem that never went away is not.
class ModemTechnology
{
public:
    // A client that got no answer asks again within this time; probing ends when none does.
    static constexpr std::chrono::seconds kPatience{15};
    static constexpr std::chrono::seconds kSilence{60};

    struct Events {
        TechnologyProbe::Watch watch;
        // It is another one than those who listen know. Must not destroy the object.
        std::function<void()> changed;
    };

    // `named` is the technology's constant, if one was named. The queue is not owned and must
    // outlive the object.
    ModemTechnology(MainQueue& queue, std::optional<std::string> named, Events events);

    // The constant, or an empty text while it is not known: it is then found out.
    std::string ask();

    // What a service knows of the modem now: the constant, or nullopt where it does not know.
    void tell(const std::optional<std::string>& technology);

    // What the modem does.
    void modemCame();
    void modemWent();
    void codesSettled() { _probe.settled(); }
    // An item came; `isListenedTo` says whether one of those who listen asked for its code.
    void itemCame(std::uint16_t code, bool isListenedTo);
    // Whether anybody listens to items.
    void setIsListenedTo(bool isListenedTo);

private:
    void found(const std::string& technology);
    void probeWhileClientsWait();
    void watchForSilence();
    void silenceIsOver();

    MainQueue& _queue;
    const bool _isNamed;
    Events _events;
    TechnologyProbe _probe;
    std::string _known; // the last that was known; empty for none
    bool _isTold = false;
    bool _isConfirmed = false;
    bool _isPresent = false;
    bool _isListenedTo = false;
    std::uint64_t _questions = 0; // tells a client's patience from that of those before
    std::uint64_t _silences = 0;  // the same for a silence
    const Lifetime _lifetime;
};

} // namespace orvane

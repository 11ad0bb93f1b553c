#pragma once

#include "platform/base/Bytes.h"
#include "platform/services/ByteDevice.h"
#include "platform/services/Lifetime.h"
#include "platform/services/MainQueue.h"
#include "telephonyd/modem/DiagnosticFrame.h"
#include "telephonyd/modem/DiagnosticRequest.h"

#include <chrono>
#include <cstdint>
#include <functional>
#include <map>
#include <memory>
#include <optional>
#include <set>
#include <string>
#include <vector>

namespace orvane
{

using LogCodes = std::set<std::uint16_t>;

// A modem's diagnostic port from its opening to its end: asks the modem who it is, switches all log
// codes off, asks for the ranges, and then keeps exactly the wanted codes switched on. One request
// is under way at a time; one without an answer is repeated after kAnswerTime, kTries times in all.
class DiagnosticPort
{
public:
    static constexpr std::chrono::seconds kAnswerTime{1};
    static constexpr int kTries = 3;

    struct Events {
        // A log item as it is in a log file, valid during the call. None comes before the modem
        // has been asked to switch off what an earlier program had switched on. Items may be of
        // codes that are not wanted, or not any more. Must not destroy the port.
        std::function<void(ByteView item)> item;
        // The modem has answered and takes log codes. Must not destroy the port.
        std::function<void()> ready;
        // All wanted codes that the modem has are switched on. Must not destroy the port.
        std::function<void()> settled;
        // Wanted codes that this modem does not have; the same ones may come again. Must not
        // destroy the port.
        std::function<void(const std::vector<std::uint16_t>& codes)> missing;
        // A request that the modem refused, as a part of a sentence. Must not destroy the port.
        std::function<void(const std::string& what)> refused;
        // The device is gone or the modem does not answer, with the reason as a part of a sentence.
        // The last event; may destroy the port.
        std::function<void(const std::string& reason)> failed;
    };

    struct Counts {
        std::uint64_t items = 0;         // whole ones
        std::uint64_t damagedItems = 0;  // whose lengths contradict each other
        std::uint64_t damagedFrames = 0; // everything else that could not be a frame
    };

    // The queue is not owned and must outlive the port.
    DiagnosticPort(MainQueue& queue, std::unique_ptr<ByteDevice> device, Events events);

    // Replaces the wanted codes; at first there are none. May be called at any time.
    void setWantedCodes(LogCodes codes);
    // Switches all codes off, if any may be on, and calls `done` then, or when the modem does not
    // answer or is gone. setWantedCodes() does nothing from now on. `done` never comes from within
    // this call, and not at all if the port is destroyed before.
    void finish(std::function<void()> done);

    [[nodiscard]] Counts counts() const;

private:
    enum class Phase { Greeting, SwitchingOff, AskingRanges, Serving, Ended };
    using Answered = std::function<void(const DiagnosticAnswer& answer)>;
    struct Pending {
        DiagnosticRequest request;
        Answered answered;
        int tries = 0;
        bool wasPutOff = false;
    };
    using Groups = std::map<std::uint32_t, std::set<std::uint32_t>>; // places by group

    void received(ByteView bytes);
    void take(ByteView payload);
    void fail(const std::string& reason);

    // Asks for what is to be done next, unless an answer is outstanding.
    void proceed();
    void proceedServing();
    void greet();
    void switchOff(Phase next);
    void askRanges();
    bool setNextMask();
    void setMask(std::uint32_t group, const std::set<std::uint32_t>& places);
    [[nodiscard]] Groups groupsOfWantedCodes();
    [[nodiscard]] std::uint32_t codesInGroup(std::uint32_t group,
                                             const std::set<std::uint32_t>& places) const;
    void ask(DiagnosticRequest request, Answered answered);
    void send();
    void timeIsOver();
    void answer(const DiagnosticAnswer& answer);
    void finished();

    MainQueue& _queue;
    std::unique_ptr<ByteDevice> _device;
    Events _events;
    DiagnosticFrameReader _reader;
    Phase _phase = Phase::Greeting;
    std::optional<Pending> _pending;
    std::uint64_t _sent = 0; // tells the time-out of a request from those before
    std::optional<LogRanges> _ranges;
    LogCodes _wanted;
    Groups _asked;                                          // what the modem was last asked for
    std::map<std::uint32_t, std::uint32_t> _acceptedCounts; // of codes, by group
    bool _mayBeOn = false; // a mask was sent since all was switched off
    bool _isSettled = false;
    std::function<void()> _finish;
    Counts _totals;
    Bytes _frame; // kept for its memory
    const Lifetime _lifetime;
};

} // namespace orvane

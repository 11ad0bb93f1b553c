#pragma once

#include "platform/base/Bytes.h"
#include "platform/services/MainQueue.h"
#include "telephonyd/phone/LogSource.h"
#include "telephonyd/phone/Scenario.h"

namespace orvane
{

// Lets a scenario run in real time and sends what the start command asked for, with headers and
// timestamps (of the process's clock). One log message in kWrapEvery comes wrapped, as from phones
// that pass on what another processor logs.
class PhoneSource final : public LogSource
{
public:
    static constexpr std::chrono::milliseconds kStep{40};
    static constexpr unsigned kWrapEvery = 50;

    // The queue is not owned.
    PhoneSource(MainQueue& queue, std::unique_ptr<Scenario> scenario);

    [[nodiscard]] std::string technology() const override { return _scenario->technology(); }
    void start(const LogSelection& selection, Send send) override;

private:
    void step();
    [[nodiscard]] bool isWanted(const PhoneMessage& message) const;
    Bytes logMessage(const PhoneMessage& message);

    MainQueue& _queue;
    std::unique_ptr<Scenario> _scenario;
    LogSelection _selection;
    Send _send;
    std::chrono::milliseconds _now{0}; // of the scenario
    unsigned _sent = 0;                // log messages
    std::unique_ptr<Timer> _timer;
};

// Seconds since 1970 as log items carry time: the upper 48 bits count 1.25 ms since 1980-01-06
// 00:00:00 UTC, the lower 16 fractions of those.
std::uint64_t logTimestamp(double secondsSince1970);

} // namespace orvane

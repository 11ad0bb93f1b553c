#pragma once

#include "telephonyd/phone/Drive.h"
#include "telephonyd/phone/Scenario.h"

namespace orvane
{

// What all scenarios share: a phone that is driven through a town and advances in steps of
// Drive::kStep. A scenario adds the messages that are due.
class DrivenScenario : public Scenario
{
public:
    [[nodiscard]] std::string technology() const final { return _technology; }
    std::vector<PhoneMessage> step(std::chrono::milliseconds now) final;

protected:
    // `technology` must outlive it.
    DrivenScenario(const char* technology, Drive drive)
        : _drive(std::move(drive)), _technology(technology)
    {
    }

    // Adds one message of each kind. The time is 0.
    virtual void first() = 0;
    // Adds the messages that are due at now(), one step after the last call.
    virtual void next() = 0;

    void add(PhoneMessage message) { _messages.push_back(std::move(message)); }
    std::vector<PhoneMessage>& messages() { return _messages; }
    [[nodiscard]] std::chrono::milliseconds now() const { return _now; }
    [[nodiscard]] bool isDue(std::chrono::milliseconds every) const
    {
        return _now % every == std::chrono::milliseconds(0);
    }

    Drive _drive;

private:
    const char* _technology;
    std::chrono::milliseconds _now{-1};  // before the first step
    std::vector<PhoneMessage> _messages; // of the step
};

} // namespace orvane

#pragma once

#include "telephonyd/phone/LogSource.h"

#include <memory>
#include <optional>
#include <vector>

namespace orvane
{

// A test's handle on the source of one channel: what it was asked, and how to make it send.
struct HandSourceState {
    std::optional<LogSelection> selection;
    LogSource::Send send;
    int resumes = 0;
    bool isAlive = true;
};

// A source that sends what a test tells it to.
class HandSource final : public LogSource
{
public:
    explicit HandSource(std::shared_ptr<HandSourceState> state) : _state(std::move(state)) {}
    ~HandSource() override
    {
        _state->isAlive = false;
        _state->send = nullptr;
    }
    [[nodiscard]] std::string technology() const override { return "technology of a test"; }
    void start(const LogSelection& selection, Send send) override
    {
        _state->selection = selection;
        _state->send = std::move(send);
    }
    void resume() override { ++_state->resumes; }

private:
    std::shared_ptr<HandSourceState> _state;
};

} // namespace orvane

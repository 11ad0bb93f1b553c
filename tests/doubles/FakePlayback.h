#pragma once

#include "platform/base/Calendar.h"
#include "screens/toolkit/Playback.h"

#include <string>
#include <vector>

namespace orvane
{

// A recording that only records the calls of its controls.
class FakePlayback final : public Playback
{
public:
    [[nodiscard]] double progress() const override { return read; }
    void stopReading() override { calls.emplace_back("stopReading"); }
    [[nodiscard]] double position() const override { return at; }
    [[nodiscard]] double duration() const override { return length; }
    [[nodiscard]] std::string positionText() const override
    {
        constexpr double kStart = 1795255200; // 2026-11-21 10:00:00
        return absoluteDateText(kStart + at).substr(0, 19) + " UTC";
    }
    [[nodiscard]] std::string remark() const override { return note; }
    [[nodiscard]] bool isPlaying() const override { return plays; }
    [[nodiscard]] double speed() const override { return rate; }
    void play() override { calls.emplace_back("play"); }
    void pause() override { calls.emplace_back("pause"); }
    void faster() override { calls.emplace_back("faster"); }
    void slower() override { calls.emplace_back("slower"); }
    void step() override { calls.emplace_back("step"); }
    void stepBack() override { calls.emplace_back("stepBack"); }
    void jumpTo(double position) override
    {
        calls.push_back("jumpTo " + std::to_string(static_cast<int>(position)));
    }
    void jumpToEnd() override { calls.emplace_back("jumpToEnd"); }
    void jumpToNextServingCell() override { calls.emplace_back("jumpToNextServingCell"); }
    bool jumpToText(const std::string& text) override
    {
        calls.push_back("jumpToText " + text);
        return takesText;
    }

    double read = 1;
    double at = 0;
    double length = 100;
    double rate = 1;
    bool plays = false;
    bool takesText = true;
    std::string note;
    std::vector<std::string> calls;
};

} // namespace orvane

#pragma once

#include <string>

namespace orvane
{

// The player of a recording, for the controls of a front end. Times are seconds since the first
// item of the recording. After every change the implementation calls Screen::setNeedsUpdate(), and
// the front end reads everything again. Main thread only.
class Playback
{
public:
    virtual ~Playback() = default;

    // The part of the file that has been read, 0 to 1. At 1 everything below works. Before that the
    // recording cannot be played, and stopReading() skips the rest of the file: the part that was
    // read becomes the recording.
    [[nodiscard]] virtual double progress() const = 0;
    virtual void stopReading() = 0;

    [[nodiscard]] virtual double position() const = 0;
    [[nodiscard]] virtual double duration() const = 0;
    // The time of the recording, for people: "2026-11-21 10:00:00 UTC".
    [[nodiscard]] virtual std::string positionText() const = 0;
    // A remark about the file for the user, such as how many bytes could not be placed, and where.
    // Empty for none.
    [[nodiscard]] virtual std::string remark() const = 0;

    [[nodiscard]] virtual bool isPlaying() const = 0;
    // Seconds of the recording that are played each second, 1 to 1000.
    [[nodiscard]] virtual double speed() const = 0;

    // At the end of the recording, starts from the beginning.
    virtual void play() = 0;
    virtual void pause() = 0;
    // The next higher and lower speed of 1, 2, 5, 10, 20, 50, ... 1000.
    virtual void faster() = 0;
    virtual void slower() = 0;
    // One refresh period forward or back. Pauses.
    virtual void step() = 0;
    virtual void stepBack() = 0;
    // A position beyond an end counts as that end.
    virtual void jumpTo(double position) = 0;
    virtual void jumpToEnd() = 0;
    // To the next change of the serving cell, or to the end if there is none.
    virtual void jumpToNextServingCell() = 0;
    // Jumps to a time that the user typed: "10:04:30" of the recording's clock (UTC), or "+90"
    // seconds from the start. False if the text is neither.
    virtual bool jumpToText(const std::string& text) = 0;
};

} // namespace orvane

#pragma once

#include <string>

namespace orvane
{

// A recording that is played, as a front end's controls see and drive it. Times are seconds of the
// recording since its first item. Whoever implements it calls Screen::setNeedsUpdate() after any
// change, and a front end reads everything anew then. Main thread only.
class Playback
{
public:
    virtual ~Playback() = default;

    // How much of the file has been read, 0 to 1; at 1 everything below works. Until then the
    // recording cannot be played, and stopReading() gives up on the rest of the file: what was read
    // by then is the recording.
    [[nodiscard]] virtual double progress() const = 0;
    virtual void stopReading() = 0;

    [[nodiscard]] virtual double position() const = 0;
    [[nodiscard]] virtual double duration() const = 0;
    // The time of the recording, for people: "2026-11-21 10:00:00 UTC".
    [[nodiscard]] virtual std::string positionText() const = 0;
    // What a person should know about the file: bytes that could not be placed, and where. Empty
    // where all is well.
    [[nodiscard]] virtual std::string remark() const = 0;

    [[nodiscard]] virtual bool isPlaying() const = 0;
    // Seconds of the recording a second, 1 to 1000.
    [[nodiscard]] virtual double speed() const = 0;

    // At the end, plays from the start again.
    virtual void play() = 0;
    virtual void pause() = 0;
    // The next speed of 1, 2, 5, 10, 20, 50, ... 1000, and the one before.
    virtual void faster() = 0;
    virtual void slower() = 0;
    // One refresh period on or back; pauses.
    virtual void step() = 0;
    virtual void stepBack() = 0;
    // Beyond the ends counts as the end.
    virtual void jumpTo(double position) = 0;
    virtual void jumpToEnd() = 0;
    // To the next moment at which the serving cell is another one; to the end if there is none.
    virtual void jumpToNextServingCell() = 0;
    // A time as a person types it, to jump to: "10:04:30" of the recording's clock (UTC), or
    // "+90" seconds from the start. False where the text is neither.
    virtual bool jumpToText(const std::string& text) = 0;
};

} // namespace orvane

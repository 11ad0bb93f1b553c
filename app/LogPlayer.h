#pragma once

#include "platform/services/Lifetime.h"
#include "platform/services/MainQueue.h"
#include "recordings/RecordingSettings.h"
#include "recordings/SeekableLog.h"
#include "screens/toolkit/Playback.h"
#include "ui/tree/OrvaneModelNode.h"

#include <chrono>
#include <functional>
#include <memory>
#include <optional>
#include <string>

namespace orvane
{

// Plays a diagnostic log as if it were a live view that refreshes every refresh period. First the
// log is read, a slice in each turn of the main queue; then the position is the end of its first
// period. While it plays, the position moves by whole refresh periods of the recording, at a higher
// speed by several at once.
class LogPlayer final : public Playback
{
public:
    // A steady clock, from any start.
    using Now = std::function<std::chrono::nanoseconds()>;
    // Something that is asked for here has changed. Never called by the constructor.
    using OnChange = std::function<void()>;

    // The queue must outlive the player.
    LogPlayer(MainQueue& queue, Now now, std::shared_ptr<ByteSource> log,
              RecordingSettings settings, OnChange onChange);

    // One line that says why the log cannot be played, and what to do. Reading has ended then.
    [[nodiscard]] const std::optional<std::string>& failure() const { return _log.failure(); }
    [[nodiscard]] bool isReady() const { return _log.isRead(); }

    // The display at the position, as a live view's: null before the log has been read.
    NodePointer topLevelNodes();
    // The node at that path, or null.
    NodePointer nodeAtPath(const std::string& path);

    [[nodiscard]] double progress() const override { return _log.progress(); }
    void stopReading() override;
    [[nodiscard]] double position() const override;
    [[nodiscard]] double duration() const override;
    [[nodiscard]] std::string positionText() const override;
    [[nodiscard]] std::string remark() const override;
    [[nodiscard]] bool isPlaying() const override { return _timer != nullptr; }
    [[nodiscard]] double speed() const override;
    void play() override;
    void pause() override;
    void faster() override;
    void slower() override;
    void step() override;
    void stepBack() override;
    void jumpTo(double position) override;
    void jumpToEnd() override;
    void jumpToNextServingCell() override;
    bool jumpToText(const std::string& text) override;

private:
    void readLater();
    void read();
    void tellOrBegin();
    void startTimer();
    void goOn();
    void moveTo(LogTime position);
    void moved();
    void tell() const;

    MainQueue& _queue;
    Now _now;
    RecordingSettings _settings;
    OnChange _onChange;
    SeekableLog _log;
    NodePointer _nodes;
    PathDictionary _nodesByPath;
    std::unique_ptr<Timer> _timer; // while playing
    std::size_t _speed = 0;        // index
    std::chrono::nanoseconds _playedTo{0};
    Lifetime _lifetime;
};

} // namespace orvane

#pragma once

#include "dlf/ByteSource.h"
#include "dlf/DlfReader.h"
#include "platform/base/Bytes.h"
#include "platform/services/Lifetime.h"
#include "platform/services/MainQueue.h"
#include "telephonyd/phone/LogSource.h"

#include <chrono>
#include <functional>
#include <memory>
#include <optional>

namespace orvane
{

struct ReplaySettings {
    std::string technology; // the constant
    // Seconds of the recording for each second; nullopt = as fast as the client takes it.
    std::optional<double> speed = 1.0;
    bool loops = false;
};

// Sends a recording (.dlf) again, from its start for each channel: the items that were asked for,
// in file order, at the pace of their timestamps. An item with an earlier time than the one before
// it follows at once. A jump ahead of more than kLongestGap counts as a clock that was set, and
// takes no time. Items without a timestamp are not sent.
//
// Waits while the client is behind, and then makes up the time. After the end it is silent; a loop
// starts over kLoopPause of the recording later, or at once without a speed, as long as the
// recording holds anything that was asked for.
class ReplaySource final : public LogSource
{
public:
    static constexpr std::chrono::seconds kLongestGap{3600};
    static constexpr std::chrono::seconds kLoopPause{1};

    // A steady clock, from any start.
    using Now = std::function<std::chrono::nanoseconds()>;

    // The queue is not owned. The file must not be read by anybody else: an item is kept in the
    // source's memory until it is sent.
    ReplaySource(MainQueue& queue, Now now, std::shared_ptr<ByteSource> file,
                 ReplaySettings settings);

    [[nodiscard]] std::string technology() const override { return _settings.technology; }
    void start(const LogSelection& selection, Send send) override;
    void resume() override;

private:
    void playAfter(std::chrono::nanoseconds delay);
    void play();
    bool startOver();
    void goOnTo(std::uint64_t timestamp);
    bool sendItem();
    [[nodiscard]] bool isWanted(const DlfItem& item) const;
    [[nodiscard]] std::chrono::nanoseconds atSpeed(double seconds) const;

    MainQueue& _queue;
    Now _now;
    std::shared_ptr<ByteSource> _file;
    const ReplaySettings _settings;
    LogSelection _selection;
    Send _send;
    DlfReader _reader;
    std::optional<DlfItem> _item;          // the next to be sent
    std::optional<std::uint64_t> _reached; // the latest timestamp of this round
    std::chrono::nanoseconds _due{0};      // when that is
    bool _hasSentInRound = false;
    bool _waitsForClient = false;
    Bytes _message; // kept for its memory
    Lifetime _lifetime;
};

} // namespace orvane

#pragma once

#include "platform/base/PropertyValue.h"
#include "recordings/Checkpoints.h"
#include "recordings/LogPlay.h"

#include <memory>
#include <optional>
#include <string>

namespace orvane
{

// A log that can be shown as it was at any of its times. It is read once, in slices, to know its
// length and to take checkpoints; from then on every move takes little time, and memory does not
// depend on the log's length.
class LogTimeline
{
public:
    // `technology` is a technology constant; throws std::invalid_argument for any other text.
    LogTimeline(std::shared_ptr<ByteSource> log, const std::string& technology);

    // Reads on for some milliseconds; false once the log has been read. What decoders find wrong
    // with it is told in the process's log now, and never again.
    bool readSlice();
    [[nodiscard]] std::uint64_t bytesRead() const { return _play.reader().position(); }
    // How much has been read, 0 to 1.
    [[nodiscard]] double progress() const;
    // What was read by now is the log.
    void stopReading();
    [[nodiscard]] bool isRead() const { return _end.has_value(); }

    // Once the log has been read, which leaves it at its end:

    // The time of the last item.
    [[nodiscard]] LogTime duration() const;
    [[nodiscard]] LogTime position() const { return _position; }
    // Goes where all items of earlier times have been taken, at 0 those of the first moment, at
    // duration() the last ones as well. Beyond the ends counts as the end.
    void moveTo(LogTime position);
    // Goes to where the serving cell next becomes another one, or to the end.
    void moveToNextServingCell();

    // What is shown at the position; absent where there is nothing yet.
    [[nodiscard]] const PropertyValue& display() const { return _play.display(); }
    [[nodiscard]] const LogClock& clock() const;
    // What a person should know: bytes that could not be placed, and where.
    [[nodiscard]] std::string remark() const;

private:
    [[nodiscard]] bool canTakeNext() const;
    void skipTo(const LogPlay::Checkpoint* checkpoint);

    std::uint64_t _bytesAtFirst;
    LogPlay _play;
    Checkpoints _checkpoints;
    std::optional<LogPlay::Checkpoint> _end;
    LogTime _position{0};
};

} // namespace orvane

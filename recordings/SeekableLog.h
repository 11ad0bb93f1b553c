#pragma once

#include "platform/base/PropertyValue.h"
#include "recordings/Checkpoints.h"
#include "recordings/LogDecoder.h"
#include "recordings/LogSurvey.h"

#include <memory>
#include <optional>
#include <string>

namespace orvane
{

// A log that can be shown as it was at any of its times. It is read once, in slices: first, unless
// the technology is given, to find that, then to decode it and to take checkpoints. From then on
// every move takes little time. Memory does not depend on the log's length.
class SeekableLog
{
public:
    // `name` is what the user calls the file; `technology` is a technology constant. Throws
    // std::invalid_argument for any other text.
    SeekableLog(std::shared_ptr<ByteSource> log, std::string name,
                const std::optional<std::string>& technology);

    // Reads for some milliseconds. False once the log has been read or cannot be. What the decoders
    // find wrong with the log goes to the process's log now, and never again.
    bool readSlice();
    // The part that has been read so far becomes the whole log. If only the technology has been
    // sought so far, decoding goes up to the same place.
    void stopReading();
    // How much of the reading is done, 0 to 1.
    [[nodiscard]] double progress() const;
    // One line that says why the log cannot be shown, and what to do.
    [[nodiscard]] const std::optional<std::string>& failure() const { return _failure; }
    [[nodiscard]] bool isRead() const { return _end.has_value(); }

    // The operations below do nothing, and yield nothing, until the log has been read. It is at its
    // end then.

    // The time of the last item.
    [[nodiscard]] LogTime duration() const;
    [[nodiscard]] LogTime position() const { return _position; }
    // Goes to where all items of earlier times have been decoded; at 0 also those of the first
    // moment, at duration() also the last ones. Positions outside the log are moved to its ends.
    void moveTo(LogTime position);
    // Goes to the next change of the serving cell, or to the end.
    void moveToNextServingCell();

    // What is shown at the position; absent if there is nothing yet.
    [[nodiscard]] const PropertyValue& display() const;
    [[nodiscard]] const LogClock& clock() const;
    // What the user should know: bytes that could not be placed, and where.
    [[nodiscard]] std::string remark() const;

private:
    void endSurvey();
    [[nodiscard]] bool canTakeNext() const;
    void skipTo(const LogDecoder::Checkpoint* checkpoint);

    std::shared_ptr<ByteSource> _log;
    std::string _name;
    std::uint64_t _bytesAtFirst;
    std::optional<std::string> _failure;
    LogSurvey _survey;
    std::uint64_t _bytesToRead = UINT64_MAX; // by the decoder
    std::unique_ptr<LogDecoder> _decoder;    // null until the technology is known
    Checkpoints _checkpoints;
    std::optional<LogDecoder::Checkpoint> _end;
    LogTime _position{0};
};

} // namespace orvane

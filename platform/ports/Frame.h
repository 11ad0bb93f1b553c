#pragma once

#include "platform/base/Bytes.h"

#include <cstdint>
#include <optional>
#include <string>

namespace orvane
{

// One message on a connection: a 16-byte header (length of the data, message id, serial, flags; all
// 32-bit little-endian), then the data. Flag bit 0 says that a reply is wanted, bit 1 that this is
// a reply. The other bits are written as 0 and ignored when read, so that a later version may use
// them for what older readers do not need.
struct Frame {
    std::int32_t messageId = 0;
    std::uint32_t serial = 0; // chosen by the sender; a reply carries its request's
    bool wantsReply = false;
    bool isReply = false;
    Bytes data;
};

constexpr std::size_t kFrameHeaderBytes = 16;
constexpr std::size_t kFrameDataLimit = 16U * 1024 * 1024;

// Appends the frame's bytes. The data must be within kFrameDataLimit (std::length_error otherwise).
void appendFrame(Bytes& to, std::int32_t messageId, std::uint32_t serial, bool wantsReply,
                 bool isReply, ByteView data);

// Cuts a byte stream into frames, however the stream is split. Holds only bytes that it was given:
// an announced length takes no memory in advance. Each byte is moved a bounded number of
// times, also where one append() brings many small frames.
class FrameReader
{
public:
    // Adds bytes of the stream. Does nothing once the reader has failed.
    void append(ByteView bytes);
    // Returns the next whole frame, or nullopt until more bytes come. The view in `data` is valid
    // until the next append() or next().
    struct View {
        std::int32_t messageId;
        std::uint32_t serial;
        bool wantsReply;
        bool isReply;
        ByteView data;
    };
    std::optional<View> next();
    // Once next() has returned nullopt: the number of the frame of which a part has come, the
    // stream's first frame being 0; nullopt where none is unfinished.
    [[nodiscard]] std::optional<std::uint64_t> unfinishedFrame() const
    {
        return _start < _buffer.size() ? std::optional(_framesRead) : std::nullopt;
    }
    // Whether a frame announced more than kFrameDataLimit bytes: the connection must end.
    [[nodiscard]] bool hasFailed() const { return _failed; }
    // The announced length that made it fail.
    [[nodiscard]] std::uint32_t failedLength() const { return _failedLength; }
    // The error line for a reader that has failed.
    [[nodiscard]] std::string failureText() const;

private:
    void discardRead();

    Bytes _buffer;
    std::size_t _start = 0; // of the next frame in _buffer
    std::uint64_t _framesRead = 0;
    bool _failed = false;
    std::uint32_t _failedLength = 0;
};

} // namespace orvane

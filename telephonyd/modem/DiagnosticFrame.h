#pragma once

#include "platform/base/Bytes.h"

#include <cstdint>
#include <optional>

namespace orvane
{

// Frames of a modem's diagnostic port: a payload and its CRC-16/X.25 (low byte first), in which the
// bytes 0x7E and 0x7D are escaped (0x7D, then the byte XOR 0x20), then 0x7E.

// CRC-16/X.25: polynomial 0x1021 reflected, start 0xFFFF, final XOR 0xFFFF.
std::uint16_t crc16X25(ByteView bytes);

// Appends the payload as one frame to `out`.
void appendDiagnosticFrame(Bytes& out, ByteView payload);

// Takes a stream of bytes in any pieces and returns the payloads of its frames. Anything else up to
// the next 0x7E (text, a damaged frame, more than kLongestFrame bytes) is dropped and counted. Two
// 0x7E in a row enclose nothing.
class DiagnosticFrameReader
{
public:
    // The most bytes that a frame has on the wire, without its 0x7E.
    static constexpr std::size_t kLongestFrame = 64U * 1024;

    // Copies the bytes. Call next() until it returns nullopt before appending more: otherwise what
    // has been appended stays in memory.
    void append(ByteView bytes);
    // The next payload, of one byte or more, valid until the next call of next() or append();
    // nullopt when the bytes so far hold no further frame.
    [[nodiscard]] std::optional<ByteView> next();

    [[nodiscard]] std::uint64_t droppedFrames() const { return _dropped; }

private:
    void take(std::uint8_t byte);
    std::optional<ByteView> end();

    Bytes _input;
    std::size_t _position = 0; // in _input
    Bytes _frame;              // unescaped, without its end
    std::size_t _length = 0;   // of the frame on the wire so far
    bool _isEscaped = false;   // the next byte is
    bool _isComplete = false;  // _frame has been returned
    std::uint64_t _dropped = 0;
};

} // namespace orvane

#include "platform/ports/Frame.h"

#include <stdexcept>

namespace orvane
{

namespace
{

constexpr std::uint32_t kWantsReply = 1;
constexpr std::uint32_t kIsReply = 2;
constexpr std::size_t kLengthBytes = 4;
// A buffer larger than this is freed once its frames are read.
constexpr std::size_t kKeptCapacity = 256U * 1024;

void append32(Bytes& to, std::uint32_t value)
{
    for (unsigned shift = 0; shift < 32; shift += 8)
        to.push_back(static_cast<std::uint8_t>(value >> shift & 0xFF));
}

std::uint32_t read32(ByteView bytes, std::size_t offset)
{
    std::uint32_t value = 0;
    for (std::size_t i = 4; i-- > 0;)
        value = value << 8 | bytes[offset + i];
    return value;
}

} // namespace

void appendFrame(Bytes& to, std::int32_t messageId, std::uint32_t serial, bool wantsReply,
                 bool isReply, ByteView data)
{
    if (data.size() > kFrameDataLimit)
        throw std::length_error("message longer than the frame limit");
    append32(to, static_cast<std::uint32_t>(data.size()));
    append32(to, static_cast<std::uint32_t>(messageId));
    append32(to, serial);
    append32(to, (wantsReply ? kWantsReply : 0) | (isReply ? kIsReply : 0));
    to.insert(to.end(), data.begin(), data.end());
}

void FrameReader::append(ByteView bytes)
{
    if (_failed)
        return;
    discardRead();
    _buffer.insert(_buffer.end(), bytes.begin(), bytes.end());
}

// Moves the rest only once half of the buffer is read: the bytes moved stay in proportion to those
// read.
void FrameReader::discardRead()
{
    if (_start == 0 || _start < _buffer.size() - _start)
        return;
    if (_start < _buffer.size())
        _buffer.erase(_buffer.begin(), _buffer.begin() + static_cast<std::ptrdiff_t>(_start));
    else if (_buffer.capacity() > kKeptCapacity)
        _buffer = Bytes();
    else
        _buffer.clear();
    _start = 0;
}

std::optional<FrameReader::View> FrameReader::next()
{
    const ByteView rest = ByteView(_buffer).subspan(_start);
    if (rest.size() < kLengthBytes)
        return std::nullopt;
    const std::uint32_t length = read32(rest, 0);
    if (length > kFrameDataLimit) {
        _failed = true;
        _failedLength = length;
        _buffer = Bytes();
        _start = 0;
        return std::nullopt;
    }
    if (rest.size() < kFrameHeaderBytes || rest.size() - kFrameHeaderBytes < length)
        return std::nullopt;
    _start += kFrameHeaderBytes + length;
    ++_framesRead;
    const std::uint32_t flags = read32(rest, 12);
    return View{static_cast<std::int32_t>(read32(rest, 4)), read32(rest, 8),
                (flags & kWantsReply) != 0, (flags & kIsReply) != 0,
                rest.subspan(kFrameHeaderBytes, length)};
}

std::string FrameReader::failureText() const
{
    return "Message of " + std::to_string(_failedLength) + " bytes is larger than the limit of " +
           std::to_string(kFrameDataLimit) + "; closing the connection";
}

} // namespace orvane

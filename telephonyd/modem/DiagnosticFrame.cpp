#include "telephonyd/modem/DiagnosticFrame.h"

#include "platform/base/Bytes.h"

#include <array>
#include <utility>

namespace orvane
{

namespace
{

constexpr std::uint8_t kEnd = 0x7E;
constexpr std::uint8_t kEscape = 0x7D;
constexpr std::uint8_t kFlip = 0x20;
constexpr std::size_t kCrcBytes = 2;

constexpr std::array<std::uint16_t, 256> makeCrcTable()
{
    constexpr unsigned kReflectedPolynomial = 0x8408;
    std::array<std::uint16_t, 256> table{};
    for (unsigned byte = 0; byte < table.size(); ++byte) {
        unsigned value = byte;
        for (int bit = 0; bit < 8; ++bit)
            value = (value & 1U) != 0 ? value >> 1 ^ kReflectedPolynomial : value >> 1;
        table[byte] = static_cast<std::uint16_t>(value);
    }
    return table;
}

constexpr std::array<std::uint16_t, 256> kCrcTable = makeCrcTable();

void appendEscaped(Bytes& out, std::uint8_t byte)
{
    if (byte == kEnd || byte == kEscape) {
        out.push_back(kEscape);
        byte ^= kFlip;
    }
    out.push_back(byte);
}

} // namespace

std::uint16_t crc16X25(ByteView bytes)
{
    unsigned value = 0xFFFF;
    for (const std::uint8_t byte : bytes)
        value = value >> 8 ^ kCrcTable[(value ^ byte) & 0xFFU];
    return static_cast<std::uint16_t>(value ^ 0xFFFFU);
}

void appendDiagnosticFrame(Bytes& out, ByteView payload)
{
    for (const std::uint8_t byte : payload)
        appendEscaped(out, byte);
    const std::uint16_t crc = crc16X25(payload);
    appendEscaped(out, static_cast<std::uint8_t>(crc & 0xFF));
    appendEscaped(out, static_cast<std::uint8_t>(crc >> 8));
    out.push_back(kEnd);
}

void DiagnosticFrameReader::append(ByteView bytes)
{
    _input.insert(_input.end(), bytes.begin(), bytes.end());
}

std::optional<ByteView> DiagnosticFrameReader::next()
{
    if (_isComplete) {
        _isComplete = false;
        _frame.clear();
    }
    while (_position < _input.size()) {
        const std::uint8_t byte = _input[_position++];
        if (byte != kEnd)
            take(byte);
        else if (const auto payload = end())
            return payload;
    }
    _input.clear();
    _position = 0;
    return std::nullopt;
}

void DiagnosticFrameReader::take(std::uint8_t byte)
{
    if (_length > kLongestFrame)
        return; // too long already: what follows belongs to it up to the next end
    ++_length;
    if (byte == kEscape && !_isEscaped) {
        _isEscaped = true;
        return;
    }
    _frame.push_back(_isEscaped ? static_cast<std::uint8_t>(byte ^ kFlip) : byte);
    _isEscaped = false;
}

std::optional<ByteView> DiagnosticFrameReader::end()
{
    const std::size_t length = std::exchange(_length, 0);
    const bool isCutShort = std::exchange(_isEscaped, false);
    if (length == 0)
        return std::nullopt;
    if (length <= kLongestFrame && !isCutShort && _frame.size() > kCrcBytes) {
        const ByteView payload = ByteView(_frame).first(_frame.size() - kCrcBytes);
        const ByteView crc = ByteView(_frame).last(kCrcBytes);
        if (crc16X25(payload) == (crc[0] | crc[1] << 8)) {
            _isComplete = true;
            return payload;
        }
    }
    ++_dropped;
    _frame.clear();
    return std::nullopt;
}

} // namespace orvane

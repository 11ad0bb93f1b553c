#pragma once

#include "platform/base/Bytes.h"
#include "platform/base/PacketView.h"

#include <cstdint>

namespace orvane
{

// Diagnostic log messages, all fields little-endian: a type byte, 2 bytes length counted from
// offset 1, 2 bytes log code, 8 bytes timestamp, and the payload from offset 13 on. A first byte of
// 0x81 is a wrapper of 2 bytes before that.

constexpr std::size_t kLogHeaderBytes = 13;
constexpr std::uint8_t kModemItem = 1;
constexpr std::uint8_t kServerItem = 0xFF; // made by the telephony server itself
constexpr std::uint8_t kLogWrapper = 0x81;
constexpr std::size_t kLogWrapperBytes = 2;

// Timestamps count from 1980-01-06 00:00:00 UTC, which is so many seconds after 1970.
constexpr std::int64_t kLogEpochSeconds = 315964800;

// Codes of the server's items begin here: 0xFF0000 plus the 16-bit code.
constexpr std::uint32_t kExtendedCodes = 0xFF0000;
constexpr std::uint32_t kSimFilesCode = kExtendedCodes + 0;
constexpr std::uint32_t kCellMonitorCode = kExtendedCodes + 1;
constexpr std::uint32_t kPdpContextsCode = kExtendedCodes + 2;

// The message without its wrapper, if it has one. It must hold kLogHeaderBytes bytes; what comes
// back may be shorter by the wrapper.
inline ByteView unwrappedMessage(ByteView message)
{
    return message[0] == kLogWrapper ? message.subspan(kLogWrapperBytes) : message;
}

// The effective log code of an unwrapped message.
inline std::uint32_t logCodeOf(ByteView message)
{
    const auto code = PacketView(message).unsignedAt(3, 2).value_or(0);
    const std::uint32_t extension = message[0] == kServerItem ? kExtendedCodes : 0;
    return extension + static_cast<std::uint32_t>(code);
}

} // namespace orvane

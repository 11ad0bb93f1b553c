#include "telephonyd/modem/DiagnosticRequest.h"

#include "platform/base/Bytes.h"
#include "platform/base/PacketView.h"

#include <algorithm>

namespace orvane
{

namespace
{

// Command bytes.
constexpr std::uint8_t kVersion = 0x00;
constexpr std::uint8_t kLogItem = 0x10;
constexpr std::uint8_t kLogMasks = 0x73;

// What a refusal begins with; the request's bytes follow.
constexpr std::uint8_t kUnknownCommand = 0x13;
constexpr std::uint8_t kBadParameters = 0x14;
constexpr std::uint8_t kBadLength = 0x15;
constexpr std::uint8_t kNotNow = 0x18;

// Operations of kLogMasks. A request begins with the command and the operation, and so does its
// answer, which has a status behind them and, of a mask, group and count.
constexpr std::uint32_t kDisable = 0;
constexpr std::uint32_t kRanges = 1;
constexpr std::uint32_t kSetMask = 3;
constexpr std::size_t kHeaderBytes = 8;
constexpr std::size_t kStatusBytes = 4;
constexpr std::size_t kGroupAndCountBytes = 8;
constexpr std::size_t kRangesBytes = 4 * kLogGroups;

// Command, a byte of no use here, length of the item.
constexpr std::size_t kItemPrefixBytes = 4;
// The item's length, code and timestamp.
constexpr std::size_t kItemHeaderBytes = 12;

void append32(Bytes& bytes, std::uint32_t value)
{
    for (unsigned shift = 0; shift < 32; shift += 8)
        bytes.push_back(static_cast<std::uint8_t>(value >> shift & 0xFFU));
}

Bytes maskRequest(std::uint32_t operation)
{
    Bytes payload = {kLogMasks, 0, 0, 0};
    append32(payload, operation);
    return payload;
}

bool equal(ByteView left, ByteView right)
{
    return std::equal(left.begin(), left.end(), right.begin(), right.end());
}

// Whether both have those bytes, and the same ones.
bool agree(ByteView left, ByteView right, std::size_t offset, std::size_t count)
{
    return PacketView(left).holds(offset, count) && PacketView(right).holds(offset, count) &&
           equal(left.subspan(offset, count), right.subspan(offset, count));
}

std::optional<DiagnosticAnswer::Kind> refusalIn(ByteView payload)
{
    switch (payload.front()) {
    case kUnknownCommand:
    case kBadParameters:
    case kBadLength:
        return DiagnosticAnswer::Kind::Refused;
    case kNotNow:
        return DiagnosticAnswer::Kind::NotNow;
    default:
        return std::nullopt;
    }
}

} // namespace

DiagnosticRequest DiagnosticRequest::version() { return DiagnosticRequest(Bytes{kVersion}); }

DiagnosticRequest DiagnosticRequest::ranges() { return DiagnosticRequest(maskRequest(kRanges)); }

DiagnosticRequest DiagnosticRequest::setMask(std::uint32_t group, std::uint32_t count,
                                             const std::set<std::uint32_t>& places)
{
    Bytes payload = maskRequest(kSetMask);
    append32(payload, group);
    append32(payload, count);
    const std::size_t mask = payload.size();
    payload.resize(mask + (count + 7) / 8);
    for (const std::uint32_t place : places)
        if (place < count)
            payload[mask + (place >> 3)] |= static_cast<std::uint8_t>(1U << (place & 7U));
    return DiagnosticRequest(std::move(payload));
}

DiagnosticRequest DiagnosticRequest::allOff() { return DiagnosticRequest(maskRequest(kDisable)); }

std::optional<DiagnosticAnswer> DiagnosticRequest::answerIn(ByteView payload) const
{
    if (payload.empty())
        return std::nullopt;
    if (const auto refusal = refusalIn(payload))
        return equal(payload.subspan(1), _payload) ? std::optional(DiagnosticAnswer{*refusal, {}})
                                                   : std::nullopt;
    if (payload.front() != _payload.front())
        return std::nullopt;
    if (_payload.front() == kVersion)
        return DiagnosticAnswer{};
    const PacketView answer(payload);
    const auto status = answer.unsignedAt(kHeaderBytes, kStatusBytes);
    if (!status || !agree(payload, _payload, 0, kHeaderBytes))
        return std::nullopt;
    const bool hasFailed = *status != 0;
    const std::size_t rest = kHeaderBytes + kStatusBytes;
    const auto operation = PacketView(_payload).unsignedAt(4, 4);
    if (operation == kSetMask) {
        // A late answer of the mask before would otherwise pass for that of another group.
        const PacketView asked = PacketView(_payload).from(kHeaderBytes);
        const ByteView answered = answer.from(rest).bytes();
        const bool hasGroup = answered.size() >= kGroupAndCountBytes;
        if (hasGroup ? !agree(answered, asked.bytes(), 0, kGroupAndCountBytes) : !hasFailed)
            return std::nullopt;
    }
    if (hasFailed)
        return DiagnosticAnswer{DiagnosticAnswer::Kind::Failed, {}};
    DiagnosticAnswer done;
    if (operation == kRanges) {
        if (!answer.holds(rest, kRangesBytes))
            return std::nullopt;
        for (std::size_t group = 0; group < kLogGroups; ++group)
            done.ranges[group] =
                static_cast<std::uint32_t>(answer.unsignedAt(rest + 4 * group, 4).value_or(0));
    }
    return done;
}

DiagnosticItem diagnosticItemIn(ByteView payload)
{
    if (payload.empty() || payload.front() != kLogItem)
        return {};
    const PacketView view(payload);
    const ByteView item = view.from(kItemPrefixBytes).bytes();
    const auto outer = view.unsignedAt(2, 2);
    const auto inner = PacketView(item).unsignedAt(0, 2);
    const bool isSound = item.size() >= kItemHeaderBytes && outer == item.size() && inner == outer;
    return {true, isSound ? item : ByteView()};
}

} // namespace orvane

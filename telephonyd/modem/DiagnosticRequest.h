#pragma once

#include "platform/base/Bytes.h"

#include <array>
#include <cstdint>
#include <optional>
#include <set>

namespace orvane
{

// A log code's group is its highest four bits; its place in the group's mask is the rest.
constexpr std::size_t kLogGroups = 16;
constexpr std::uint32_t logGroupOf(std::uint16_t code) { return code >> 12; }
constexpr std::uint32_t logPlaceOf(std::uint16_t code) { return code & 0xFFFU; }

// How many codes each group has, by group. 0: the modem does not have the group.
using LogRanges = std::array<std::uint32_t, kLogGroups>;

// What a modem answered to a request.
struct DiagnosticAnswer {
    enum class Kind {
        Done,
        Failed,  // a status other than 0
        Refused, // unknown command, bad parameters or bad length
        NotNow,  // may be asked again later
    };
    Kind kind = Kind::Done;
    // Of an answer Done to a request for ranges.
    LogRanges ranges{};
};

// A request to a modem's diagnostic port, and what counts as its answer. A value.
class DiagnosticRequest
{
public:
    // Who are you: a proof of life.
    static DiagnosticRequest version();
    static DiagnosticRequest ranges();
    // Switches on exactly those codes of a group whose places are given; all must be below `count`,
    // the number of the group's codes (at most 4096).
    static DiagnosticRequest setMask(std::uint32_t group, std::uint32_t count,
                                     const std::set<std::uint32_t>& places);
    // Switches off all codes of all groups.
    static DiagnosticRequest allOff();

    // The request as it goes into a frame.
    [[nodiscard]] ByteView payload() const { return _payload; }
    // What the payload of a frame from the modem answers to this request; nullopt when it is
    // something else: a log item, an answer to another request, an answer that is cut short.
    [[nodiscard]] std::optional<DiagnosticAnswer> answerIn(ByteView payload) const;

private:
    explicit DiagnosticRequest(Bytes payload) : _payload(std::move(payload)) {}

    Bytes _payload;
};

// The log item in a frame's payload, as it is in a log file: length, code, timestamp, payload.
// `isItem` says whether the payload claims to be one; the item is empty where it contradicts
// itself.
struct DiagnosticItem {
    bool isItem = false;
    ByteView bytes;
};
DiagnosticItem diagnosticItemIn(ByteView payload);

} // namespace orvane

#pragma once

#include "platform/PropertyValue.h"

#include <cstdint>
#include <deque>
#include <optional>
#include <vector>

namespace orvane
{

// One log item of a DLF file. The bytes stay the file's.
struct DlfItem {
    std::uint64_t position = 0;  // of its length field, in bytes from the file's start
    std::uint16_t logCode = 0;   // never 0
    std::uint64_t timestamp = 0; // see DlfTime.h
    ByteView bytes;              // the whole item from its 2-byte length field on; 12 or more
    std::uint8_t type = 1;       // 0xFF where that type byte stands before it, else 1
};

// Reads the log items of a file, in file order, without copies: `file` may be a mapped file and
// must outlive the reader and its items. An item is its length (2 bytes, itself included), log code
// (2), timestamp (8) and payload, little-endian. Items stand end to end, or, as in Orvane's own
// exports, behind the type byte (1 or 0xFF) or the wrapper (0x81, any byte, type byte) of the
// message that they came in. A snapshot's first message lost its first byte there: its type byte,
// so that its item follows the one before and counts as type 1, or the wrapper's 0x81, which leaves
// two bytes.
//
// Bytes that are no item (damage, gaps, messages too short or of a bad type) are passed over one by
// one and counted. An item is placed when
// - its length is 12 or more, it lies whole in the file and its code is not 0;
// - right after it comes the file's end or, possibly behind a type byte or a wrapper, such an item:
//   one look ahead is enough, for a chain that had to reach the file's end would lose every item
//   before a damage. So the last item before foreign bytes or before an item cut short is not
//   placed: it cannot be told from one that lost its own tail;
// - neither it nor the one after it swallows the start of a better item. In a long file nearly any
//   two foreign bytes are a length that fits. Two items in a row with different timestamps within
//   an hour of each other, and within a month of what was placed last, are no accident, though: the
//   first is vouched for. An item gives way where one that is vouched for begins inside of it,
//   unless its own timestamp is within an hour of that of the item next to it. Timestamps decide
//   nothing else.
// What could be placed with a separator before it or without is read the way that its timestamp
// vouches for, else without. After foreign bytes an 0xFF is a type byte only before codes below
// 0x1000, which no modem item has: it may as well be the last byte of an erased block.
//
// Every byte of the file is placed, a separator (type bytes and wrappers) or unplaced. The time
// that reading takes is linear in the file's length; memory is bounded, whatever the file holds.
class DlfReader
{
public:
    struct Range {
        std::uint64_t position = 0;
        std::uint64_t length = 0;
        friend bool operator==(const Range&, const Range&) = default;
    };
    static constexpr std::size_t kMaxUnplacedRanges = 256;

    explicit DlfReader(ByteView file) : _file(file) {}

    // The next item; none at the end of the file, also when called again.
    [[nodiscard]] std::optional<DlfItem> next();

    // What has been passed so far, in bytes. The three add up to the file's length at its end.
    [[nodiscard]] std::uint64_t placedBytes() const { return _placed; }
    [[nodiscard]] std::uint64_t separatorBytes() const { return _separators; }
    [[nodiscard]] std::uint64_t unplacedBytes() const { return _unplaced; }

    // Where the unplaced bytes are: runs in file order, the first kMaxUnplacedRanges of them.
    [[nodiscard]] const std::vector<Range>& unplacedRanges() const { return _ranges; }
    [[nodiscard]] std::uint64_t unplacedRangeCount() const { return _rangeCount; }

private:
    struct Start;

    [[nodiscard]] std::optional<Start> fitting(std::size_t from, std::size_t separators,
                                               std::uint64_t type) const;
    template <typename Test>
    [[nodiscard]] std::optional<Start> firstStart(std::size_t from, bool followsItem,
                                                  const Test& test) const;
    [[nodiscard]] bool isTimely(const Start& start) const;
    [[nodiscard]] bool isVouchedFor(const Start& start) const;
    [[nodiscard]] bool isSound(const Start& start);
    [[nodiscard]] bool isFollowed(const Start& start);
    [[nodiscard]] bool hasVouchedStart(std::size_t from, std::size_t end);
    [[nodiscard]] std::optional<Start> startHere();
    DlfItem place(const Start& start);
    void passUnplacedByte();

    ByteView _file;
    std::size_t _cursor = 0;
    bool _followsItem = false; // the item before ends at the cursor
    std::uint64_t _lastTimestamp = 0;
    std::uint64_t _clock = 0; // timestamp of the last item placed that is near the one after it
    std::uint64_t _placed = 0;
    std::uint64_t _separators = 0;
    std::uint64_t _unplaced = 0;
    std::vector<Range> _ranges;
    std::uint64_t _rangeCount = 0;
    // The starts vouched for from the cursor to _searchedTo, found when first asked for. Questions
    // reach at most two items ahead, so this stays small and no byte is searched twice.
    std::deque<std::size_t> _vouchedStarts;
    std::size_t _searchedTo = 0;
};

} // namespace orvane

#pragma once

#include "dlf/ByteSource.h"
#include "platform/base/Bytes.h"

#include <cstdint>
#include <deque>
#include <memory>
#include <optional>
#include <vector>

namespace orvane
{

// One log item of a DLF file. The bytes stay the source's.
struct DlfItem {
    std::uint64_t position = 0;  // of its length field, in bytes from the file's start
    std::uint16_t logCode = 0;   // never 0
    std::uint64_t timestamp = 0; // see DlfTime.h
    ByteView bytes;              // the whole item from its 2-byte length field on; 12 or more
    std::uint8_t type = 1;       // 0xFF where that type byte stands before it, else 1
};

// Reads the log items of a file, in file order, without copies. A copy of a reader goes on from the
// same place on its own. An item is its length (2 bytes, itself included), log code
// (2), timestamp (8) and payload, little-endian. Items stand end to end, or, as in Orvane's own
// exports, behind the type byte (1 or 0xFF) or the wrapper (0x81, any byte, type byte) of the
// message that they came in. A snapshot's first message lost its first byte there: its type byte,
// so that its item follows the one before and counts as type 1, or the wrapper's 0x81, which leaves
// two bytes.
//
// Other bytes (damage, gaps, messages too short or of a bad type) are skipped one by one and
// counted. An item is placed when
// - its length is 12 or more, it lies whole in the file and its code is not 0;
// - right after it comes the file's end or, possibly behind a type byte or a wrapper, such an item:
//   one item of look-ahead is enough: requiring an unbroken chain to the end of the file would drop
//   everything before a damaged spot. So the last item before foreign bytes, or before an item that
//   was cut, is not placed: it might have lost its own tail;
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

    // Of bytes in memory, which must outlive the reader and its items.
    explicit DlfReader(ByteView file) : DlfReader(std::make_shared<MemorySource>(file)) {}
    explicit DlfReader(std::shared_ptr<ByteSource> source) : _source(std::move(source)) {}

    // The next item; none at the end of the file, also when called again. Its bytes stay until the
    // source is next asked, those in memory as long as they live.
    [[nodiscard]] std::optional<DlfItem> next() { return next(UINT64_MAX); }
    // The same, but gives up after so many bytes that are no item: none then as well, though
    // isAtEnd() is false.
    [[nodiscard]] std::optional<DlfItem> next(std::uint64_t mostUnplacedBytes);
    [[nodiscard]] bool isAtEnd() const { return _cursor >= _source->size(); }

    // The file's length in bytes, as far as is known by now.
    [[nodiscard]] std::uint64_t size() const { return _source->size(); }
    // How far reading has come, in bytes from the file's start.
    [[nodiscard]] std::uint64_t position() const { return _cursor; }
    // What has been passed so far, in bytes. The three add up to the file's length at its end.
    [[nodiscard]] std::uint64_t placedBytes() const { return _placed; }
    [[nodiscard]] std::uint64_t separatorBytes() const { return _separators; }
    [[nodiscard]] std::uint64_t unplacedBytes() const { return _unplaced; }

    // Where the unplaced bytes are: runs in file order, the first kMaxUnplacedRanges of them.
    [[nodiscard]] const std::vector<Range>& unplacedRanges() const { return _ranges; }
    [[nodiscard]] std::uint64_t unplacedRangeCount() const { return _rangeCount; }

    // About how much memory it takes beside itself and the source.
    [[nodiscard]] std::size_t bytesKept() const
    {
        return _ranges.size() * sizeof(Range) + _vouchedStarts.size() * sizeof(std::uint64_t);
    }

private:
    struct Start;

    void look();
    [[nodiscard]] std::optional<std::uint64_t> unsignedAt(std::uint64_t position,
                                                          std::size_t width) const;
    [[nodiscard]] std::optional<Start> fitting(std::uint64_t from, std::size_t separators,
                                               std::uint64_t type) const;
    template <typename Test>
    [[nodiscard]] std::optional<Start> firstStart(std::uint64_t from, bool followsItem,
                                                  const Test& test) const;
    [[nodiscard]] bool isTimely(const Start& start) const;
    [[nodiscard]] bool isVouchedFor(const Start& start) const;
    [[nodiscard]] bool isSound(const Start& start);
    [[nodiscard]] bool isFollowed(const Start& start);
    [[nodiscard]] bool hasVouchedStart(std::uint64_t from, std::uint64_t end);
    [[nodiscard]] std::optional<Start> startHere();
    DlfItem place(const Start& start);
    void passUnplacedByte();

    std::shared_ptr<ByteSource> _source;
    ByteView _window;        // from the cursor on, as far as any question reaches
    std::uint64_t _size = 0; // of the file
    std::uint64_t _cursor = 0;
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
    std::deque<std::uint64_t> _vouchedStarts;
    std::uint64_t _searchedTo = 0;
};

} // namespace orvane

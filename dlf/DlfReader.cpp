#include "dlf/DlfReader.h"

#include "dlf/DlfTime.h"
#include "platform/base/LogMessage.h"
#include "platform/base/PacketView.h"

#include <algorithm>

namespace orvane
{

namespace
{

constexpr std::size_t kHeaderBytes = 12;
constexpr std::uint16_t kFirstModemCode = 0x1000;

// No question reaches further from the cursor: an item (of at most 64 KiB and its separator), the
// one after it, and what begins within that one.
constexpr std::size_t kReach = 4 * 65536;

constexpr std::uint64_t kHour = 3600 * kDlfStepsPerSecond;
constexpr std::uint64_t kMonth = 30 * 24 * kHour;

bool isType(std::optional<std::uint64_t> byte) { return byte == kModemItem || byte == kServerItem; }

} // namespace

// An item that fits at its place, with what stands between it and the item before.
struct DlfReader::Start {
    std::uint64_t position;
    std::size_t length;
    std::size_t separators;
    std::uint64_t timestamp;
    std::uint16_t code;
    std::uint8_t type;

    [[nodiscard]] std::uint64_t end() const { return position + length; }
};

void DlfReader::look()
{
    _window = _source->bytes(_cursor, kReach);
    _size = _source->size();
}

std::optional<std::uint64_t> DlfReader::unsignedAt(std::uint64_t position, std::size_t width) const
{
    return PacketView(_window).unsignedAt(position - _cursor, width);
}

std::optional<DlfReader::Start> DlfReader::fitting(std::uint64_t from, std::size_t separators,
                                                   std::uint64_t type) const
{
    const std::uint64_t position = from + separators;
    const auto header = unsignedAt(position, 4);
    const auto timestamp = unsignedAt(position + 4, 8);
    if (!header || !timestamp)
        return std::nullopt;
    const auto length = static_cast<std::size_t>(*header & 0xFFFF);
    const auto code = static_cast<std::uint16_t>(*header >> 16);
    if (length < kHeaderBytes || code == 0 || length > _size - position)
        return std::nullopt;
    return Start{position, length, separators, *timestamp, code, static_cast<std::uint8_t>(type)};
}

// The first that passes of the ways to read an item at one place: without a separator, behind a
// type byte, behind a wrapper, behind what is left of a wrapper.
template <typename Test>
std::optional<DlfReader::Start> DlfReader::firstStart(std::uint64_t from, bool followsItem,
                                                      const Test& test) const
{
    const auto accepted = [&](std::size_t separators, std::uint64_t type) {
        std::optional<Start> start = fitting(from, separators, type);
        if (start && !test(*start))
            start.reset();
        return start;
    };
    if (auto start = accepted(0, kModemItem))
        return start;
    const auto first = unsignedAt(from, 1);
    if (isType(first))
        if (auto start = accepted(1, *first))
            if (followsItem || first != kServerItem || start->code < kFirstModemCode)
                return start;
    if (first == kLogWrapper)
        if (const auto third = unsignedAt(from + 2, 1); isType(third))
            if (auto start = accepted(3, *third))
                return start;
    if (followsItem)
        if (const auto second = unsignedAt(from + 1, 1); isType(second))
            return accepted(2, *second);
    return std::nullopt;
}

bool DlfReader::isTimely(const Start& start) const
{
    if (start.timestamp < kFirstTimelyTimestamp)
        return false;
    // Equal ones may be the same bytes twice, in a payload that repeats itself.
    const auto comesNext = [&](const Start& follower) {
        return start.timestamp != follower.timestamp &&
               areTimestampsWithin(kHour, start.timestamp, follower.timestamp);
    };
    return firstStart(start.end(), true, comesNext).has_value();
}

bool DlfReader::isVouchedFor(const Start& start) const
{
    return (_clock == 0 || areTimestampsWithin(kMonth, _clock, start.timestamp)) && isTimely(start);
}

bool DlfReader::hasVouchedStart(std::uint64_t from, std::uint64_t end)
{
    while (!_vouchedStarts.empty() && _vouchedStarts.front() < _cursor)
        _vouchedStarts.pop_front();
    for (_searchedTo = std::max(_searchedTo, _cursor); _searchedTo < end; ++_searchedTo) {
        const auto start = fitting(_searchedTo, 0, kModemItem);
        if (start && isVouchedFor(*start))
            _vouchedStarts.push_back(_searchedTo);
    }
    const auto found = std::lower_bound(_vouchedStarts.begin(), _vouchedStarts.end(), from);
    return found != _vouchedStarts.end() && *found < end;
}

bool DlfReader::isSound(const Start& start)
{
    return isVouchedFor(start) || !hasVouchedStart(start.position + 1, start.end());
}

bool DlfReader::isFollowed(const Start& start)
{
    if (start.end() == _size)
        return true;
    const auto follows = [&](const Start& follower) {
        return areTimestampsWithin(kHour, start.timestamp, follower.timestamp) || isSound(follower);
    };
    return firstStart(start.end(), true, follows).has_value();
}

std::optional<DlfReader::Start> DlfReader::startHere()
{
    const auto isVouched = [&](const Start& start) { return isVouchedFor(start); };
    const auto goesOn = [&](const Start& start) {
        return areTimestampsWithin(kHour, _lastTimestamp, start.timestamp) && isFollowed(start);
    };
    const auto fits = [&](const Start& start) { return isSound(start) && isFollowed(start); };

    auto start = firstStart(_cursor, _followsItem, isVouched);
    if (!start && _followsItem)
        start = firstStart(_cursor, true, goesOn);
    if (!start)
        start = firstStart(_cursor, _followsItem, fits);
    if (start && isTimely(*start))
        _clock = start->timestamp;
    return start;
}

DlfItem DlfReader::place(const Start& start)
{
    _separators += start.separators;
    _placed += start.length;
    const ByteView bytes = _window.subspan(start.position - _cursor, start.length);
    _cursor = start.end();
    _followsItem = true;
    _lastTimestamp = start.timestamp;
    return {start.position, start.code, start.timestamp, bytes, start.type};
}

void DlfReader::passUnplacedByte()
{
    const bool goesOn = _unplaced > 0 && !_followsItem;
    if (!goesOn)
        ++_rangeCount;
    if (_rangeCount <= kMaxUnplacedRanges) {
        if (!goesOn)
            _ranges.push_back({_cursor, 0});
        ++_ranges.back().length;
    }
    ++_unplaced;
    ++_cursor;
    _followsItem = false;
}

std::optional<DlfItem> DlfReader::next(std::uint64_t mostUnplacedBytes)
{
    for (std::uint64_t passed = 0; passed < mostUnplacedBytes; ++passed) {
        look();
        if (_cursor >= _size)
            break;
        if (const std::optional<Start> start = startHere())
            return place(*start);
        passUnplacedByte();
    }
    return std::nullopt;
}

} // namespace orvane

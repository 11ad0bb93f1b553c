#include "dlf/DlfReader.h"

#include "dlf/DlfTime.h"
#include "dlf/VersionReport.h"
#include "support/Paths.h"

#include <gtest/gtest.h>

#include <algorithm>
#include <fstream>
#include <initializer_list>
#include <iterator>
#include <string>

namespace orvane
{
namespace
{

constexpr std::uint64_t kStart = std::uint64_t{1183782848} * kDlfStepsPerSecond << 16;
constexpr std::uint64_t kHalfSecond = std::uint64_t{400} << 16;

void append(Bytes& to, const Bytes& bytes) { to.insert(to.end(), bytes.begin(), bytes.end()); }

void put(Bytes& to, std::uint64_t value, int width)
{
    for (int i = 0; i < width; ++i)
        to.push_back(static_cast<std::uint8_t>(value >> 8 * i));
}

Bytes item(std::uint16_t code, std::uint64_t timestamp, std::size_t payload = 20)
{
    Bytes bytes;
    put(bytes, payload + 12, 2);
    put(bytes, code, 2);
    put(bytes, timestamp, 8);
    for (std::size_t i = 0; i < payload; ++i)
        bytes.push_back(static_cast<std::uint8_t>(i % 9));
    return bytes;
}

Bytes report()
{
    Bytes bytes(kDlfVersionReportBytes, 0);
    std::uint32_t written = 0;
    VRTDLFAddVersionReport(bytes.data(), kDlfVersionReportBytes, &written, 1, 1, "Orvane 2.5",
                           "EXECUTABLE_NAME", "Jun 13 2017 22:04:20", 1795255200, 0, 0);
    return bytes;
}

// Items two a second, of lengths from 12 on.
std::vector<Bytes> items(std::size_t count, std::uint64_t first = kStart,
                         std::uint64_t step = kHalfSecond)
{
    std::vector<Bytes> all;
    for (std::size_t i = 0; i < count; ++i)
        all.push_back(
            item(static_cast<std::uint16_t>(0xB0C0 + i % 64), first + i * step, i * 7 % 50));
    return all;
}

Bytes joined(const std::vector<Bytes>& parts)
{
    Bytes all;
    for (const Bytes& part : parts)
        append(all, part);
    return all;
}

Bytes message(std::uint8_t type, const Bytes& content)
{
    Bytes bytes{type};
    append(bytes, content);
    return bytes;
}

Bytes wrapped(std::uint8_t second, const Bytes& content)
{
    Bytes bytes{0x81, second};
    append(bytes, content);
    return bytes;
}

// As saving exports it: the report, then each snapshot's messages less the snapshot's first byte.
Bytes exported(const std::vector<std::vector<Bytes>>& snapshots)
{
    Bytes all = report();
    for (const std::vector<Bytes>& messages : snapshots) {
        const Bytes bytes = joined(messages);
        if (bytes.size() >= 2)
            all.insert(all.end(), bytes.begin() + 1, bytes.end());
    }
    return all;
}

Bytes recording(const std::string& name)
{
    std::ifstream file(testDataPath(name), std::ios::binary);
    const std::vector<char> content{std::istreambuf_iterator<char>(file), {}};
    return {content.begin(), content.end()};
}

// What a reader makes of a file, with what must hold of any file checked.
struct Reading {
    explicit Reading(const Bytes& read) : file(read) // a copy, exactly sized
    {
        DlfReader reader(file);
        std::uint64_t end = 0;
        while (const auto each = reader.next()) {
            EXPECT_GE(each->position, end);
            end = each->position + each->bytes.size();
            EXPECT_LE(end, file.size());
            EXPECT_EQ(each->bytes.data(), file.data() + each->position);
            found.push_back(*each);
            placed += each->bytes.size();
        }
        EXPECT_FALSE(reader.next());
        EXPECT_EQ(reader.placedBytes(), placed);
        separators = reader.separatorBytes();
        unplaced = reader.unplacedBytes();
        EXPECT_EQ(placed + separators + unplaced, file.size());
        ranges = reader.unplacedRanges();
        rangeCount = reader.unplacedRangeCount();
        std::uint64_t ranged = 0;
        for (const DlfReader::Range& range : ranges)
            ranged += range.length;
        if (rangeCount == ranges.size()) {
            EXPECT_EQ(ranged, unplaced);
        }
    }

    [[nodiscard]] std::vector<Bytes> bytes() const
    {
        std::vector<Bytes> all;
        for (const DlfItem& each : found)
            all.emplace_back(each.bytes.begin(), each.bytes.end());
        return all;
    }
    [[nodiscard]] std::vector<int> types() const
    {
        std::vector<int> all;
        for (const DlfItem& each : found)
            all.push_back(each.type);
        return all;
    }

    Bytes file;
    std::vector<DlfItem> found;
    std::uint64_t placed = 0;
    std::uint64_t separators = 0;
    std::uint64_t unplaced = 0;
    std::vector<DlfReader::Range> ranges;
    std::uint64_t rangeCount = 0;
};

std::vector<Bytes> without(std::vector<Bytes> all, std::initializer_list<std::size_t> dropped)
{
    for (auto each = std::rbegin(dropped); each != std::rend(dropped); ++each)
        all.erase(all.begin() + static_cast<std::ptrdiff_t>(*each));
    return all;
}

Bytes withInserted(const std::vector<Bytes>& parts, std::size_t before, const Bytes& foreign)
{
    std::vector<Bytes> all = parts;
    all.insert(all.begin() + static_cast<std::ptrdiff_t>(before), foreign);
    return joined(all);
}

// Whether each of `some` is found in `all`, in the same order.
bool isSubsequence(const std::vector<Bytes>& some, const std::vector<Bytes>& all)
{
    auto from = all.begin();
    for (const Bytes& each : some) {
        from = std::find(from, all.end(), each);
        if (from == all.end())
            return false;
        ++from;
    }
    return true;
}

TEST(DlfReaderTest, PlainFileGivesItsItemsEndToEnd)
{
    std::vector<Bytes> parts = items(30);
    parts.insert(parts.begin(), report());
    const Bytes file = joined(parts);
    const Reading reading(file);
    EXPECT_EQ(reading.bytes(), parts);
    EXPECT_EQ(reading.types(), std::vector<int>(31, 1));
    EXPECT_EQ(reading.unplaced, 0U);
    EXPECT_EQ(reading.separators, 0U);
    EXPECT_TRUE(reading.ranges.empty());
    EXPECT_EQ(reading.found[0].logCode, 0x1FFD);
    EXPECT_EQ(reading.found[0].timestamp, 0U);
    EXPECT_EQ(reading.found[3].logCode, 0xB0C2);
    EXPECT_EQ(reading.found[3].timestamp, kStart + 2 * kHalfSecond);
    EXPECT_EQ(reading.found[1].position, 161U);
}

TEST(DlfReaderTest, NothingIsReadOfEmptyOrForeignFiles)
{
    for (const Bytes& file : {
             Bytes(), Bytes(1, 1), Bytes(11, 12), Bytes(5000, 0), Bytes(3, 0x81), Bytes{0x81, 0, 1},
             Bytes(300, 0xFF)
    }) {
        const Reading reading(file);
        EXPECT_TRUE(reading.found.empty());
        EXPECT_EQ(reading.unplaced, file.size());
        EXPECT_EQ(reading.rangeCount, file.empty() ? 0U : 1U);
    }
}

TEST(DlfReaderTest, OneItemAloneNeedsTheEndOfTheFileAfterIt)
{
    const Bytes whole = item(0xB0C0, kStart);
    EXPECT_EQ(Reading(whole).found.size(), 1U);
    Bytes longer = whole;
    longer.push_back(0);
    EXPECT_TRUE(Reading(longer).found.empty());
    EXPECT_TRUE(Reading(Bytes(whole.begin(), whole.end() - 1)).found.empty());
}

TEST(DlfReaderTest, LengthsBelowTwelveAndCodeZeroAreNoItems)
{
    Bytes tooShort = item(0xB0C0, kStart, 0);
    tooShort[0] = 11;
    EXPECT_TRUE(Reading(tooShort).found.empty());
    EXPECT_EQ(Reading(item(0xB0C0, kStart, 0)).found.size(), 1U);
    EXPECT_TRUE(Reading(item(0, kStart, 0)).found.empty());
    EXPECT_EQ(Reading(item(1, kStart, 0)).found.size(), 1U);
}

TEST(DlfReaderTest, LongestItemIsRead)
{
    const Bytes file = joined({item(0xB0C0, kStart, 65523), item(0xB0C1, kStart + 1, 65523)});
    EXPECT_EQ(Reading(file).found.size(), 2U);
}

TEST(DlfReaderTest, TimestampsDoNotDecideWhatFits)
{
    for (const std::uint64_t step : {std::uint64_t{0}, std::uint64_t{1}, std::uint64_t{1} << 40,
                                     std::uint64_t{0x123456789ABCDEF}, ~std::uint64_t{0}}) {
        for (const std::uint64_t first : {std::uint64_t{0}, kStart}) {
            const std::vector<Bytes> parts = items(12, first, step);
            EXPECT_EQ(Reading(joined(parts)).bytes(), parts) << first << " " << step;
        }
    }
}

TEST(DlfReaderTest, ExportedFileGivesTheItemsOfItsMessages)
{
    const std::vector<Bytes> all = items(9);
    const std::vector<Bytes> first{message(1, all[0]), message(1, all[1]),
                                   wrapped(7, message(1, all[2]))};
    const std::vector<Bytes> second{message(1, all[3])};
    const std::vector<Bytes> third{wrapped(0x55, message(1, all[4])), message(1, all[5])};
    const std::vector<Bytes> oneByte{Bytes(1, 1)};
    const std::vector<Bytes> nothing;
    const std::vector<Bytes> last{message(1, all[6]), wrapped(0, message(1, all[7])),
                                  message(1, all[8])};
    const Reading reading(exported({first, second, third, oneByte, nothing, last}));
    std::vector<Bytes> expected = all;
    expected.insert(expected.begin(), report());
    EXPECT_EQ(reading.bytes(), expected);
    EXPECT_EQ(reading.unplaced, 0U);
    // Type bytes of items 1, 5 and 8, wrappers of 2 and 7, and what is left of that of 4.
    EXPECT_EQ(reading.separators, 3U + 3 + 3 + 2);
}

TEST(DlfReaderTest, ItemsOfTheServerAreToldByTheirTypeByte)
{
    const std::vector<Bytes> all = items(3);
    const Bytes server = item(2, kStart, 30);
    const std::vector<Bytes> first{message(1, all[0]), message(0xFF, server),
                                   wrapped(3, message(0xFF, server)), message(1, all[1])};
    const std::vector<Bytes> second{wrapped(9, message(0xFF, server)), message(1, all[2])};
    const Reading reading(exported({first, second}));
    EXPECT_EQ(reading.types(), (std::vector<int>{1, 1, 0xFF, 0xFF, 1, 0xFF, 1}));
    EXPECT_EQ(reading.found[2].logCode, 2);
    EXPECT_EQ(reading.unplaced, 0U);
}

TEST(DlfReaderTest, FirstMessageOfASnapshotLostItsTypeAndCountsAsTypeOne)
{
    const Bytes server = item(2, kStart, 30);
    const Reading reading(exported({
        {message(0xFF, server), message(1, item(0xB0C0, kStart))}
    }));
    EXPECT_EQ(reading.types(), (std::vector<int>{1, 1, 1}));
    EXPECT_EQ(reading.found[1].logCode, 2);
}

TEST(DlfReaderTest, ServerItemOfCodeZeroIsNotPlaced)
{
    const std::vector<Bytes> all = items(4);
    const Bytes server = item(0, kStart, 30);
    const Reading reading(exported({
        {message(1, all[0]), message(1, all[1]), message(0xFF, server), message(1, all[2]),
         message(1, all[3])}
    }));
    EXPECT_EQ(reading.bytes(), (std::vector<Bytes>{report(), all[0], all[2], all[3]}));
}

TEST(DlfReaderTest, ShortMessagesOfAnExportArePassedOver)
{
    const std::vector<Bytes> all = items(40);
    for (std::size_t length = 2; length < 13; ++length) {
        std::vector<Bytes> messages;
        for (std::size_t i = 0; i < all.size(); ++i) {
            messages.push_back(message(1, all[i]));
            if (i == 19)
                messages.push_back(Bytes(length, 0));
        }
        const Reading reading(exported({messages}));
        std::vector<Bytes> expected = without(all, {19});
        expected.insert(expected.begin(), report());
        EXPECT_EQ(reading.bytes(), expected) << length;
        EXPECT_EQ(reading.rangeCount, 1U);
    }
}

TEST(DlfReaderTest, MessagesOfABadTypeArePassedOverUpToTheirItem)
{
    const std::vector<Bytes> all = items(6);
    const Reading reading(exported({
        {message(1, all[0]), message(1, all[1]), message(2, all[2]), message(1, all[3]),
         message(1, all[4]), message(1, all[5])}
    }));
    // The item inside is whole; that its message was dropped once cannot be seen any more.
    EXPECT_EQ(reading.bytes(),
              (std::vector<Bytes>{report(), all[0], all[2], all[3], all[4], all[5]}));
}

TEST(DlfReaderTest, TypeByteIsNotTakenForALengthInLongExports)
{
    // Read as a length, type byte and length lie in the file: only the timestamps tell.
    std::vector<Bytes> messages;
    const std::vector<Bytes> all = items(3000);
    for (std::size_t i = 0; i < all.size(); ++i)
        messages.push_back(i % 5 == 3 ? wrapped(0x21, message(1, all[i]))
                                      : message(i % 7 == 2 ? 0xFF : 1, all[i]));
    const Reading reading(exported({messages}));
    ASSERT_EQ(reading.found.size(), all.size() + 1);
    EXPECT_EQ(reading.unplaced, 0U);
    for (std::size_t i = 0; i < all.size(); ++i)
        ASSERT_EQ(reading.found[i + 1].type, i % 5 != 3 && i % 7 == 2 ? 0xFF : 1) << i;
}

TEST(DlfReaderTest, EveryTruncationKeepsAllItemsThatAreFollowedByAWholeOne)
{
    const std::vector<Bytes> parts = items(9);
    const Bytes file = joined(parts);
    for (std::size_t length = 0; length <= file.size(); ++length) {
        std::vector<Bytes> whole;
        std::size_t end = 0;
        for (const Bytes& part : parts) {
            if (part.size() > length - end)
                break;
            end += part.size();
            whole.push_back(part);
        }
        if (end != length && !whole.empty())
            whole.pop_back(); // what comes after it is cut short
        const Bytes cut(file.begin(), file.begin() + static_cast<std::ptrdiff_t>(length));
        ASSERT_EQ(Reading(cut).bytes(), whole) << length;
    }
}

TEST(DlfReaderTest, ForeignBytesCostTheItemBeforeThemAndNoOther)
{
    // In the short file a foreign length reaches past the end, in the long one it lies in the file.
    for (const std::size_t count : {10U, 3000U}) {
        const std::vector<Bytes> parts = items(count);
        const std::size_t before = count / 2;
        const std::vector<Bytes> expected = without(parts, {before - 1});
        for (const int fill : {0x00, 0x20, 0x7E, 0xED}) {
            for (std::size_t length = 1; length <= 40; ++length) {
                const Reading reading(
                    withInserted(parts, before, Bytes(length, static_cast<std::uint8_t>(fill))));
                ASSERT_EQ(reading.bytes(), expected) << count << " " << fill << " " << length;
                EXPECT_EQ(reading.unplaced, parts[before - 1].size() + length);
                EXPECT_EQ(reading.types(), std::vector<int>(count - 1, 1));
            }
        }
    }
}

TEST(DlfReaderTest, ErasedBytesDoNotMakeTheNextItemOneOfTheServer)
{
    for (const std::size_t count : {10U, 3000U}) {
        const std::vector<Bytes> parts = items(count);
        const std::size_t before = count / 2;
        for (std::size_t length = 2; length <= 40; ++length) {
            const Reading reading(withInserted(parts, before, Bytes(length, 0xFF)));
            EXPECT_TRUE(isSubsequence(reading.bytes(), parts)) << length;
            EXPECT_GE(reading.found.size(), count - 1) << length;
            if (length > 2) { // two may be what is left of a wrapper
                EXPECT_EQ(reading.types(), std::vector<int>(count - 1, 1)) << length;
            }
        }
    }
}

TEST(DlfReaderTest, ServerItemAfterForeignBytesKeepsItsType)
{
    const std::vector<Bytes> all = items(3);
    const Reading reading(exported({
        {message(1, all[0]), Bytes(5, 0), message(0xFF, item(2, kStart)), message(1, all[1]),
         message(1, all[2])}
    }));
    EXPECT_EQ(reading.types(), (std::vector<int>{1, 0xFF, 1, 1}));
}

TEST(DlfReaderTest, PseudoRandomForeignBytesHideNoLaterItem)
{
    const std::vector<Bytes> parts = items(3000);
    std::uint32_t state = 1;
    for (std::size_t length = 1; length <= 2000; length = length * 3 / 2 + 1) {
        Bytes foreign;
        for (std::size_t i = 0; i < length; ++i) {
            state = state * 1664525 + 1013904223;
            foreign.push_back(static_cast<std::uint8_t>(state >> 24));
        }
        const std::vector<Bytes> found = Reading(withInserted(parts, 1000, foreign)).bytes();
        ASSERT_GE(found.size(), 2000U);
        EXPECT_TRUE(std::equal(parts.begin() + 1000, parts.end(), found.end() - 2000)) << length;
        EXPECT_TRUE(std::equal(parts.begin(), parts.begin() + 999, found.begin())) << length;
    }
}

TEST(DlfReaderTest, GapInTheMiddleCostsTheCutItemAndTheOneBeforeItAtMost)
{
    const std::vector<Bytes> parts = items(20);
    const Bytes file = joined(parts);
    std::size_t from = 0;
    for (std::size_t i = 0; i < 10; ++i)
        from += parts[i].size();
    for (std::size_t missing = 1; missing < parts[10].size(); ++missing) {
        Bytes damaged = file;
        const auto first = damaged.begin() + static_cast<std::ptrdiff_t>(from);
        damaged.erase(first, first + static_cast<std::ptrdiff_t>(missing));
        const Reading reading(damaged);
        EXPECT_TRUE(isSubsequence(without(parts, {9, 10}), reading.bytes())) << missing;
        EXPECT_TRUE(isSubsequence(reading.bytes(), parts)) << missing;
    }
}

TEST(DlfReaderTest, GapOfWholeItemsAndALeapInTimeCostNothing)
{
    std::vector<Bytes> parts = items(3000);
    const std::vector<Bytes> later = items(3000, kStart + (std::uint64_t{86400} * 800 << 16));
    parts.insert(parts.end(), later.begin(), later.end());
    parts.push_back(report());
    const std::vector<Bytes> earlier = items(10, kStart / 2);
    parts.insert(parts.end(), earlier.begin(), earlier.end());
    const Reading reading(joined(parts));
    EXPECT_EQ(reading.bytes(), parts);
    EXPECT_EQ(reading.unplaced, 0U);
}

TEST(DlfReaderTest, ItemsFromBeforeTheClockWasSetArePlaced)
{
    std::vector<Bytes> parts = items(1000, std::uint64_t{800} << 16);
    const std::vector<Bytes> later = items(1000);
    parts.insert(parts.end(), later.begin(), later.end());
    const Reading reading(joined(parts));
    EXPECT_EQ(reading.found.size(), 2000U);
    EXPECT_EQ(reading.bytes(), parts);
}

TEST(DlfReaderTest, UnplacedRangesAreListedUpToALimitAndAllCounted)
{
    const std::vector<Bytes> parts = items(4);
    std::vector<Bytes> all;
    std::vector<DlfReader::Range> expected;
    std::uint64_t position = 0;
    for (int i = 0; i < 300; ++i) {
        std::uint64_t length = 9;
        for (const Bytes& part : parts)
            length += part.size();
        // The last item before the foreign bytes is counted with them.
        expected.push_back({position + length - 9 - parts[3].size(), parts[3].size() + 9});
        position += length;
        all.insert(all.end(), parts.begin(), parts.end());
        all.emplace_back(9, 0);
    }
    const Reading reading(joined(all));
    EXPECT_EQ(reading.found.size(), 900U);
    EXPECT_EQ(reading.rangeCount, 300U);
    expected.resize(DlfReader::kMaxUnplacedRanges);
    EXPECT_EQ(reading.ranges, expected);
    EXPECT_EQ(reading.unplaced, 300 * (parts[3].size() + 9));
}

TEST(DlfReaderTest, RecordingIsPlacedWhole)
{
    const Bytes file = recording("lte-drive.dlf");
    const Reading reading(file);
    EXPECT_EQ(reading.found.size(), 1106U);
    EXPECT_EQ(reading.placed, 70343U);
    EXPECT_EQ(reading.unplaced, 0U);
}

TEST(DlfReaderTest, DamagedRecordingKeepsAllItemsButThoseAtItsDamages)
{
    const Bytes wholeFile = recording("lte-drive.dlf");
    const Bytes file = recording("lte-drive-damaged.dlf");
    const std::vector<Bytes> whole = Reading(wholeFile).bytes();
    const Reading reading(file);
    // One item is overwritten, the last is cut short, and so the one before it has no follower.
    EXPECT_EQ(reading.found.size(), 1103U);
    EXPECT_TRUE(isSubsequence(reading.bytes(), whole));
    EXPECT_EQ(reading.unplaced, 198U);
    EXPECT_EQ(reading.ranges, (std::vector<DlfReader::Range>{
                                  {35165, 67 },
                                  {70228, 131}
    }));
}

TEST(DlfReaderTest, DamagesInALongFileMakeNoFurtherLosses)
{
    const Bytes wholeFile = recording("lte-drive.dlf");
    const Bytes damaged = recording("lte-drive-damaged.dlf");
    const std::vector<Bytes> whole = Reading(wholeFile).bytes();
    std::vector<Bytes> expected;
    for (int i = 0; i < 4; ++i)
        expected.insert(expected.end(), whole.begin(), whole.end());
    const Reading reading(joined({damaged, damaged, damaged, damaged}));
    EXPECT_TRUE(isSubsequence(reading.bytes(), expected));
    // Where another report follows the item cut short, the one before it is placed after all.
    EXPECT_EQ(reading.found.size(), 3U * 1104 + 1103);
}

// A file of which nothing but what is asked for is in memory.
class NarrowSource final : public ByteSource
{
public:
    explicit NarrowSource(const Bytes& file) : _file(file) {}
    [[nodiscard]] std::uint64_t size() const override { return _file.size(); }
    [[nodiscard]] ByteView bytes(std::uint64_t position, std::size_t count) override
    {
        const auto first = _file.begin() + static_cast<std::ptrdiff_t>(position);
        const std::size_t most = std::min(count, _file.size() - position);
        widest = std::max(widest, most);
        // Always at another place, so that the address sanitizer sees who looks at an old one.
        _window = Bytes(first, first + static_cast<std::ptrdiff_t>(most));
        return _window;
    }
    std::size_t widest = 0;

private:
    const Bytes& _file;
    Bytes _window;
};

TEST(DlfReaderTest, AWindowOntoTheFileIsEnough)
{
    // Longest items, foreign bytes that look like such, and a real damaged recording.
    std::vector<Bytes> parts = {recording("lte-drive-damaged.dlf")};
    for (int i = 0; i < 6; ++i)
        parts.push_back(item(0xB0C0, kStart + static_cast<std::uint64_t>(i) * kHalfSecond,
                             i % 2 == 0 ? 65523 : 3));
    parts.emplace_back(3000, 0x77);
    parts.push_back(item(0xB0C1, kStart + kHalfSecond, 65523));
    parts.emplace_back(200, 0xFF);
    parts.push_back(recording("lte-drive-damaged.dlf"));
    const Bytes file = joined(parts);

    const Reading whole(file);
    const auto source = std::make_shared<NarrowSource>(file);
    DlfReader reader(source);
    std::vector<Bytes> found;
    while (const auto each = reader.next())
        found.emplace_back(each->bytes.begin(), each->bytes.end());
    EXPECT_EQ(found, whole.bytes());
    EXPECT_EQ(reader.unplacedRanges(), whole.ranges);
    EXPECT_EQ(reader.separatorBytes(), whole.separators);
    EXPECT_LE(source->widest, std::size_t{1} << 18);
}

TEST(DlfReaderTest, ReadingCanBeLimitedWhereNoItemIs)
{
    Bytes file = joined(items(3));
    file.insert(file.end(), 1000, 0x20);
    append(file, joined(items(3)));
    DlfReader reader(file);
    std::size_t found = 0;
    std::size_t breaks = 0;
    while (!reader.isAtEnd()) {
        if (reader.next(100))
            ++found;
        else
            ++breaks;
    }
    EXPECT_EQ(found, 5U); // not the one before the foreign bytes
    EXPECT_EQ(breaks, 10U);
    EXPECT_EQ(reader.unplacedRangeCount(), 1U);
    EXPECT_FALSE(reader.next(100));
}

TEST(DlfReaderTest, ACopyGoesOnFromTheSamePlaceOnItsOwn)
{
    const Bytes file = recording("lte-drive-damaged.dlf");
    const std::vector<Bytes> whole = Reading(file).bytes();
    DlfReader reader(file);
    for (std::size_t i = 0; i < whole.size(); ++i) {
        DlfReader copy = reader;
        for (std::size_t k = i; k < std::min(i + 3, whole.size()); ++k) {
            const auto each = copy.next();
            ASSERT_TRUE(each);
            ASSERT_EQ(Bytes(each->bytes.begin(), each->bytes.end()), whole[k]);
        }
        ASSERT_TRUE(reader.next());
    }
    EXPECT_FALSE(reader.next());
}

// What is cut off a file while it is read.
class ShrinkingSource final : public ByteSource
{
public:
    ShrinkingSource(const Bytes& file, std::uint64_t size) : _file(file), _size(size) {}
    [[nodiscard]] std::uint64_t size() const override { return _calls < 20 ? _file.size() : _size; }
    [[nodiscard]] ByteView bytes(std::uint64_t position, std::size_t count) override
    {
        ++_calls;
        return position < size() ? ByteView(_file).subspan(position).first(
                                       std::min<std::size_t>(count, size() - position))
                                 : ByteView();
    }

private:
    const Bytes& _file;
    std::uint64_t _size;
    int _calls = 0;
};

TEST(DlfReaderTest, AFileThatBecomesShorterEndsThere)
{
    const Bytes file = joined(items(100));
    for (std::uint64_t size = 0; size < file.size(); size += 7) {
        DlfReader reader(std::make_shared<ShrinkingSource>(file, size));
        std::size_t found = 0;
        while (reader.next())
            ++found;
        EXPECT_GE(found, 19U);
        EXPECT_LT(found, 100U);
        EXPECT_TRUE(reader.isAtEnd());
    }
}

TEST(DlfReaderTest, RecordingOneByteShortLosesItsLastTwoItems)
{
    Bytes file = recording("lte-drive.dlf");
    const std::vector<Bytes> whole = Reading(file).bytes();
    file.pop_back();
    EXPECT_EQ(Reading(file).bytes(), without(whole, {1104, 1105}));
}

} // namespace
} // namespace orvane

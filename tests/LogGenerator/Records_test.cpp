#include "LogGenerator/Records.h"

#include "LogGenerator/ArrayOutOfBoundsException.h"
#include "LogGenerator/Formats.h"
#include "platform/base/PropertyValue.h"

#include <gmock/gmock.h>
#include <gtest/gtest.h>

namespace orvane
{

namespace
{

using ::testing::ElementsAre;
using ::testing::IsEmpty;

const Bytes kBytes = {9, 10, 11, 12, 13, 14, 15, 16};

constexpr Field kFields[] = {
    bytesField("B", 1, 1, decimal),
    bytesField("A", 0, 1, decimal),
};

std::vector<std::uint64_t> firstBytes(const Records& records, std::size_t wholeBytes)
{
    std::vector<std::uint64_t> bytes;
    forEachWholeRecord(records, wholeBytes, [&](PacketView record) {
        bytes.push_back(record.unsignedAt(0, 1).value_or(0));
    });
    return bytes;
}

} // namespace

TEST(RecordsTest, ARecordStartsAfterTheOnesBefore)
{
    const Records records(PacketView(kBytes), 1, 3, 2);
    EXPECT_EQ(records.count(), 2U);
    EXPECT_EQ(records.at(0).unsignedAt(0, 1), 10U);
    EXPECT_EQ(records.at(1).unsignedAt(0, 1), 13U);
    EXPECT_EQ(records.at(1).size(), 4U); // up to the packet's end
}

TEST(RecordsTest, AnIndexThatIsNotBelowTheCountThrows)
{
    const Records records(PacketView(kBytes), 1, 3, 2);
    EXPECT_THROW(static_cast<void>(records.at(2)), ArrayOutOfBoundsException);
    EXPECT_THROW(static_cast<void>(records.at(SIZE_MAX)), ArrayOutOfBoundsException);
    EXPECT_THROW(static_cast<void>(Records(PacketView(kBytes), 0, 1, 0).at(0)),
                 ArrayOutOfBoundsException);
}

TEST(RecordsTest, ARecordPastTheEndIsEmpty)
{
    const Records records(PacketView(kBytes), 1, 3, 255);
    EXPECT_EQ(records.at(3).size(), 0U);
    EXPECT_EQ(records.at(254).size(), 0U);
}

TEST(RecordsTest, TheWalkStopsAtTheFirstRecordThatIsNotWhole)
{
    const Records records(PacketView(kBytes), 0, 3, 255);
    EXPECT_THAT(firstBytes(records, 1), ElementsAre(9, 12, 15));
    EXPECT_THAT(firstBytes(records, 2), ElementsAre(9, 12, 15));
    EXPECT_THAT(firstBytes(records, 3), ElementsAre(9, 12));
    EXPECT_THAT(firstBytes(records, 9), IsEmpty());
}

TEST(RecordsTest, TheWalkStopsAtTheCount)
{
    EXPECT_THAT(firstBytes(Records(PacketView(kBytes), 0, 1, 2), 1), ElementsAre(9, 10));
    EXPECT_THAT(firstBytes(Records(PacketView(kBytes), 0, 1, 0), 1), IsEmpty());
}

TEST(RecordsTest, ARecordCanSayItselfHowManyBytesItNeeds)
{
    const Records records(PacketView(kBytes), 0, 2, 255);
    std::vector<std::size_t> sizes;
    // Each needs as many bytes as its first one is above 8: 1, 3, 5, 7.
    forEachWholeRecord(
        records, [](PacketView record) { return record.unsignedAt(0, 1).value_or(9) - 8; },
        [&](PacketView record) { sizes.push_back(record.size()); });
    EXPECT_THAT(sizes, ElementsAre(8, 6));
}

TEST(RecordsTest, EachWholeRecordBecomesADictionary)
{
    const std::vector<PropertyValue> rows =
        recordRows(Records(PacketView(kBytes), 1, 3, 3), kFields);
    ASSERT_EQ(rows.size(), 2U);
    EXPECT_EQ(rows[0].description(), "{B = 11; A = 10}");
    EXPECT_EQ(rows[1].description(), "{B = 14; A = 13}");
}

} // namespace orvane

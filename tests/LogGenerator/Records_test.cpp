#include "LogGenerator/Records.h"

#include "LogGenerator/ArrayOutOfBoundsException.h"
#include "LogGenerator/Formats.h"
#include "LogGenerator/MessageTime.h"
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

namespace
{

constexpr Field kTwoRows[] = {
    bytesField("A", 0, 1, decimal),
    bytesField("B", 1, 1, decimal),
};

std::vector<PropertyValue> listOf(ListElements& elements, std::initializer_list<Bytes> records)
{
    for (const Bytes& record : records)
        elements.add(PacketView(record), kTwoRows);
    return elements.take();
}

} // namespace

TEST(ListElementsTest, AnElementOfTheSameRowsIsChangedInPlace)
{
    ListElements elements;
    std::vector<PropertyValue> list = listOf(elements, {
                                                           {1, 2},
                                                           {3, 4}
    });
    const PropertyDictionary* first = list[0].asDictionary();
    elements.begin(std::move(list));
    list = listOf(elements, {
                                {5, 6}
    });
    ASSERT_EQ(list.size(), 1U);
    EXPECT_EQ(list[0].asDictionary(), first);
    EXPECT_EQ(list[0].description(), "{A = 5; B = 6}");
    elements.begin(std::move(list));
    list = listOf(elements, {
                                {7, 8},
                                {9, 0}
    });
    EXPECT_EQ(PropertyValue::arrayOf({list[0], list[1]}).description(),
              "({A = 7; B = 8}, {A = 9; B = 0})");
}

TEST(ListElementsTest, AnElementThatSomebodyHoldsStaysAsItIs)
{
    ListElements elements;
    std::vector<PropertyValue> list = listOf(elements, {
                                                           {1, 2}
    });
    const PropertyValue held = list[0];
    elements.begin(std::move(list));
    list = listOf(elements, {
                                {3, 4}
    });
    EXPECT_EQ(held.description(), "{A = 1; B = 2}");
    EXPECT_EQ(list[0].description(), "{A = 3; B = 4}");
}

TEST(ListElementsTest, AnElementOfOtherRowsIsMadeAnew)
{
    ListElements elements({
        PropertyValue::dictionaryOf({{"A", "1"}, {"C", "2"}}
        ), "text",
        PropertyValue::newDictionary()
    });
    const std::vector<PropertyValue> list = listOf(elements, {
                                                                 {1,  2},
                                                                 {3,  4},
                                                                 {5 },
                                                                 {6, 7 }
    });
    ASSERT_EQ(list.size(), 4U);
    EXPECT_EQ(list[0].description(), "{A = 1; B = 2}");
    EXPECT_EQ(list[1].description(), "{A = 3; B = 4}");
    EXPECT_EQ(list[2].description(), "{A = 5}");
    EXPECT_EQ(list[3].description(), "{A = 6; B = 7}");
}

TEST(ListElementsTest, ReadingsCarryTheTimeOfTheirMessage)
{
    ListElements elements;
    EXPECT_EQ(listOf(elements,
                     {
                         Bytes{1, 2}
    })[0]["A"]
                  .asReading()
                  ->time,
              kNoReadingTime);
    std::vector<PropertyValue> list;
    {
        const MessageTime time(1000);
        list = listOf(elements, {
                                    Bytes{1, 2}
        });
    }
    EXPECT_EQ(list[0]["A"].asReading()->time, 1000);
    elements.begin(std::move(list));
    const MessageTime time(2000);
    EXPECT_EQ(listOf(elements,
                     {
                         Bytes{1, 2}
    })[0]["B"]
                  .asReading()
                  ->time,
              2000);
}

TEST(RewriteListRowTest, ChangesTheArrayUnlessSomebodyHoldsIt)
{
    PropertyDictionary rows;
    const auto fill = [](std::uint8_t byte) {
        return [byte](ListElements& elements) {
            elements.add(PacketView(Bytes{byte, byte}), kTwoRows);
        };
    };
    rewriteListRow(&rows, "List", fill(1));
    const PropertyDictionary* element = (*rows["List"].asArray())[0].asDictionary();
    rewriteListRow(&rows, "List", fill(2));
    EXPECT_EQ((*rows["List"].asArray())[0].asDictionary(), element);
    const PropertyValue held = rows["List"];
    rewriteListRow(&rows, "List", fill(3));
    EXPECT_EQ(held.description(), "({A = 2; B = 2})");
    EXPECT_EQ(rows["List"].description(), "({A = 3; B = 3})");
    rewriteListRow(nullptr, "List", fill(4));
}

} // namespace orvane

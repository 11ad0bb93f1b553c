#include "LogGenerator/Field.h"

#include "LogGenerator/Formats.h"
#include "platform/base/PropertyValue.h"

#include <gtest/gtest.h>

namespace orvane
{

namespace
{

RowText onlyOdd(std::int64_t raw) { return raw % 2 != 0 ? decimal(raw) : std::nullopt; }
constexpr Format kOnlyOdd(onlyOdd);

constexpr Field kFields[] = {
    bytesField("Second", 1, 1, decimal),
    bytesField("First", 0, 1, decimal),
    bytesField("Odd", 2, 1, kOnlyOdd),
    bytesField("Word", 2, 2, decimal),
};
static_assert(bytesRead(kFields) == 4);
static_assert(bytesRead({}) == 0);
static_assert(bitsField("", 3, 0, 8, decimal).end() == 4);
static_assert(bitsField("", 3, 1, 8, decimal).end() == 5);
static_assert(bitsField("", 3, 7, 32, decimal).end() == 8);

std::int64_t valueOf(const Field& field, const Bytes& bytes)
{
    return field.valueIn(PacketView(bytes)).value_or(-999999);
}

} // namespace

TEST(PacketFieldTest, ReadsUnsignedUnlessToldOtherwise)
{
    const Bytes bytes = {0xFE, 0xFF, 0xFF, 0xFF};
    EXPECT_EQ(valueOf(bytesField("", 0, 1, decimal), bytes), 254);
    EXPECT_EQ(valueOf(bytesField("", 0, 2, decimal), bytes), 65534);
    EXPECT_EQ(valueOf(bytesField("", 0, 4, decimal), bytes), 4294967294);
}

TEST(PacketFieldTest, ReadsSignedFieldsInTwosComplement)
{
    const Bytes bytes = {0xFE, 0xFF, 0xFF, 0x7F};
    EXPECT_EQ(valueOf(bytesField("", 0, 1, decimal, Coding::Signed), bytes), -2);
    EXPECT_EQ(valueOf(bytesField("", 0, 2, decimal, Coding::Signed), bytes), -2);
    EXPECT_EQ(valueOf(bytesField("", 0, 4, decimal, Coding::Signed), bytes), 2147483646);
    EXPECT_EQ(valueOf(bytesField("", 3, 1, decimal, Coding::Signed), bytes), 127);
    const Bytes lowest = {0x00, 0x00, 0x00, 0x80};
    EXPECT_EQ(valueOf(bytesField("", 0, 4, decimal, Coding::Signed), lowest), -2147483648LL);
}

TEST(PacketFieldTest, ReadsBigEndianFields)
{
    const Bytes bytes = {0x12, 0x34, 0x56, 0xF8};
    EXPECT_EQ(valueOf(bytesField("", 0, 2, decimal, Coding::BigEndian), bytes), 4660);
    EXPECT_EQ(valueOf(bytesField("", 0, 4, decimal, Coding::BigEndian), bytes), 0x123456F8);
    EXPECT_EQ(valueOf(bytesField("", 3, 1, decimal, Coding::BigEndian), bytes), 0xF8);
}

TEST(PacketFieldTest, ReadsBitsAcrossBytes)
{
    const Bytes bytes = {0x80, 0x01};
    EXPECT_EQ(valueOf(bitsField("", 0, 7, 2, decimal), bytes), 3);
    EXPECT_EQ(valueOf(bitsField("", 0, 6, 4, decimal), bytes), 6);
}

TEST(PacketFieldTest, AFieldThatThePacketCutsOffIsNotThere)
{
    const Bytes bytes = {1, 2};
    EXPECT_EQ(bytesField("", 1, 2, decimal).valueIn(PacketView(bytes)), std::nullopt);
    EXPECT_EQ(bitsField("", 1, 4, 5, decimal).valueIn(PacketView(bytes)), std::nullopt);
    EXPECT_EQ(bytesField("", 65535, 4, decimal).valueIn(PacketView(bytes)), std::nullopt);
}

TEST(PacketFieldTest, RowsAreWrittenInTheTablesOrder)
{
    PropertyDictionary rows;
    writeRows(&rows, PacketView(Bytes{1, 2, 3, 4}), kFields);
    EXPECT_EQ(PropertyValue(std::make_shared<PropertyDictionary>(rows)).description(),
              "{Second = 2; First = 1; Odd = 3; Word = 1027}");
}

TEST(PacketFieldTest, ARowBeyondThePacketsEndIsLeftAndTheOthersAreWritten)
{
    PropertyDictionary rows;
    rows.set("Word", "earlier");
    writeRows(&rows, PacketView(Bytes{1, 2, 3}), kFields);
    EXPECT_EQ(rows["Word"], PropertyValue("earlier"));
    EXPECT_EQ(rows["Odd"], PropertyValue("3"));
}

TEST(PacketFieldTest, AFormatThatGivesNothingLeavesItsRow)
{
    PropertyDictionary rows;
    writeRows(&rows, PacketView(Bytes{1, 2, 4, 0}), kFields);
    EXPECT_FALSE(rows.contains("Odd"));
    EXPECT_EQ(rows["Word"], PropertyValue("4"));
}

TEST(PacketFieldTest, WithoutRowsNothingIsWritten)
{
    writeRows(nullptr, PacketView(Bytes{1, 2, 3, 4}), kFields);
    setRow(nullptr, "Row", "text");
    setListRow(nullptr, "Row", {"text"});
}

TEST(PacketFieldTest, ARowReplacesWhateverStoodThere)
{
    PropertyDictionary rows;
    rows.set("First", PropertyValue::newArray());
    rows.set("Second", PropertyValue::integer(7));
    writeRows(&rows, PacketView(Bytes{1, 2, 3, 4}), kFields);
    EXPECT_EQ(rows["First"], PropertyValue("1"));
    EXPECT_EQ(rows["Second"], PropertyValue("2"));
    EXPECT_EQ(rows.begin()->first, "First"); // at its place
}

TEST(PacketFieldTest, TextsTakenFromARowDoNotChangeWithIt)
{
    PropertyDictionary rows;
    setRow(&rows, "Row", "a text that is too long to be kept inside of a string");
    const PropertyValue taken = rows["Row"];
    setRow(&rows, "Row", "another");
    EXPECT_EQ(taken, PropertyValue("a text that is too long to be kept inside of a string"));
}

TEST(PacketFieldTest, AListRowIsANewArrayEachTime)
{
    PropertyDictionary rows;
    setListRow(&rows, "List", {"a", "b"});
    const PropertyValue first = rows["List"];
    setListRow(&rows, "List", {});
    EXPECT_EQ(first, PropertyValue::arrayOf({"a", "b"}));
    EXPECT_EQ(rows["List"], PropertyValue::newArray());
}

} // namespace orvane

#include "platform/plist/PropertyListBinaryReader.h"

#include "platform/base/PropertyValue.h"
#include "support/PropertyListBytes.h"

#include <cmath>
#include <gtest/gtest.h>
#include <limits>

namespace orvane
{
namespace
{

// Offset of the first object.
constexpr std::size_t kFirst = 8;

std::string at(std::size_t offset) { return " at byte " + std::to_string(offset); }

void expectFault(const BinaryListBuilder& list, const std::string& error)
{
    const PropertyListResult result = list.read();
    EXPECT_TRUE(result.value.isAbsent()) << error;
    EXPECT_EQ(result.error, error);
}

void expectFault(const Bytes& list, const std::string& error)
{
    const PropertyListResult result = readPropertyList(list);
    EXPECT_TRUE(result.value.isAbsent()) << error;
    EXPECT_EQ(result.error, error);
}

// The value of a list whose only object has these bytes.
PropertyListResult readObject(const Bytes& object)
{
    BinaryListBuilder list;
    list.raw(object);
    return list.read();
}

TEST(PropertyListBinaryReaderTest, IntegersOfEveryWidthAreRead)
{
    // Integers of up to 4 bytes have no sign.
    struct Case {
        const char* object;
        std::int64_t number;
    };
    for (const auto& [object, number] : {
             Case{"10 00",                                              0                 },
             Case{"10 7F",                                              127               },
             Case{"10 FF",                                              255               },
             Case{"11 12 34",                                           0x1234            },
             Case{"11 FF FF",                                           65535             },
             Case{"12 12 34 56 78",                                     0x12345678        },
             Case{"12 FF FF FF FF",                                     4294967295        },
             Case{"13 12 34 56 78 9A BC DE F0",                         0x123456789ABCDEF0},
             Case{"13 FF FF FF FF FF FF FF FE",                         -2                },
             Case{"13 80 00 00 00 00 00 00 00",                         INT64_MIN         },
             Case{"14 00 00 00 00 00 00 00 00 7F FF FF FF FF FF FF FF", INT64_MAX         },
             Case{"14 FF FF FF FF FF FF FF FF 80 00 00 00 00 00 00 00", INT64_MIN         },
    })
        EXPECT_EQ(readObject(hexBytes(object)).value, PropertyValue::integer(number)) << number;
}

TEST(PropertyListBinaryReaderTest, IntegersBeyond64SignedBitsKeepTheirDigits)
{
    struct Case {
        const char* object;
        const char* digits;
    };
    for (const auto& [object, digits] : {
             Case{"14 00 00 00 00 00 00 00 00 80 00 00 00 00 00 00 00", "9223372036854775808"  },
             Case{"14 00 00 00 00 00 00 00 00 FF FF FF FF FF FF FF FF", "18446744073709551615" },
             Case{"14 00 00 00 00 00 00 00 01 00 00 00 00 00 00 00 00", "18446744073709551616" },
             Case{"14 80 00 00 00 00 00 00 00 00 00 00 00 00 00 00 00",
                  "-170141183460469231731687303715884105728"                                   },
             Case{"14 7F FF FF FF FF FF FF FF FF FF FF FF FF FF FF FF",
                  "170141183460469231731687303715884105727"                                    },
             Case{"14 FF FF FF FF FF FF FF FF 7F FF FF FF FF FF FF FF", "-9223372036854775809" },
             Case{"14 FF FF FF FF FF FF FF FE 80 00 00 00 00 00 00 00", "-27670116110564327424"},
    })
        EXPECT_EQ(readObject(hexBytes(object)).value, PropertyValue::largeNumber({digits, false}));
}

TEST(PropertyListBinaryReaderTest, ALargeNumberCostsNoOtherValueOfTheList)
{
    BinaryListBuilder list;
    const std::size_t unread = list.ascii("Unread");
    const std::size_t cell = list.ascii("Cell");
    const std::size_t large =
        list.raw(hexBytes("14 00 00 00 00 00 00 00 01 00 00 00 00 00 00 00 00"));
    const std::size_t seven = list.integer(7, 1);
    list.dictionary({unread, cell}, {large, seven});
    const PropertyListResult result = list.read();
    EXPECT_EQ(result.error, "");
    EXPECT_EQ(result.value.description(), "{Unread = 18446744073709551616; Cell = 7}");
}

TEST(PropertyListBinaryReaderTest, RealsBooleansAndDatesAreRead)
{
    const double infinity = std::numeric_limits<double>::infinity();
    EXPECT_EQ(readObject(hexBytes("22 3F C0 00 00")).value, PropertyValue::real(1.5));
    EXPECT_EQ(readObject(hexBytes("22 FF 80 00 00")).value, PropertyValue::real(-infinity));
    EXPECT_EQ(readObject(hexBytes("08")).value, PropertyValue::boolean(false));
    EXPECT_EQ(readObject(hexBytes("09")).value, PropertyValue::boolean(true));
    for (const double number : {0.0, -0.1, 1e300, infinity, std::nan("")}) {
        BinaryListBuilder real;
        real.real(number);
        EXPECT_EQ(real.read().value, PropertyValue::real(number));
    }
    // Seconds since 2001-01-01 00:00:00 UTC.
    for (const double seconds : {0.0, 816948000.0, -978307200.0, 0.25}) {
        BinaryListBuilder date;
        date.date(seconds);
        EXPECT_EQ(date.read().value, PropertyValue::date({978307200 + seconds}));
    }
}

TEST(PropertyListBinaryReaderTest, DataAndTextsOfEveryLengthAreRead)
{
    // A count below 15 is in the marker, a larger one after it.
    for (const unsigned length : {0U, 1U, 14U, 15U, 16U, 255U, 256U, 70000U}) {
        BinaryListBuilder data(4);
        data.data(Bytes(length, 0xA5));
        EXPECT_EQ(data.read().value, PropertyValue::data(Bytes(length, 0xA5)));
        BinaryListBuilder ascii(4);
        ascii.ascii(std::string(length, 'x'));
        EXPECT_EQ(ascii.read().value, PropertyValue(std::string(length, 'x')));
        BinaryListBuilder utf16(4);
        utf16.utf16(std::u16string(length, u'\u00E9'));
        std::string text;
        for (std::size_t i = 0; i < length; ++i)
            text += "\xC3\xA9";
        EXPECT_EQ(utf16.read().value, PropertyValue(text));
    }
}

TEST(PropertyListBinaryReaderTest, CountsOfEveryWidthAreRead)
{
    for (const char* object : {"5F 10 02 6F 6B", "5F 11 00 02 6F 6B", "5F 12 00 00 00 02 6F 6B",
                               "5F 13 00 00 00 00 00 00 00 02 6F 6B"})
        EXPECT_EQ(readObject(hexBytes(object)).value, PropertyValue("ok")) << object;
}

TEST(PropertyListBinaryReaderTest, TextBeyond16BitsAndControlCharactersAreRead)
{
    BinaryListBuilder list;
    list.utf16(u"\U0001F4E1\u2014a");
    EXPECT_EQ(list.read().value, PropertyValue("\xF0\x9F\x93\xA1\xE2\x80\x94"
                                               "a"));
    EXPECT_EQ(readObject(hexBytes("53 61 00 01")).value, PropertyValue(std::string("a\0\1", 3)));
}

TEST(PropertyListBinaryReaderTest, MalformedTextsAreRefusedWhereTheyAre)
{
    EXPECT_EQ(readObject(hexBytes("53 61 62 80")).error,
              "an ASCII text holds another byte" + at(kFirst + 3));
}

TEST(PropertyListBinaryReaderTest, ALoneSurrogateIsShownAsReplacementCharacter)
{
    // An operator's name cut in the middle of a character.
    EXPECT_EQ(readObject(hexBytes("62 00 61 D8 00")).value, PropertyValue("a\uFFFD"));
    EXPECT_EQ(readObject(hexBytes("62 D8 00 00 61")).value, PropertyValue("\uFFFDa"));
    EXPECT_EQ(readObject(hexBytes("62 00 61 DC 00")).value, PropertyValue("a\uFFFD"));
}

TEST(PropertyListBinaryReaderTest, ContainersKeepTheirOrder)
{
    for (const unsigned width : {1U, 2U, 3U, 4U, 5U, 6U, 7U, 8U}) {
        BinaryListBuilder list(width, width);
        const std::size_t b = list.ascii("b");
        const std::size_t a = list.utf16(u"a");
        const std::size_t empty = list.array({});
        const std::size_t none = list.dictionary({}, {});
        const std::size_t inner = list.dictionary({b, a}, {empty, none});
        list.array({a, inner, b});
        const PropertyListResult result = list.read();
        EXPECT_EQ(result.error, "");
        EXPECT_EQ(result.value.description(), "(a, {b = (); a = {}}, b)") << width;
    }
}

TEST(PropertyListBinaryReaderTest, SetBecomesAnArray)
{
    BinaryListBuilder list;
    const std::size_t a = list.ascii("a");
    const std::size_t one = list.integer(1, 1);
    list.set({one, a});
    EXPECT_EQ(list.read().value, PropertyValue::arrayOf({PropertyValue::integer(1), "a"}));
}

TEST(PropertyListBinaryReaderTest, ManyElementsAreRead)
{
    BinaryListBuilder list(3, 2);
    BinaryListBuilder::References keys;
    BinaryListBuilder::References values;
    for (std::size_t i = 0; i < 1000; ++i) {
        keys.push_back(list.ascii("key " + std::to_string(i)));
        values.push_back(list.integer(static_cast<std::int64_t>(i), 2));
    }
    const std::size_t array = list.array(values);
    const std::size_t dictionary = list.dictionary(keys, values);
    list.array({array, dictionary});
    const PropertyListResult result = list.read();
    ASSERT_EQ(result.error, "");
    const PropertyArray& root = *result.value.asArray();
    ASSERT_EQ(root[0].asArray()->size(), 1000U);
    EXPECT_EQ((*root[0].asArray())[999], PropertyValue::integer(999));
    EXPECT_EQ(root[1]["key 999"], PropertyValue::integer(999));
    EXPECT_EQ(root[1].asDictionary()->begin()->first, "key 0");
}

TEST(PropertyListBinaryReaderTest, KeyThatOccursTwiceHasTheLaterValueAtTheEarlierPlace)
{
    BinaryListBuilder list;
    const std::size_t a = list.ascii("a");
    const std::size_t b = list.ascii("b");
    const std::size_t alsoA = list.utf16(u"a");
    const std::size_t one = list.integer(1, 1);
    const std::size_t two = list.integer(2, 1);
    const std::size_t three = list.integer(3, 1);
    list.dictionary({a, b, alsoA}, {one, two, three});
    EXPECT_EQ(list.read().value.description(), "{a = 3; b = 2}");
}

TEST(PropertyListBinaryReaderTest, ContainerReferencedTwiceBecomesTwo)
{
    BinaryListBuilder list;
    const std::size_t text = list.ascii("text");
    const std::size_t inner = list.array({text});
    list.array({inner, inner});
    const PropertyValue root = list.read().value;
    ASSERT_EQ(root.description(), "((text), (text))");
    (*root.asArray())[0].asArray()->clear();
    EXPECT_EQ(root.description(), "((), (text))");
}

TEST(PropertyListBinaryReaderTest, ObjectsOfOtherTypesAreRefused)
{
    for (const int marker : {0x00, 0x01, 0x0A, 0x0C, 0x0D, 0x0E, 0x0F, 0x15, 0x1F, 0x20, 0x21, 0x24,
                             0x30, 0x32, 0x34, 0x70, 0x7F, 0x90, 0xB0, 0xBF, 0xE0, 0xF0, 0xFF}) {
        Bytes object = hexBytes("00 00 00 00 00 00 00 00 00");
        object[0] = static_cast<std::uint8_t>(marker);
        EXPECT_EQ(readObject(object).error, "object of an unknown type" + at(kFirst)) << marker;
    }
    EXPECT_EQ(readObject(hexBytes("80 01")).error, "UID objects are not accepted" + at(kFirst));
    EXPECT_EQ(readObject(hexBytes("83 01 02 03 04")).error,
              "UID objects are not accepted" + at(kFirst));

    // Even if nothing refers to them.
    BinaryListBuilder list;
    list.raw(hexBytes("00"));
    list.boolean(true);
    expectFault(list, "object of an unknown type" + at(kFirst));
}

TEST(PropertyListBinaryReaderTest, KeyThatIsNoStringIsRefused)
{
    BinaryListBuilder list;
    const std::size_t key = list.ascii("key");
    const std::size_t one = list.integer(1, 1);
    const std::size_t inner = list.array({});
    for (const std::size_t wrong : {one, inner}) {
        BinaryListBuilder each = list;
        const std::size_t root = each.dictionary({key, wrong}, {one, one});
        expectFault(each, "reference to a dictionary key that is not a string" +
                              at(each.offsets[root] + 2));
    }
}

TEST(PropertyListBinaryReaderTest, ReferenceToNoObjectIsRefused)
{
    BinaryListBuilder array;
    array.boolean(true);
    array.array({0, 2});
    expectFault(array, "reference to no object" + at(kFirst + 1 + 2));

    BinaryListBuilder keys;
    keys.ascii("k");
    keys.dictionary({255}, {0});
    expectFault(keys, "reference to no object" + at(kFirst + 2 + 1));

    BinaryListBuilder values(1, 8);
    values.ascii("k");
    values.dictionary({0}, {SIZE_MAX});
    expectFault(values, "reference to no object" + at(kFirst + 2 + 9));
}

TEST(PropertyListBinaryReaderTest, ReferenceCyclesAreRefused)
{
    BinaryListBuilder itself;
    itself.array({0});
    expectFault(itself, "reference cycle through the object" + at(kFirst));

    BinaryListBuilder pair;
    pair.ascii("k");
    pair.array({2});
    pair.dictionary({0}, {1});
    expectFault(pair, "reference cycle through the object" + at(kFirst + 4));

    // Far apart, after valid elements.
    BinaryListBuilder ring;
    ring.array({50, 50});
    for (std::size_t i = 1; i <= 50; ++i)
        ring.array({i - 1});
    expectFault(ring, "reference cycle through the object" + at(ring.offsets[50]));
}

TEST(PropertyListBinaryReaderTest, OverlappingObjectsAreRefused)
{
    // "Qb" as a text, and inside it bytes that are also a valid text.
    BinaryListBuilder inside;
    inside.raw(hexBytes("52 51 62"));
    inside.offsets.push_back(kFirst + 1);
    expectFault(inside, "overlapping objects" + at(kFirst + 1));

    // The same object twice in the table.
    BinaryListBuilder same;
    same.raw(hexBytes("52 51 62"));
    same.offsets.push_back(kFirst);
    expectFault(same, "overlapping objects" + at(kFirst));

    // More objects than bytes. That is found without reading offsets, so the error names the count,
    // at the trailer's ninth byte.
    BinaryListBuilder crowded;
    crowded.boolean(true);
    crowded.offsets.push_back(kFirst);
    expectFault(crowded, "more objects than bytes for them" + at(kFirst + 1 + 2 + 8));

    // The later object first in the table, and nothing refers to the earlier.
    BinaryListBuilder reversed;
    reversed.raw(hexBytes("52 51 09"));
    reversed.offsets = {kFirst + 2, kFirst};
    expectFault(reversed, "overlapping objects" + at(kFirst + 2));

    // An array over the object that it refers to.
    BinaryListBuilder array;
    array.raw(hexBytes("A2 09 00"));
    array.offsets = {kFirst + 1, kFirst};
    expectFault(array, "overlapping objects" + at(kFirst + 1));
}

TEST(PropertyListBinaryReaderTest, ObjectsMayStandInAnyOrderAndApart)
{
    BinaryListBuilder list;
    list.raw(hexBytes("A2 01 00 EE EE 09 08"));
    list.offsets = {kFirst + 5, kFirst + 6, kFirst};
    EXPECT_EQ(list.read().value.description(), "(false, true)");
}

TEST(PropertyListBinaryReaderTest, ObjectsThatReachBeyondTheObjectsAreRefused)
{
    const std::string error = "object beyond the end of the objects" + at(kFirst);
    for (const char* object : {
             "10",
             "11 00",
             "12 00 00 00",
             "13 00 00 00 00 00 00 00",
             "14 00 00 00 00 00 00 00 00 00 00 00 00 00 00 00",
             "22 00 00 00",
             "23 00 00 00 00 00 00 00",
             "33 00 00 00 00 00 00 00",
             "42 00",
             "51",
             "61 00",
             "A1",
             "C1",
             "D1 00",
             "4F",
             "5F 10",
             "5F 10 01",
             "6F 11 00 01 00",
             "5F 12 FF FF FF FF",
             "5F 13 FF FF FF FF FF FF FF FF",
             // Counts that overflow when multiplied by the size of what they count.
             "6F 13 80 00 00 00 00 00 00 00",
             "AF 13 80 00 00 00 00 00 00 00",
             "DF 13 80 00 00 00 00 00 00 00",
         })
        EXPECT_EQ(readObject(hexBytes(object)).error, error) << object;
    EXPECT_EQ(readObject(hexBytes("5F 51 61")).error, "count is not an integer" + at(kFirst + 1));
    EXPECT_EQ(readObject(hexBytes("5F 14 00 00")).error,
              "count is not an integer" + at(kFirst + 1));
}

TEST(PropertyListBinaryReaderTest, ObjectOffsetsOutOfRangeAreRefused)
{
    // In the magic, at the table, in the trailer, beyond the end.
    for (const unsigned offset : {0U, 7U, 10U, 11U, 13U, 40U, 255U}) {
        BinaryListBuilder list;
        list.boolean(true);
        list.boolean(false);
        list.offsets[1] = offset;
        expectFault(list, "object offset out of range" + at(kFirst + 2 + 1));
    }
    BinaryListBuilder wide(8);
    wide.boolean(true);
    wide.offsets[0] = SIZE_MAX;
    expectFault(wide, "object offset out of range" + at(kFirst + 1));
}

TEST(PropertyListBinaryReaderTest, WrongTrailersAreRefused)
{
    BinaryListBuilder list;
    list.ascii("a");
    list.array({0, 0});
    const Bytes whole = list.bytes();
    ASSERT_EQ(readPropertyList(whole).value.description(), "(a, a)");
    const std::size_t trailer = whole.size() - 32;

    const auto expectFaultWith = [&](std::size_t field, std::size_t width, std::uint64_t number,
                                     const char* error) {
        Bytes changed(whole.begin(), whole.begin() + static_cast<std::ptrdiff_t>(trailer + field));
        BinaryListBuilder::append(changed, number, width);
        changed.insert(changed.end(), whole.begin() + static_cast<std::ptrdiff_t>(changed.size()),
                       whole.end());
        expectFault(changed, error + at(trailer + field));
    };
    for (const unsigned width : {0U, 9U, 16U, 255U}) {
        expectFaultWith(6, 1, width, "offset width out of range");
        expectFaultWith(7, 1, width, "reference width out of range");
    }
    for (const std::uint64_t count :
         {std::uint64_t{0}, std::uint64_t{1}, std::uint64_t{3}, std::uint64_t{1} << 32, UINT64_MAX})
        expectFaultWith(8, 8, count, "number of objects does not fit the offset table");
    for (const std::uint64_t root : {std::uint64_t{2}, std::uint64_t{1} << 32, UINT64_MAX})
        expectFaultWith(16, 8, root, "root object out of range");
    for (const std::uint64_t table :
         {std::uint64_t{0}, std::uint64_t{7}, std::uint64_t{trailer + 1}, UINT64_MAX})
        expectFaultWith(24, 8, table, "offset table out of range");

    // A table that is not a whole number of entries.
    Bytes odd = whole;
    odd[trailer + 6] = 3;
    odd[trailer + 15] = 0;
    expectFault(odd, "number of objects does not fit the offset table" + at(trailer + 8));
    // A list without objects has no root.
    Bytes none = bytesOf("bplist00");
    none.insert(none.end(), {0, 0, 0, 0, 0, 0, 1, 1});
    for (const unsigned number : {0U, 0U, 8U})
        BinaryListBuilder::append(none, number, 8);
    expectFault(none, "root object out of range" + at(kFirst + 16));
}

// A list with objects of every type.
BinaryListBuilder variedList()
{
    BinaryListBuilder list(2, 1);
    const std::size_t key = list.ascii("key");
    const std::size_t longKey = list.utf16(u"a key with more than 15 characters");
    const std::size_t number = list.integer(-7, 16);
    const std::size_t real = list.real(0.5);
    const std::size_t date = list.date(0);
    const std::size_t data = list.data({1, 2, 3});
    const std::size_t flag = list.boolean(true);
    const std::size_t array = list.array({number, real, date, data, flag});
    list.dictionary({key, longKey}, {array, flag});
    return list;
}

TEST(PropertyListBinaryReaderTest, EveryTruncationIsRefusedWithAPosition)
{
    const Bytes whole = variedList().bytes();
    ASSERT_EQ(readPropertyList(whole).error, "");
    for (std::size_t length = 8; length < whole.size(); ++length) {
        const PropertyListResult result = readPropertyList(
            Bytes(whole.begin(), whole.begin() + static_cast<std::ptrdiff_t>(length)));
        EXPECT_TRUE(result.value.isAbsent()) << length;
        if (length < 40) {
            EXPECT_EQ(result.error, "binary property list cut short" + at(length));
            continue;
        }
        const std::size_t trailer = length - 32;
        EXPECT_TRUE(result.error == "offset width out of range" + at(trailer + 6) ||
                    result.error == "reference width out of range" + at(trailer + 7) ||
                    result.error ==
                        "number of objects does not fit the offset table" + at(trailer + 8) ||
                    result.error == "offset table out of range" + at(trailer + 24))
            << length << ": " << result.error;
    }
}

TEST(PropertyListBinaryReaderTest, EveryChangedByteIsReadOrRefusedWithAReason)
{
    const Bytes whole = variedList().bytes();
    for (std::size_t i = 0; i < whole.size(); ++i)
        for (const int flipped : kFlippedBits) {
            Bytes changed = whole;
            changed[i] = static_cast<std::uint8_t>(changed[i] ^ flipped);
            const PropertyListResult result = readPropertyList(changed);
            ASSERT_EQ(result.value.isAbsent(), !result.error.empty()) << i << ' ' << flipped;
        }
}

// `levels` arrays, or dictionaries, one in another.
BinaryListBuilder nested(std::size_t levels, bool inDictionaries)
{
    BinaryListBuilder list(2, 2);
    const std::size_t key = list.ascii("k");
    std::size_t innermost = key;
    for (std::size_t i = 0; i < levels; ++i)
        innermost = inDictionaries ? list.dictionary({key}, {innermost}) : list.array({innermost});
    return list;
}

TEST(PropertyListBinaryReaderTest, NestingIsReadUpToTheLimit)
{
    for (const bool inDictionaries : {false, true}) {
        const PropertyListResult deepest = nested(kPropertyListDepthLimit, inDictionaries).read();
        EXPECT_EQ(deepest.error, "");
        EXPECT_TRUE(writeXmlPropertyList(deepest.value));
        // The innermost container is the first object after the key.
        expectFault(nested(kPropertyListDepthLimit + 1, inDictionaries),
                    "nested deeper than 512 levels" + at(kFirst + 2));
        EXPECT_EQ(nested(5000, inDictionaries).read().error.find("nested deeper than 512 levels"),
                  0U);
    }
}

TEST(PropertyListBinaryReaderTest, ListThatExpandsWithoutBoundIsRefused)
{
    // Each array holds the one before ten times: a few hundred bytes stand for 10^30 texts.
    BinaryListBuilder list(2);
    std::size_t last = list.ascii("text");
    for (int i = 0; i < 30; ++i)
        last = list.array(BinaryListBuilder::References(10, last));
    const PropertyListResult result = list.read();
    EXPECT_TRUE(result.value.isAbsent());
    EXPECT_EQ(
        result.error.find("too many values for the length of the list, with the object at byte "),
        0U)
        << result.error;

    // One long text many times.
    BinaryListBuilder texts(3);
    const std::size_t text = texts.ascii(std::string(60000, 'x'));
    texts.array(BinaryListBuilder::References(1000, text));
    expectFault(texts, "too many values for the length of the list, with the object" + at(kFirst));
}

TEST(PropertyListBinaryReaderTest, SharingThatRealWritersMakeIsRead)
{
    // Few distinct objects, each referenced often: the work of a writer that stores equal scalars
    // once.
    BinaryListBuilder list(3, 2);
    BinaryListBuilder::References keys;
    BinaryListBuilder::References values;
    for (const char* name :
         {"RadioAccessTechnology", "CellType", "MobileCountryCode", "Frequency"}) {
        keys.push_back(list.ascii(std::string("kTelephonyServerCellMonitor") + name));
        values.push_back(list.ascii(std::string("kTelephonyServerCellMonitorValueOf") + name));
    }
    BinaryListBuilder::References cells;
    for (int i = 0; i < 20000; ++i)
        cells.push_back(list.dictionary(keys, values));
    const std::size_t flag = list.boolean(true);
    const std::size_t flags = list.array(BinaryListBuilder::References(200000, flag));
    const std::size_t array = list.array(cells);
    list.array({array, flags});
    const PropertyListResult result = list.read();
    ASSERT_EQ(result.error, "");
    EXPECT_EQ((*result.value.asArray())[0].asArray()->size(), 20000U);
    EXPECT_EQ((*result.value.asArray())[1].asArray()->size(), 200000U);
}

} // namespace
} // namespace orvane

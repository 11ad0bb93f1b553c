// The encodings of XML property lists.

#include "platform/base/PropertyValue.h"
#include "support/PropertyListBytes.h"

#include <gtest/gtest.h>

namespace orvane
{
namespace
{

// A text of ASCII and Latin-1 characters, an em dash and a character beyond 16 bits.
constexpr std::u16string_view kText = u"caf\u00E9 \u2014 \U0001F4E1";
constexpr const char* kTextInUtf8 = "caf\xC3\xA9 \xE2\x80\x94 \xF0\x9F\x93\xA1";

enum class Mark { None, First };

Bytes utf16(std::u16string_view text, std::endian order, Mark mark)
{
    std::u16string whole(text);
    if (mark == Mark::First)
        whole.insert(0, 1, u'\uFEFF');
    Bytes bytes;
    for (const char16_t unit : whole) {
        const auto high = static_cast<std::uint8_t>(unit >> 8);
        const auto low = static_cast<std::uint8_t>(unit & 0xFF);
        bytes.push_back(order == std::endian::big ? high : low);
        bytes.push_back(order == std::endian::big ? low : high);
    }
    return bytes;
}

std::u16string list(std::u16string_view declaration, std::u16string_view text)
{
    return std::u16string(declaration) + u"<plist>\n<string>" + std::u16string(text) +
           u"</string></plist>";
}

TEST(PropertyListXmlEncodingTest, Utf8IsReadWithAndWithoutMarkAndDeclaration)
{
    const std::string body = xmlList("<string>" + std::string(kTextInUtf8) + "</string>");
    for (const char* start :
         {"", "\xEF\xBB\xBF", "<?xml version=\"1.0\"?>",
          "<?xml version=\"1.0\" encoding=\"utf-8\"?>",
          "\xEF\xBB\xBF<?xml version=\"1.0\" encoding=\"UTF-8\" standalone=\"yes\"?>"})
        EXPECT_EQ(readText(start + body).value, PropertyValue(kTextInUtf8)) << start;
}

TEST(PropertyListXmlEncodingTest, Utf16IsReadInBothByteOrders)
{
    for (const std::endian order : {std::endian::big, std::endian::little})
        for (const std::u16string_view declaration :
             {u"", u"<?xml version=\"1.0\" encoding=\"UTF-16\"?>",
              u"<?xml version=\"1.0\" encoding=\"UTF-8\"?>"})
            for (const Mark mark : {Mark::First, Mark::None}) {
                const PropertyListResult result =
                    readPropertyList(utf16(list(declaration, kText), order, mark));
                EXPECT_EQ(result.error, "");
                EXPECT_EQ(result.value, PropertyValue(kTextInUtf8));
            }
}

TEST(PropertyListXmlEncodingTest, EveryTruncationOfUtf16IsRefused)
{
    const Bytes whole = utf16(list(u"", kText), std::endian::little, Mark::First);
    ASSERT_TRUE(readPropertyList(whole).value);
    for (std::size_t length = 2; length < whole.size(); ++length) {
        const auto end = whole.begin() + static_cast<std::ptrdiff_t>(length);
        const PropertyListResult result = readPropertyList(Bytes(whole.begin(), end));
        EXPECT_TRUE(result.value.isAbsent()) << length;
        EXPECT_FALSE(result.error.empty());
    }
}

TEST(PropertyListXmlEncodingTest, ALoneSurrogateInUtf16IsShownAsReplacementCharacter)
{
    const char16_t first[] = {0xD800, u'a', 0};
    const char16_t second[] = {u'a', 0xDC00, 0};
    const char16_t reversed[] = {0xDC00, 0xD800, 0};
    for (const std::endian order : {std::endian::big, std::endian::little}) {
        const auto valueOf = [order](std::u16string_view text) {
            return readPropertyList(utf16(list(u"", text), order, Mark::First)).value;
        };
        EXPECT_EQ(valueOf(first), PropertyValue("\uFFFDa"));
        EXPECT_EQ(valueOf(second), PropertyValue("a\uFFFD"));
        EXPECT_EQ(valueOf(reversed), PropertyValue("\uFFFD\uFFFD"));
    }
}

TEST(PropertyListXmlEncodingTest, PositionsInUtf16CountCharacters)
{
    const std::u16string text =
        u"<plist><array>\n<string>\U0001F4E1\u00E9</string><odd/></array></plist>";
    EXPECT_EQ(readPropertyList(utf16(text, std::endian::big, Mark::First)).error,
              "unexpected element \"odd\" at line 2, column 20");
}

TEST(PropertyListXmlEncodingTest, Latin1IsReadWhereItIsDeclared)
{
    const std::string declaration = "<?xml version=\"1.0\" encoding=\"ISO-8859-1\"?>\n";
    EXPECT_EQ(readText(declaration + xmlList("<string>caf\xE9 \xA3</string>")).value,
              PropertyValue("caf\xC3\xA9 \xC2\xA3"));
    // One byte is one column.
    EXPECT_EQ(readText(declaration + "<plist><array>\n<string>\xE9\xA3</string><odd/>").error,
              "unexpected element \"odd\" at line 3, column 20");
    // Undeclared it is malformed UTF-8.
    EXPECT_EQ(readText(xmlList("<string>caf\xE9 \xA3</string>")).error,
              "not well-formed (invalid token) at line 1, column 33");
}

TEST(PropertyListXmlEncodingTest, OtherEncodingsAreRefusedByName)
{
    EXPECT_EQ(readText("<?xml version=\"1.0\" encoding=\"EBCDIC-X\"?>" + xmlList("<true/>")).error,
              "unknown encoding \"EBCDIC-X\" at line 1, column 31");
    EXPECT_EQ(readText("<?xml version=\"1.0\" encoding=\"UTF-16\"?>" + xmlList("<true/>")).error,
              "encoding specified in XML declaration is incorrect at line 1, column 31");
    EXPECT_EQ(readText("<?xml version=\"1.0\" encoding=\"US-ASCII\"?>" +
                       xmlList("<string>caf\xC3\xA9</string>"))
                  .error,
              "not well-formed (invalid token) at line 1, column 74");
}

TEST(PropertyListXmlEncodingTest, InvalidUtf8IsRefused)
{
    for (const char* text : {"\x80", "\xC0\x80", "\xC3", "\xE0\x80\x80", "\xED\xA0\x80", "\xE2\x82",
                             "\xF0\x80\x80\x80", "\xF4\x90\x80\x80", "\xF8\x88\x80\x80\x80", "\xFF",
                             "\xEF\xBF\xBE", "\xEF\xBF\xBF"}) {
        const PropertyListResult result =
            readText(xmlList("<string>" + std::string(text) + "</string>"));
        EXPECT_TRUE(result.value.isAbsent());
        EXPECT_EQ(result.error, "not well-formed (invalid token) at line 1, column 30");
    }
}

} // namespace
} // namespace orvane

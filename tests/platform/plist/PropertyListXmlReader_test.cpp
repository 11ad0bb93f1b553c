#include "platform/plist/PropertyListXmlReader.h"

#include "platform/base/PropertyValue.h"
#include "support/PropertyListBytes.h"

#include <gtest/gtest.h>

namespace orvane
{
namespace
{

const std::string kDeclaration = "<?xml version=\"1.0\" encoding=\"UTF-8\"?>\n";

void expectFault(const std::string& text, const std::string& error)
{
    const PropertyListResult result = readText(text);
    EXPECT_TRUE(result.value.isAbsent()) << text;
    EXPECT_EQ(result.error, error) << text;
}

// For errors that Expat finds within a declaration. The column is somewhere in it.
void expectFaultOnLine(const std::string& text, const std::string& error)
{
    const PropertyListResult result = readText(text);
    EXPECT_TRUE(result.value.isAbsent()) << text;
    EXPECT_TRUE(result.error.starts_with(error + ", column ")) << text << ": " << result.error;
}

TEST(PropertyListXmlReaderTest, WholeDocumentIsRead)
{
    const PropertyListResult result =
        readText(kDeclaration +
                 R"(<!DOCTYPE plist SYSTEM "http://localhost/list.dtd">
<!-- what a message may look like -->
<plist version="1.0">
  <!-- also here -->
  <dict>
    <key>Name</key><string>ChannelStreaming</string>
    <key>Empty</key><string/>
    <key>Codes</key>
    <array><integer>1</integer><!-- between -->
      <real>2.5</real><?ignored at all?><true/><false></false></array>
    <key>Info</key>
    <dict><key>When</key><date>2026-11-21T10:00:00Z</date><key>What</key><data>AQI=</data></dict>
    <key>None</key><dict/>
  </dict>
</plist>
<!-- and after -->
)");
    EXPECT_EQ(result.error, "");
    EXPECT_EQ(result.value.description(),
              "{Name = ChannelStreaming; Empty = ; Codes = (1, 2.5, true, false); "
              "Info = {When = 2026-11-21 10:00:00 +0000; What = <0102>}; None = {}}");
}

TEST(PropertyListXmlReaderTest, TextsComeAsTheyAre)
{
    struct Case {
        const char* xml;
        std::string text;
    };
    for (const auto& [xml, text] : {
             Case{"  two  spaces  ",           "  two  spaces  "  },
             Case{"line\r\nends\rare\n",       "line\nends\nare\n"},
             Case{"&lt;&gt;&amp;&quot;&apos;", "<>&\"'"           },
             Case{"&#65;&#x20AC;&#13;",        "A\xE2\x82\xAC\r"  },
             Case{"a<!-- comment -->b",        "ab"               },
             Case{"a<![CDATA[<b> & ]]>c",      "a<b> & c"         },
             Case{"a<?ignored?>b",             "ab"               },
    }) {
        EXPECT_EQ(readText(xmlList("<string>" + std::string(xml) + "</string>")).value,
                  PropertyValue(text));
        const std::string dictionary = "<dict><key>" + std::string(xml) + "</key><true/></dict>";
        EXPECT_TRUE(readText(xmlList(dictionary)).value.asDictionary()->contains(text));
    }
}

TEST(PropertyListXmlReaderTest, KeyThatOccursTwiceHasTheLaterValueAtTheEarlierPlace)
{
    const PropertyListResult result =
        readText(xmlList("<dict><key>a</key><string>first</string><key>b</key><true/>"
                         "<key>a</key><array><true/></array></dict>"));
    EXPECT_EQ(result.value.description(), "{a = (true); b = true}");
}

TEST(PropertyListXmlReaderTest, WrongStructureIsRefusedWhereItIs)
{
    expectFault("<html></html>",
                "the root element is \"html\" instead of \"plist\" at line 1, column 1");
    expectFault("\n\n  <dict></dict>",
                "the root element is \"dict\" instead of \"plist\" at line 3, column 3");
    expectFault("<plist></plist>", "no root value at line 1, column 1");
    expectFault(kDeclaration + "<plist/>", "no root value at line 2, column 1");
    expectFault("<plist>\n<true/>\n<true/>\n</plist>",
                "more than one root value at line 3, column 1");
    expectFault("<plist><array/><array/></plist>", "more than one root value at line 1, column 16");
    expectFault("<plist><plist></plist></plist>",
                "unexpected element \"plist\" at line 1, column 8");
    expectFault("<plist><null/></plist>", "unexpected element \"null\" at line 1, column 8");
    expectFault("<plist><String>a</String></plist>",
                "unexpected element \"String\" at line 1, column 8");
    expectFault("<plist><key>a</key></plist>", "a key outside a dictionary at line 1, column 8");
    expectFault("<plist><array><key>a</key></array></plist>",
                "a key outside a dictionary at line 1, column 15");
    expectFault("<plist><dict><true/></dict></plist>",
                "a value without a key at line 1, column 14");
    expectFault("<plist><dict><dict/></dict></plist>",
                "a value without a key at line 1, column 14");
    expectFault("<plist><dict><key>a</key><true/><true/></dict></plist>",
                "a value without a key at line 1, column 33");
    expectFault("<plist><dict><key>a</key><key>b</key><true/></dict></plist>",
                "key \"a\" without a value at line 1, column 26");
    expectFault("<plist><dict>\n<key>a</key>\n</dict></plist>",
                "key \"a\" without a value at line 2, column 1");
    expectFault("<plist><string>a<string>b</string></string></plist>",
                "element \"string\" inside a value that has no elements at line 1, column 17");
    expectFault("<plist><dict><key>a<true/></key></dict></plist>",
                "element \"true\" inside a value that has no elements at line 1, column 20");
    expectFault("<plist><true><unknown/></true></plist>",
                "element \"unknown\" inside a value that has no elements at line 1, column 14");
}

TEST(PropertyListXmlReaderTest, TextOutsideAValueIsRefused)
{
    expectFault("<plist>stray<true/></plist>",
                "text \"stray\" outside a value at line 1, column 8");
    expectFault("<plist><true/>stray</plist>",
                "text \"stray\" outside a value at line 1, column 15");
    expectFault("<plist><array>\n  stray</array></plist>",
                "text \"  stray\" outside a value at line 2, column 1");
    expectFault("<plist><dict><key>a</key>stray<true/></dict></plist>",
                "text \"stray\" outside a value at line 1, column 26");
    expectFault("<plist><true>stray</true></plist>",
                "text \"stray\" outside a value at line 1, column 14");
    expectFault("<plist><false>&#65;</false></plist>",
                "text \"A\" outside a value at line 1, column 15");
    expectFault("<plist><array>\xC2\xA0</array></plist>",
                "text \"\xC2\xA0\" outside a value at line 1, column 15");
    EXPECT_EQ(readText("<plist><true> \t\r\n</true></plist>").value, PropertyValue::boolean(true));
}

TEST(PropertyListXmlReaderTest, MalformedXmlIsRefusedWhereItIs)
{
    expectFault("<plist><string>a</integer></plist>", "mismatched tag at line 1, column 19");
    expectFault("<plist><array></plist>", "mismatched tag at line 1, column 17");
    expectFault("<plist><true/></plist><plist/>",
                "junk after document element at line 1, column 23");
    expectFault("<plist><true/></plist>\ntext", "junk after document element at line 2, column 1");
    expectFault("<plist><string>a & b</string></plist>",
                "not well-formed (invalid token) at line 1, column 19");
    expectFault("<plist><string>\x01</string></plist>",
                "not well-formed (invalid token) at line 1, column 16");
    expectFault("<plist><string>&#1;</string></plist>",
                "reference to invalid character number at line 1, column 16");
    expectFault("<plist><string>&#xD800;</string></plist>",
                "reference to invalid character number at line 1, column 16");
    expectFault("<plist><string>&unknown;</string></plist>",
                "undefined entity at line 1, column 16");
    expectFault("<plist a='1' a='2'><true/></plist>", "duplicate attribute at line 1, column 14");
    expectFault(" \n" + kDeclaration + "<plist><true/></plist>",
                "XML or text declaration not at start of entity at line 2, column 1");
    expectFault("<!-- only a comment -->", "no element found at line 1, column 24");
    expectFault("\xEF\xBB\xBF", "no element found at line 1, column 1");
}

TEST(PropertyListXmlReaderTest, EveryTruncationIsRefusedWithAPosition)
{
    const std::string whole = kDeclaration +
                              "<!DOCTYPE plist SYSTEM \"list.dtd\" [<!ELEMENT plist ANY>]>\n"
                              "<plist version=\"1.0\">\n<dict>\n\t<key>K\xC3\xA9y</key>\n"
                              "\t<string>a &amp; &#x20AC; <![CDATA[<b>]]></string>\n"
                              "\t<key>List</key><array><integer>1</integer><real>2</real><true/>"
                              "<date>2026-11-21T10:00:00Z</date><data>AQI=</data></array>\n"
                              "</dict>\n<!-- end -->\n</plist>";
    ASSERT_TRUE(readText(whole).value) << readText(whole).error;
    for (std::size_t length = 0; length < whole.size(); ++length) {
        const PropertyListResult result = readText(std::string_view(whole).substr(0, length));
        EXPECT_TRUE(result.value.isAbsent()) << length;
        if (length == 0) {
            EXPECT_EQ(result.error, "neither an XML nor a binary property list at byte 0");
            continue;
        }
        const bool isCut = result.error.starts_with("no element found at line ") ||
                           result.error.starts_with("unclosed token at line ") ||
                           result.error.starts_with("unclosed CDATA section at line ") ||
                           result.error.starts_with("syntax error at line 2, column ") ||
                           result.error.starts_with("partial character at line ");
        EXPECT_TRUE(isCut) << length << ": " << result.error;
        EXPECT_NE(result.error.find(", column "), std::string::npos) << result.error;
    }
}

TEST(PropertyListXmlReaderTest, EveryChangedByteIsReadOrRefusedWithAReason)
{
    const std::string whole =
        kDeclaration + xmlList("<dict><key>a</key><array><integer>12</integer></array></dict>");
    for (std::size_t at = 0; at < whole.size(); ++at)
        for (const int flipped : kFlippedBits) {
            std::string changed = whole;
            changed[at] = static_cast<char>(changed[at] ^ flipped);
            const PropertyListResult result = readText(changed);
            ASSERT_EQ(result.value.isAbsent(), !result.error.empty()) << at << ' ' << flipped;
        }
}

std::string nested(std::size_t levels, const std::string& open, const std::string& close,
                   const std::string& innermost)
{
    std::string text;
    for (std::size_t i = 0; i < levels; ++i)
        text += open;
    text += innermost;
    for (std::size_t i = 0; i < levels; ++i)
        text += close;
    return xmlList(text);
}

TEST(PropertyListXmlReaderTest, NestingIsReadUpToTheLimit)
{
    const std::string key = "<key>k</key>";
    for (const auto& [open, close, innermost] : {
             std::tuple{"<array>",                   "</array>",        "<string>inside</string>"},
             std::tuple{"<dict><key>k</key>",        "</dict>",         "<string>inside</string>"},
             std::tuple{"<array><dict><key>k</key>", "</dict></array>", "<true/>"                }
    }) {
        const std::size_t perLevel = std::string_view(open).starts_with("<array><dict>") ? 2 : 1;
        const std::size_t levels = kPropertyListDepthLimit / perLevel;
        const PropertyListResult deepest = readText(nested(levels, open, close, innermost));
        EXPECT_EQ(deepest.error, "");
        EXPECT_TRUE(deepest.value);
        const PropertyListResult deeper = readText(nested(levels + 1, open, close, innermost));
        EXPECT_TRUE(deeper.value.isAbsent());
        EXPECT_EQ(deeper.error.find("nested deeper than 512 levels at line 1, column "), 0U)
            << deeper.error;
    }
    // The first container beyond the limit is refused, at its start, however deep the text is.
    const std::string text = nested(200000, "<array>", "</array>", "");
    EXPECT_EQ(readText(text).error,
              "nested deeper than 512 levels at line 1, column " + std::to_string(22 + 512 * 7));
}

TEST(PropertyListXmlReaderTest, DoctypeIsSkippedAndNothingIsLoaded)
{
    for (const char* doctype :
         {"<!DOCTYPE plist>", "<!DOCTYPE plist SYSTEM \"/nowhere/at/all.dtd\">",
          "<!DOCTYPE plist PUBLIC \"-//Example//DTD\" \"http://localhost:1/list.dtd\">",
          "<!DOCTYPE other []>",
          "<!DOCTYPE plist [<!ELEMENT plist ANY><!ATTLIST plist version CDATA \"1.0\">"
          "<!NOTATION n SYSTEM \"n\"><!-- note --><?pi?>]>"}) {
        const PropertyListResult result = readText(doctype + xmlList("<true/>"));
        EXPECT_EQ(result.error, "") << doctype;
        EXPECT_EQ(result.value, PropertyValue::boolean(true));
    }
}

TEST(PropertyListXmlReaderTest, EntityDeclarationsAreRefused)
{
    for (const std::string declarations :
         {"<!ENTITY a \"text\">", "<!ENTITY a SYSTEM \"/etc/hostname\">",
          "<!ENTITY a PUBLIC \"p\" \"/etc/hostname\">",
          "<!ENTITY % a \"<!ELEMENT plist ANY>\"> %a;", "<!ENTITY a SYSTEM \"a\" NDATA n>",
          "<!ENTITY b \"bbbbbbbb\"><!ENTITY a \"&b;&b;&b;&b;&b;&b;&b;&b;&b;\">"})
        for (const char* root : {"<string>&a;</string>", "<true/>"})
            expectFaultOnLine("<!DOCTYPE plist [\n" + declarations + "\n]>\n" + xmlList(root),
                              "entity declarations are not accepted at line 2");
}

TEST(PropertyListXmlReaderTest, EntitiesThatAnExternalDtdMightDeclareAreRefused)
{
    // Expat alone would leave them out of the text.
    expectFault("<!DOCTYPE plist SYSTEM \"list.dtd\">\n" + xmlList("<string>a&b;c</string>"),
                "undefined entity at line 2, column 31");
    expectFault("<!DOCTYPE plist [%a;]>\n" + xmlList("<array>&b;</array>"),
                "undefined entity at line 2, column 29");
}

TEST(PropertyListXmlReaderTest, DtdThatDeclaresManyAttributesIsRefused)
{
    const auto listWith = [](int attributes) {
        std::string text = "<!DOCTYPE plist [\n";
        for (int i = 0; i < attributes; ++i)
            text += "<!ATTLIST true a" + std::to_string(i) + " CDATA \"x\">\n";
        return text + "]>" + xmlList("<true/>");
    };
    EXPECT_TRUE(readText(listWith(64)).value);
    expectFaultOnLine(listWith(65), "too many attribute declarations at line 66");
}

TEST(PropertyListXmlReaderTest, AttributesAreIgnored)
{
    EXPECT_EQ(readText("<plist><string a='1' version=\"x\">text</string></plist>").value,
              PropertyValue("text"));
}

} // namespace
} // namespace orvane

#include "platform/base/JsonText.h"
#include "platform/base/PropertyValue.h"
#include "screens/print/JsonPrinter.h"
#include "screens/print/TextPrinter.h"
#include "support/Recording.h"

#include <gtest/gtest.h>

namespace orvane
{

namespace
{

NodePointer tree(const PropertyValue& display)
{
    PathDictionary paths;
    return OrvaneModelNode::makeTreeFromObject(display, paths);
}

PropertyValue sampleDisplay()
{
    return PropertyValue::dictionaryOf({
        {"Serving Cell Info", PropertyValue::dictionaryOf({{"Cell Identity", "1234"}})},
        {"Detected Cells",    PropertyValue::newArray()                               }
    });
}

template <typename PaneUnderTest>
class PaneFixture : public ::testing::Test
{
protected:
    PaneUnderTest make(bool isSimulated = false)
    {
        return PaneUnderTest([this](std::string_view text) { output += text; }, isSimulated);
    }

    std::string output;
};

using JsonPrinterTest = PaneFixture<JsonPrinter>;
using TextPrinterTest = PaneFixture<TextPrinter>;

} // namespace

TEST_F(JsonPrinterTest, BeforeAnyTreeTheTreeIsNull)
{
    JsonPrinter pane = make();
    pane.setStatus("Connecting", true);
    EXPECT_EQ(output, "{\"status\":\"Connecting\",\"loading\":true,\"tree\":null}\n");
}

TEST_F(JsonPrinterTest, AReloadAndItsStatusAreOneLine)
{
    JsonPrinter pane = make();
    pane.reloadWithNode(tree(sampleDisplay()));
    EXPECT_EQ(output, "");
    pane.setStatus("Updated 2026-11-21 at 10:00:00", false);
    EXPECT_EQ(output, "{\"status\":\"Updated 2026-11-21 at 10:00:00\",\"loading\":false,\"tree\":"
                      "{\"name\":\"Orvane\",\"children\":["
                      "{\"name\":\"Serving Cell Info\",\"children\":["
                      "{\"name\":\"Cell Identity\",\"value\":\"1234\"}]},"
                      "{\"name\":\"Detected Cells\",\"children\":[]}]}}\n");
}

TEST_F(JsonPrinterTest, AStatusThatDoesNotChangePrintsNothingUnlessReloaded)
{
    JsonPrinter pane = make();
    pane.setStatus("Connecting...", false);
    output.clear();
    pane.setStatus("Connecting...", false);
    EXPECT_EQ(output, "");
    pane.reloadWithNode(nullptr);
    pane.setStatus("Connecting...", false);
    EXPECT_EQ(output, "{\"status\":\"Connecting...\",\"loading\":false,\"tree\":null}\n");
}

TEST_F(JsonPrinterTest, AChangeOfTheBusyStateAloneIsAChange)
{
    JsonPrinter pane = make();
    pane.setStatus("Connecting...", false);
    output.clear();
    pane.setStatus("Connecting...", true);
    EXPECT_EQ(output, "{\"status\":\"Connecting...\",\"loading\":true,\"tree\":null}\n");
}

TEST_F(JsonPrinterTest, AChangeOfTheStatusAloneCarriesTheTreeOnTheScreen)
{
    JsonPrinter pane = make();
    pane.reloadWithNode(tree("text"));
    pane.setStatus("Updated", false);
    output.clear();
    pane.setStatus("Connecting...", true);
    EXPECT_EQ(output, "{\"status\":\"Connecting...\",\"loading\":true,"
                      "\"tree\":{\"name\":\"Orvane\",\"value\":\"text\"}}\n");
}

TEST_F(JsonPrinterTest, DetailsAreNumberUnitAndTimeOfReadings)
{
    static constexpr Format kLevel = Format::fixed({.factor = 0.5}, 2, " dB");
    static constexpr ValueName kNames[] = {
        {1, "One"}
    };
    static constexpr Format kNamed = Format::named(kNames, "Unknown").withText(2, "Two");
    static constexpr RowDescription kLevelRow = {"Level", &kLevel};
    static constexpr RowDescription kNamedRow = {"State", &kNamed};
    const PropertyValue display = PropertyValue::dictionaryOf({
        {"Level", PropertyValue::reading({&kLevelRow, -7, 1795255200250})      },
        {"State", PropertyValue::reading({&kNamedRow, 1})                      },
        {"Code",  PropertyValue::textReading({"-00101 dB", "-00101", "dB", -1})},
        {"Text",  "12"                                                         }
    });
    std::string plain;
    appendJsonNode(plain, tree(display).get());
    EXPECT_EQ(plain, "{\"name\":\"Orvane\",\"children\":["
                     "{\"name\":\"Level\",\"value\":\"-3.50 dB\"},"
                     "{\"name\":\"State\",\"value\":\"One\"},"
                     "{\"name\":\"Code\",\"value\":\"-00101 dB\"},"
                     "{\"name\":\"Text\",\"value\":\"12\"}]}");
    JsonPrinter pane([this](std::string_view text) { output += text; }, false,
                     JsonDetails::OfRecording);
    pane.reloadWithNode(tree(display));
    pane.setStatus("Updated", false);
    EXPECT_EQ(output, "{\"status\":\"Updated\",\"loading\":false,\"tree\":"
                      "{\"name\":\"Orvane\",\"children\":["
                      "{\"name\":\"Level\",\"value\":\"-3.50 dB\",\"number\":-3.50,"
                      "\"unit\":\"dB\",\"time\":\"2026-11-21T10:00:00.250Z\"},"
                      "{\"name\":\"State\",\"value\":\"One\",\"number\":1},"
                      "{\"name\":\"Code\",\"value\":\"-00101 dB\",\"number\":-101,"
                      "\"unit\":\"dB\",\"time\":\"1969-12-31T23:59:59.999Z\"},"
                      "{\"name\":\"Text\",\"value\":\"12\"}]}}\n");
}

TEST_F(JsonPrinterTest, DetailsOfALiveViewHaveTheTimeOfEachStatus)
{
    TestServices services;
    services.clock.now = 1795255200.5;
    JsonPrinter pane([this](std::string_view text) { output += text; }, true,
                     JsonDetails::OfLiveView);
    pane.setStatus("Connecting", true);
    EXPECT_EQ(output, "{\"status\":\"Connecting\",\"loading\":true,\"tree\":null,"
                      "\"time\":\"2026-11-21T10:00:00.500Z\",\"simulated\":true}\n");
}

TEST_F(JsonPrinterTest, NoStatusIsAnEmptyOne)
{
    JsonPrinter pane = make();
    pane.setStatus(std::nullopt, true);
    EXPECT_EQ(output, "{\"status\":\"\",\"loading\":true,\"tree\":null}\n");
}

TEST_F(JsonPrinterTest, EveryObjectOfASimulatedPhoneSaysSo)
{
    JsonPrinter pane = make(true);
    pane.setStatus("Connecting", true);
    pane.showSaved("/root/a.orvane");
    pane.showAlert("File Error", "Unable to write file to disk");
    pane.showError("no");
    EXPECT_EQ(output,
              "{\"status\":\"Connecting\",\"loading\":true,\"tree\":null,\"simulated\":true}\n"
              "{\"saved\":\"/root/a.orvane\",\"simulated\":true}\n"
              "{\"alert\":\"File Error\",\"message\":\"Unable to write file to disk\","
              "\"simulated\":true}\n"
              "{\"error\":\"no\",\"simulated\":true}\n");
}

TEST(JsonText, EscapesWhatJsonCannotHold)
{
    const struct {
        std::string_view text;
        const char* json;
    } kCases[] = {
        {"plain",            "\"plain\""                },
        {"a\"b\\c",          "\"a\\\"b\\\\c\""          },
        {"1\n2\t3\r",        "\"1\\n2\\t3\\r\""         },
        {"\x01\x1f",         "\"\\u0001\\u001f\""       },
        {"12 × 64chips",    "\"12 × 64chips\""        },
        {"\xF0\x9F\x93\xB6", "\"\xF0\x9F\x93\xB6\""     },
        {"bad \xFF byte",    "\"bad \xEF\xBF\xBD byte\""},
        {"\x7f\u0080\u009b", "\"\\u007f\\u0080\\u009b\""},
        {"\u00a0\u202e",     "\"\u00a0\u202e\""         },
    };
    for (const auto& escape : kCases) {
        std::string json;
        appendJsonString(json, escape.text);
        EXPECT_EQ(json, escape.json);
    }
}

TEST_F(TextPrinterTest, PrintsTheStatusAndAnOutlineAsBlocksPartedByABlankLine)
{
    TextPrinter pane = make();
    pane.setStatus("Connecting", true);
    pane.reloadWithNode(tree(sampleDisplay()));
    pane.setStatus("Updated 2026-11-21 at 10:00:00", false);
    EXPECT_EQ(output, "Connecting\n"
                      "\n"
                      "Updated 2026-11-21 at 10:00:00\n"
                      "Orvane\n"
                      "  Serving Cell Info\n"
                      "    Cell Identity: 1234\n"
                      "  Detected Cells\n"
                      "\n");
}

TEST_F(TextPrinterTest, MarksTheStatusOfASimulatedPhone)
{
    TextPrinter pane = make(true);
    pane.setStatus("Connecting", true);
    EXPECT_EQ(output, "Connecting (simulated phone)\n\n");
}

TEST_F(TextPrinterTest, AnswersInWords)
{
    TextPrinter pane = make();
    pane.showSaved("/root/a.orvane");
    pane.showAlert("File Error", "Unable to write file to disk");
    pane.showError("unknown command \"x\"");
    EXPECT_EQ(output, "Saved to /root/a.orvane\n\n"
                      "File Error: Unable to write file to disk\n\n"
                      "Error: unknown command \"x\"\n\n");
}

TEST_F(TextPrinterTest, NothingPrintedActsOnATerminal)
{
    TextPrinter pane = make();
    const std::string evil = "a\x1b[2J\u009bb\u202ec";
    const std::string harmless = "a\uFFFD[2J\uFFFDbc";
    pane.reloadWithNode(tree(PropertyValue::dictionaryOf({
        {evil, evil}
    })));
    pane.setStatus(evil, false);
    pane.showAlert(evil, evil);
    pane.showSaved(evil);
    pane.showError(evil);
    pane.showNote(evil);
    EXPECT_EQ(output, harmless + "\nOrvane\n  " + harmless + ": " + harmless + "\n\n" + harmless +
                          ": " + harmless + "\n\n" + "Saved to " + harmless + "\n\n" +
                          "Error: " + harmless + "\n\n" + harmless + "\n\n");
}

TEST_F(TextPrinterTest, ARowStaysOnItsLine)
{
    TextPrinter pane = make();
    pane.reloadWithNode(tree(PropertyValue::dictionaryOf({
        {"two\nlines", "a\nb"}
    })));
    pane.setStatus("s", false);
    EXPECT_EQ(output, "s\nOrvane\n  two lines: a b\n\n");
}

} // namespace orvane

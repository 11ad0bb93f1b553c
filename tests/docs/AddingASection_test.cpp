// The message that docs/adding-a-section.md types, from the telephony server's end through the
// page's section to the text on the screen. The page's own test of the section is in this program,
// too.

#include "LogGenerator/LogGenerator.h"
#include "doubles/ManualMainQueue.h"
#include "platform/base/PropertyValue.h"
#include "platform/base/TelephonyConstants.h"
#include "platform/services/FileSystem.h"
#include "screens/print/TextPrinter.h"
#include "support/Recording.h"
#include "telephonyd/StartCommand.h"
#include "telephonyd/TypedMessages.h"
#include "ui/tree/OrvaneModelNode.h"

#include <gmock/gmock.h>
#include <gtest/gtest.h>

namespace orvane
{

namespace
{

using ::testing::ElementsAre;
using ::testing::HasSubstr;

// A file that following the page has made.
std::string made(const std::string& path)
{
    const auto content = readFile(std::string(ORVANE_FOLLOWED_PAGE) + "/" + path);
    EXPECT_TRUE(content && !content->empty()) << path;
    return content ? std::string(content->begin(), content->end()) : "";
}

// What the text front end prints of the display.
std::string printed(const PropertyValue& display)
{
    PathDictionary paths;
    std::string text;
    TextPrinter pane([&text](std::string_view output) { text += output; }, false);
    pane.reloadWithNode(OrvaneModelNode::makeTreeFromObject(display, paths));
    pane.setStatus("Updated", false);
    return text;
}

} // namespace

TEST(AddingASectionTest, TheTypedMessageIsShownAsThePageSays)
{
    TestServices services;
    services.memoryResources.put("LTE.plist", made("resources/LTE.plist"));
    const auto generator =
        LogGenerator::generatorFromTechnology(kTSLogChannelTechnology_Varnel_LTE);
    ASSERT_TRUE(generator);
    const PropertyValue state = PropertyValue::newDictionary();

    ManualMainQueue queue;
    std::vector<std::string> told;
    TypedMessages messages(kTSLogChannelTechnology_Varnel_LTE, queue,
                           [&told](const std::string& text) { told.push_back(text); });
    const auto source = messages.sources()();
    source->start(selectionOfStartCommand(generator->getStartCommand()), [&](ByteView message) {
        generator->updateState(*state.asDictionary(), message);
        return true;
    });
    queue.runPending();
    std::string line = made("typed");
    line.pop_back(); // the newline
    messages.take(line);

    EXPECT_THAT(told, ElementsAre("a viewer has started", HasSubstr(": sent to 1 viewer")));
    EXPECT_THAT(printed(generator->generateLogUsingState(*state.asDictionary())),
                HasSubstr(made("shown")));
}

} // namespace orvane

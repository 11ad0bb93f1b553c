// Checkpoints of generators: whatever came before and in between, a generator that was restored
// shows from there on what the first one showed.

#include "LogGenerator/LogGenerator.h"
#include "LogGenerator/Silence.h"
#include "LogGenerator/StateKeys.h"
#include "LogGenerator/support/RecordedMessages.h"
#include "platform/base/PropertyValue.h"
#include "platform/base/TelephonyConstants.h"
#include "platform/plist/PropertyList.h"
#include "support/Recording.h"

#include <gmock/gmock.h>

namespace orvane
{
namespace
{

// A generator with its state.
struct Viewer {
    explicit Viewer(const std::string& technology)
        : generator(LogGenerator::generatorFromTechnology(technology))
    {
    }
    // The display after the message. An exception of a decoder ends that message only.
    std::string after(const Bytes& message)
    {
        try {
            generator->updateState(state, message);
        } catch (const std::exception&) {
        }
        return state[kDisplayKey].description();
    }
    [[nodiscard]] GeneratorCheckpoint checkpoint() const { return generator->checkpoint(state); }
    void restore(const GeneratorCheckpoint& checkpoint) { generator->restore(state, checkpoint); }

    std::unique_ptr<LogGenerator> generator;
    PropertyDictionary state;
};

constexpr std::size_t kMostMessages = 2000;

struct Case {
    const char* technology;
    const char* recording;
};

void PrintTo(const Case& each, std::ostream* to) { *to << each.recording; }

Bytes serverItem(std::uint8_t code, const PropertyValue& content)
{
    const std::string list = writeXmlPropertyList(content).value_or("");
    Bytes message = {0xFF, 0, 0, code, 0};
    message.resize(13);
    message.insert(message.end(), list.begin(), list.end());
    return message;
}

class CheckpointTest : public ::testing::TestWithParam<Case>
{
protected:
    CheckpointTest() { services.useShippedResources(); }

    // The recording with some items of the server inserted.
    static std::vector<Bytes> messages()
    {
        std::vector<Bytes> all = recordedMessages(GetParam().recording);
        all.resize(std::min(all.size(), kMostMessages));
        const PropertyValue contexts = PropertyValue::arrayOf({
            PropertyValue::dictionaryOf({{"APN", "internet"}}
            )
        });
        const PropertyValue files = PropertyValue::dictionaryOf({
            {"kSimFile_ICCID", "89"}
        });
        all.insert(all.begin() + static_cast<std::ptrdiff_t>(all.size() / 3),
                   serverItem(2, contexts));
        all.insert(all.begin() + static_cast<std::ptrdiff_t>(all.size() / 2), serverItem(0, files));
        return all;
    }

    TestServices services;
    const Silence silence; // the decoders' log lines only cost time
};

TEST_P(CheckpointTest, ARestoredGeneratorGoesOnFromAnyItem)
{
    constexpr std::size_t kFollowed = 3;
    const std::vector<Bytes> all = messages();
    Viewer first(GetParam().technology);
    std::vector<std::string> shown;
    std::vector<GeneratorCheckpoint> checkpoints;
    for (const Bytes& message : all) {
        checkpoints.push_back(first.checkpoint());
        shown.push_back(first.after(message));
    }
    ASSERT_NE(shown.front(), shown.back());

    // Backwards, so that the other generator's own state is always the wrong one.
    Viewer other(GetParam().technology);
    for (std::size_t start = all.size(); start-- > 0;) {
        other.restore(checkpoints[start]);
        for (std::size_t i = start; i < std::min(start + kFollowed, all.size()); ++i)
            ASSERT_EQ(other.after(all[i]), shown[i]) << "item " << i << " from " << start;
    }
}

TEST_P(CheckpointTest, AGeneratorRestoredAtEveryItemEndsAsIfItNeverHadBeen)
{
    Viewer first(GetParam().technology);
    Viewer restored(GetParam().technology);
    Viewer other(GetParam().technology);
    for (const Bytes& message : messages()) {
        other.restore(restored.checkpoint());
        std::swap(restored, other);
        ASSERT_EQ(restored.after(message), first.after(message));
    }
}

TEST_P(CheckpointTest, ACheckpointIsNotChangedByWhatComesLater)
{
    const std::vector<Bytes> all = messages();
    Viewer viewer(GetParam().technology);
    for (std::size_t i = 0; i < all.size() / 2; ++i)
        viewer.after(all[i]);
    const GeneratorCheckpoint checkpoint = viewer.checkpoint();
    const std::string then = checkpoint.values.description();
    for (int round = 0; round < 2; ++round) {
        for (std::size_t i = all.size() / 2; i < all.size(); ++i)
            viewer.after(all[i]);
        ASSERT_EQ(checkpoint.values.description(), then);
        viewer.restore(checkpoint);
    }
}

TEST_P(CheckpointTest, HistoryTemplateAndRawMessagesAreNoPartOfIt)
{
    Viewer viewer(GetParam().technology);
    const std::vector<Bytes> all = messages();
    viewer.after(all.front());
    viewer.after(all.back());
    const std::size_t before = viewer.checkpoint().values.description().size();
    viewer.generator->generateLogUsingState(viewer.state);
    viewer.generator->generateLogUsingState(viewer.state);
    EXPECT_EQ(viewer.checkpoint().values.description().size(), before);

    const PropertyValue displayTemplate = viewer.state[kTemplateKey];
    ASSERT_TRUE(displayTemplate);
    viewer.restore(viewer.checkpoint());
    EXPECT_EQ(viewer.state[kTemplateKey].asDictionary(), displayTemplate.asDictionary());
    EXPECT_FALSE(viewer.state.contains(kHistoryKey));
}

TEST_P(CheckpointTest, AGeneratorThatKeepsNoMessagesHasNoneToSave)
{
    Viewer viewer(GetParam().technology);
    viewer.generator->keepNoMessages();
    for (const Bytes& message : messages())
        viewer.after(message);
    viewer.generator->generateLogUsingState(viewer.state);
    ASSERT_TRUE(viewer.state[kDisplayStateKey].asData());
    EXPECT_TRUE(viewer.state[kDisplayStateKey].asData()->empty());
}

std::string nameOf(const ::testing::TestParamInfo<Case>& info)
{
    std::string name = info.param.recording;
    name.resize(name.find('-'));
    return name;
}

INSTANTIATE_TEST_SUITE_P(
    Recorded, CheckpointTest,
    ::testing::Values(Case{kTSLogChannelTechnology_Varnel_LTE, "lte-drive.dlf"},
                      Case{kTSLogChannelTechnology_Varnel_GSM, "umts-city.dlf"},
                      Case{kTSLogChannelTechnology_Varnel_UTRAN2, "utran-walk.dlf"},
                      Case{kTSLogChannelTechnology_Varnel_CDMA, "cdma-evening.dlf"}),
    nameOf);

TEST(CellMonitorCheckpointTest, ARestoredGeneratorShowsTheListOfThen)
{
    TestServices services;
    Viewer viewer(kTSLogChannelTechnology_IFX);
    const auto message = [](const char* text) {
        const std::string list = writeXmlPropertyList(PropertyValue::dictionaryOf({
                                                          {"Cell", text}
        }))
                                     .value_or("");
        return Bytes(list.begin(), list.end());
    };
    const std::string first = viewer.after(message("1"));
    const GeneratorCheckpoint checkpoint = viewer.checkpoint();
    EXPECT_NE(viewer.after(message("2")), first);
    viewer.restore(checkpoint);
    EXPECT_EQ(viewer.state[kDisplayKey].description(), first);
}

TEST(EmptyCheckpointTest, AGeneratorRestoredToItsBeginningBuildsItsDisplayAnew)
{
    TestServices services;
    services.useShippedResources();
    const std::vector<Bytes> all = recordedMessages("lte-drive.dlf");
    Viewer viewer(kTSLogChannelTechnology_Varnel_LTE);
    const GeneratorCheckpoint beginning = viewer.checkpoint();
    std::string shown;
    for (std::size_t i = 0; i < 100; ++i)
        shown = viewer.after(all[i]);
    viewer.restore(beginning);
    EXPECT_FALSE(viewer.state[kDisplayKey]);
    for (std::size_t i = 0; i < 100; ++i)
        viewer.after(all[i]);
    EXPECT_EQ(viewer.state[kDisplayKey].description(), shown);
}

TEST(EmptyCheckpointTest, AGeneratorWithoutATemplateCanBeRestored)
{
    TestServices services; // UTRAN's template is missing
    Viewer viewer(kTSLogChannelTechnology_Varnel_UTRAN2);
    viewer.restore(viewer.checkpoint());
    EXPECT_EQ(viewer.after(Bytes(13, 1)), PropertyValue().description());
}

} // namespace
} // namespace orvane

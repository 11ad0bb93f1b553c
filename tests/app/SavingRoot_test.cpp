#include "app/SavingRoot.h"

#include "app/LiveApp.h"
#include "support/Recording.h"
#include "support/TemporaryDirectory.h"

#include <gmock/gmock.h>

#include <cstdlib>
#include <filesystem>

namespace orvane
{
namespace
{

namespace fs = std::filesystem;
using testing::ElementsAre;
using testing::HasSubstr;
using testing::IsEmpty;

class SavingRootTest : public testing::Test
{
protected:
    SavingRootTest() { setenv("XDG_STATE_HOME", state().c_str(), 1); }
    ~SavingRootTest() override
    {
        if (before)
            setenv("XDG_STATE_HOME", before->c_str(), 1);
        else
            unsetenv("XDG_STATE_HOME");
    }
    [[nodiscard]] std::string state() const { return directory.path() + "/state"; }
    [[nodiscard]] std::string machine() const { return directory.path() + "/machine"; }

    TestServices services;
    TemporaryDirectory directory;

private:
    std::optional<std::string> before =
        std::getenv("XDG_STATE_HOME") ? std::optional<std::string>(std::getenv("XDG_STATE_HOME"))
                                      : std::nullopt;
};

TEST_F(SavingRootTest, AMachineWithTheInstallMarkerKeepsItsOwnFolders)
{
    fs::create_directories(machine() + kInstallMarker);
    EXPECT_EQ(liveRoot(machine()), machine());
    EXPECT_FALSE(fs::exists(state()));
}

TEST_F(SavingRootTest, OnOtherMachinesItIsMadeInTheStateDirectoryForTheUserAlone)
{
    const std::string root = liveRoot(machine());
    EXPECT_EQ(root, state() + "/orvane/root");
    EXPECT_EQ(fs::status(root).permissions(), fs::perms::owner_all);
    EXPECT_TRUE(fs::exists(root + kInstallMarker));
    EXPECT_TRUE(fs::exists(root + kLogFolder));
    EXPECT_EQ(liveRoot(machine()), root); // kept from one run to the next
    EXPECT_THAT(services.log.errors(), IsEmpty());
}

TEST_F(SavingRootTest, WhereItCannotBeMadeTheMachinesRootIsTakenWithAWarning)
{
    ASSERT_TRUE(writeFile(state(), {}));
    EXPECT_EQ(liveRoot(machine()), machine());
    ASSERT_EQ(services.log.lines.size(), 1U);
    EXPECT_EQ(services.log.lines[0].priority, LogPriority::Warning);
    EXPECT_THAT(services.log.lines[0].text, HasSubstr("set XDG_STATE_HOME, or give --root DIR"));
}

TEST_F(SavingRootTest, ASimulatedPhoneHasARootOfItsOwnOrAClearError)
{
    EXPECT_EQ(simulatedPhoneRoot(), state() + "/orvane/demo");
    EXPECT_TRUE(fs::exists(state() + "/orvane/demo" + kInstallMarker));
    fs::remove_all(state());
    ASSERT_TRUE(writeFile(state(), {}));
    EXPECT_THROW(simulatedPhoneRoot(), std::runtime_error);
}

} // namespace
} // namespace orvane

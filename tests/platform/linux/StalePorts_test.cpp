#include "platform/linux/StalePorts.h"

#include "platform/linux/EffectiveUser.h"
#include "platform/linux/PortSocket.h"
#include "platform/linux/PrivatePortsDirectory.h"
#include "platform/linux/StaleSocket.h"

#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include <filesystem>
#include <fstream>
#include <sys/stat.h>

namespace orvane
{
namespace
{

using ::testing::IsEmpty;
using ::testing::UnorderedElementsAre;

class StalePortsTest : public testing::Test
{
protected:
    void leave(const std::string& name) { leaveStaleSocket(directory.path() + '/' + name); }
    void remove(StalePorts which, std::time_t later = 0)
    {
        removeStalePorts(directory.directory(), which, std::time(nullptr) + later);
    }
    [[nodiscard]] std::vector<std::string> names() const
    {
        std::vector<std::string> all;
        for (const auto& entry : std::filesystem::directory_iterator(directory.path()))
            all.push_back(entry.path().filename().string());
        return all;
    }

    PrivatePortsDirectory directory;
    std::string error;
};

TEST_F(StalePortsTest, PortsOfKilledViewersAreRemoved)
{
    for (int i = 0; i < 200; ++i)
        leave("OrvaneApp." + std::to_string(i));
    const auto live = PortSocket::claim(directory.directory(), "OrvaneApp.live", error);
    ASSERT_TRUE(live) << error;
    remove(StalePorts::Clients);
    EXPECT_THAT(names(), UnorderedElementsAre("OrvaneApp.live"));
}

TEST_F(StalePortsTest, TheServersPortsAreForTheServerToRemove)
{
    leave("TelephonyServer");
    leave("TelephonyServer.Channel.1");
    remove(StalePorts::Clients);
    EXPECT_THAT(names(), UnorderedElementsAre("TelephonyServer", "TelephonyServer.Channel.1"));
    remove(StalePorts::All);
    EXPECT_THAT(names(), UnorderedElementsAre("TelephonyServer"))
        << "a new server takes over its name in one step";
}

TEST_F(StalePortsTest, UnpublishedFilesAreRemovedOnceTheyAreOlderThanAMinute)
{
    leave("~abcdefghij");
    leave("~12345");
    remove(StalePorts::Clients);
    EXPECT_EQ(names().size(), 2U);
    remove(StalePorts::Clients, 62);
    EXPECT_THAT(names(), IsEmpty());
}

TEST_F(StalePortsTest, WhatIsNotASocketStays)
{
    std::ofstream(directory.path() + "/file") << "x";
    std::ofstream(directory.path() + "/~file") << "x";
    std::filesystem::create_directory(directory.path() + "/folder");
    std::filesystem::create_symlink("nowhere", directory.path() + "/link");
    remove(StalePorts::All, 3600);
    EXPECT_EQ(names().size(), 4U);
}

TEST_F(StalePortsTest, InASharedDirectoryEachUserRemovesHisOwnAndTheOwnerAll)
{
    ORVANE_SKIP_UNLESS_ROOT();
    constexpr uid_t kOwner = 2001;
    constexpr uid_t kAnna = 2002;
    constexpr uid_t kBert = 2003;
    constexpr gid_t kGroup = 3001;
    const std::string path = directory.path() + "/shared";
    ASSERT_EQ(::mkdir(path.c_str(), 0700), 0);
    ASSERT_EQ(::chown(path.c_str(), kOwner, kGroup), 0);
    ASSERT_EQ(::chmod(path.c_str(), 01770), 0);
    ASSERT_EQ(::chmod(directory.path().c_str(), 0755), 0);
    const auto shared = PortsDirectory::existing(path, error, kOwner);
    ASSERT_TRUE(shared) << error;
    {
        const EffectiveUser anna(kAnna, kGroup);
        leaveStaleSocket(path + "/OrvaneApp.Anna");
        ASSERT_EQ(::chmod((path + "/OrvaneApp.Anna").c_str(), 0660), 0);
    }
    {
        const EffectiveUser bert(kBert, 100, {kGroup});
        leaveStaleSocket(path + "/OrvaneApp.Bert");
        leaveStaleSocket(path + "/OrvaneApp.Bert2");
        removeStalePorts(*shared, StalePorts::Clients, std::time(nullptr));
    }
    EXPECT_TRUE(std::filesystem::exists(path + "/OrvaneApp.Anna"));
    EXPECT_FALSE(std::filesystem::exists(path + "/OrvaneApp.Bert"));
    const EffectiveUser owner(kOwner, kGroup);
    removeStalePorts(*shared, StalePorts::All, std::time(nullptr));
    EXPECT_TRUE(std::filesystem::is_empty(path));
}

} // namespace
} // namespace orvane

#include "platform/linux/ServerSearch.h"

#include "platform/linux/EffectiveUser.h"
#include "platform/linux/PortSocket.h"
#include "platform/linux/TransportTest.h"

#include <filesystem>
#include <sys/stat.h>

namespace orvane
{
namespace
{

class ServerSearchTest : public TransportTest
{
protected:
    // Where a port is listened on: "own", "system" or "nowhere".
    std::string place()
    {
        const auto listener = search.listen("OrvaneApp.1", error);
        EXPECT_EQ(search.connect("OrvaneApp.1", error) != nullptr, listener != nullptr);
        if (std::filesystem::exists(directory.path() + "/OrvaneApp.1"))
            return "own";
        return std::filesystem::exists(system.path() + "/OrvaneApp.1") ? "system" : "nowhere";
    }
    std::optional<PortSocket> serveIn(const PortsDirectory& served)
    {
        auto server = PortSocket::claim(served, "TelephonyServer", error);
        EXPECT_TRUE(server) << error;
        return server;
    }

    PrivatePortsDirectory system;
    ServerSearch search{directory.directory(), system.path(), std::nullopt};
};

TEST_F(ServerSearchTest, WithoutAnyServerTheUsersOwnDirectoryIsUsed)
{
    EXPECT_EQ(place(), "own");
    std::filesystem::remove(system.path());
    EXPECT_EQ(place(), "own");
}

TEST_F(ServerSearchTest, AServerOfTheSystemIsFoundWheneverItStarts)
{
    EXPECT_EQ(place(), "own");
    {
        const auto server = serveIn(system.directory());
        EXPECT_EQ(place(), "system");
        EXPECT_TRUE(search.connect("TelephonyServer", error));
    }
    EXPECT_EQ(place(), "own");
}

TEST_F(ServerSearchTest, AServerOfTheUsersOwnComesFirst)
{
    const auto systems = serveIn(system.directory());
    EXPECT_EQ(place(), "system");
    const auto own = serveIn(directory.directory());
    EXPECT_EQ(place(), "own");
}

TEST_F(ServerSearchTest, ASystemsDirectoryThatCannotBeTrustedIsPassedOver)
{
    const auto server = serveIn(system.directory());
    ASSERT_EQ(::chmod(system.path().c_str(), 0755), 0);
    EXPECT_EQ(place(), "own");
}

TEST_F(ServerSearchTest, AMemberUsesTheSharedDirectory)
{
    ORVANE_SKIP_UNLESS_ROOT();
    constexpr uid_t kOwner = 2001;
    constexpr uid_t kMember = 2002;
    constexpr gid_t kGroup = 3001;
    ASSERT_EQ(::chown(system.path().c_str(), kOwner, kGroup), 0);
    ASSERT_EQ(::chmod(system.path().c_str(), 01770), 0);
    ASSERT_EQ(::chown(directory.path().c_str(), kMember, kGroup), 0);
    const auto server = [&] {
        const EffectiveUser owner(kOwner, kGroup);
        return serveIn(*PortsDirectory::existing(system.path(), error, kOwner));
    }();
    const auto memberPlace = [&](const std::vector<gid_t>& groups) {
        const EffectiveUser member(kMember, 100, groups);
        const auto own = PortsDirectory::existing(directory.path(), error, std::nullopt);
        EXPECT_TRUE(own) << error;
        ServerSearch members(*own, system.path(), kOwner);
        const auto listener = members.listen("OrvaneApp.1", error);
        EXPECT_TRUE(listener) << error;
        return std::filesystem::exists(directory.path() + "/OrvaneApp.1") ? "own" : "system";
    };
    EXPECT_STREQ(memberPlace({100, kGroup}), "system");
    EXPECT_STREQ(memberPlace({100}), "own") << "not a member";
}

} // namespace
} // namespace orvane

#include "platform/linux/PortSocket.h"

#include "platform/linux/EffectiveUser.h"
#include "platform/linux/PortPeer.h"
#include "platform/linux/PrivatePortsDirectory.h"
#include "platform/linux/StaleSocket.h"
#include "support/Recording.h"

#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include <array>
#include <atomic>
#include <barrier>
#include <cerrno>
#include <fcntl.h>
#include <filesystem>
#include <fstream>
#include <memory>
#include <numeric>
#include <sys/file.h>
#include <sys/socket.h>
#include <sys/stat.h>
#include <thread>

namespace orvane
{
namespace
{

class PortSocketTest : public testing::Test
{
protected:
    bool isServed()
    {
        std::string error;
        const FileDescriptor caller = newStreamSocket();
        return connectTo(caller.get(), *socketAddress(directory.path() + "/Port", error)) == 0;
    }
    int connectionResult()
    {
        std::string ignored;
        const FileDescriptor caller = newStreamSocket();
        return connectTo(caller.get(), *socketAddress(directory.path() + "/Port", ignored));
    }

    PrivatePortsDirectory directory;
};

TEST_F(PortSocketTest, OneOfManyThatFindTheSameStaleSocketGetsIt)
{
    constexpr int kRounds = 500; // plain removal fails about once in 300
    constexpr std::size_t kClaimants = 4;
    for (int round = 0; round < kRounds; ++round) {
        leaveStaleSocket(directory.path() + "/Port");
        std::barrier start(kClaimants);
        std::array<std::unique_ptr<PortSocket>, kClaimants> claimed;
        std::array<std::thread, kClaimants> threads;
        for (std::size_t i = 0; i < kClaimants; ++i)
            threads[i] = std::thread([&, i] {
                std::string error;
                start.arrive_and_wait();
                if (auto socket = PortSocket::claim(directory.directory(), "Port", error))
                    claimed[i] = std::make_unique<PortSocket>(std::move(*socket));
            });
        std::size_t winners = 0;
        for (std::size_t i = 0; i < kClaimants; ++i) {
            threads[i].join();
            winners += claimed[i] ? 1 : 0;
        }
        ASSERT_EQ(winners, 1U) << round;
        ASSERT_TRUE(isServed()) << round;
    }
}

TEST_F(PortSocketTest, ASocketThatIsMovedFromLeavesTheFileToTheOther)
{
    std::string error;
    auto first = PortSocket::claim(directory.directory(), "Port", error);
    ASSERT_TRUE(first) << error;
    const PortSocket second = std::move(*first);
    first.reset();
    EXPECT_TRUE(isServed());
}

TEST_F(PortSocketTest, ADirectoryThatSomebodyLocksCanStillBeUsed)
{
    const FileDescriptor opened(::open(directory.path().c_str(), O_RDONLY | O_DIRECTORY));
    ASSERT_EQ(::flock(opened.get(), LOCK_EX), 0);
    std::string error;
    auto claimed = PortSocket::claim(directory.directory(), "Port", error);
    ASSERT_TRUE(claimed) << error;
    EXPECT_TRUE(isServed());
    claimed.reset();
    EXPECT_FALSE(std::filesystem::exists(directory.path() + "/Port"));
}

TEST_F(PortSocketTest, ANameIsNeverThereWithoutAListener)
{
    std::atomic<bool> isDone = false;
    std::size_t refused = 0;
    std::thread caller([&] {
        while (!isDone)
            refused += connectionResult() == ECONNREFUSED ? 1 : 0;
    });
    for (int i = 0; i < 2000; ++i) {
        std::string error;
        EXPECT_TRUE(PortSocket::claim(directory.directory(), "Port", error)) << error;
    }
    isDone = true;
    caller.join();
    EXPECT_EQ(refused, 0U);
}

TEST_F(PortSocketTest, AClaimThatFailsLeavesNothingBehind)
{
    std::string error;
    const auto first = PortSocket::claim(directory.directory(), "Port", error);
    EXPECT_FALSE(PortSocket::claim(directory.directory(), "Port", error));
    EXPECT_EQ(std::distance(std::filesystem::directory_iterator(directory.path()), {}), 1);
}

// A directory as the system's administrator makes it for a server of its own user.
class SharedPortSocketTest : public PortSocketTest
{
protected:
    static constexpr uid_t kOwner = 2001;
    static constexpr uid_t kAnna = 2002;
    static constexpr uid_t kBert = 2003;
    static constexpr gid_t kGroup = 3001;
    static constexpr gid_t kUsers = 100;

    void SetUp() override
    {
        ORVANE_SKIP_UNLESS_ROOT();
        path = directory.path() + "/shared";
        ASSERT_EQ(::mkdir(path.c_str(), 0700), 0);
        ASSERT_EQ(::chown(path.c_str(), kOwner, kGroup), 0);
        ASSERT_EQ(::chmod(path.c_str(), 01770), 0);
        ASSERT_EQ(::chmod(directory.path().c_str(), 0755), 0);
        shared = PortsDirectory::existing(path, error, kOwner);
        ASSERT_TRUE(shared) << error;
    }

    std::optional<PortSocket> claimAs(uid_t user, const std::string& name)
    {
        const EffectiveUser claimant(user, user == kOwner ? kGroup : kUsers, {kGroup});
        error.clear();
        return PortSocket::claim(*shared, name, error);
    }
    // Whether the listener accepts the caller, and the caller the listener.
    struct Trust {
        bool ofCaller;
        bool ofListener;
        friend bool operator==(const Trust&, const Trust&) = default;
    };
    // `groups`: the caller's, beside the group of users.
    Trust trust(const PortSocket& listener, uid_t listeningUser, const std::string& name,
                uid_t callingUser, gid_t callersGroup, const std::vector<gid_t>& groups)
    {
        FileDescriptor caller = newStreamSocket();
        Trust result{};
        {
            const EffectiveUser user(callingUser, callersGroup, groups);
            EXPECT_EQ(connectTo(caller.get(), *socketAddress(path + '/' + name, error)), 0);
            result.ofListener = isListenerTrusted(caller.get(), *shared, name);
        }
        const FileDescriptor accepted(::accept(listener.descriptor(), nullptr, nullptr));
        const EffectiveUser user(listeningUser, kGroup);
        result.ofCaller = isPeerTrusted(accepted.get(), *shared);
        return result;
    }

    std::string path;
    std::string error;
    std::optional<PortsDirectory> shared;
    TestServices services;
};

TEST_F(SharedPortSocketTest, APortIsTheGroupsToUse)
{
    const auto port = claimAs(kAnna, "OrvaneApp.Anna");
    ASSERT_TRUE(port) << error;
    struct stat found {
    };
    ASSERT_EQ(::lstat((path + "/OrvaneApp.Anna").c_str(), &found), 0);
    EXPECT_EQ(found.st_uid, kAnna);
    EXPECT_EQ(found.st_gid, kGroup);
    EXPECT_EQ(found.st_mode & 07777, 0660U);
}

TEST_F(SharedPortSocketTest, ANameIsNotTakenFromAnotherMember)
{
    {
        const EffectiveUser anna(kAnna, kGroup);
        leaveStaleSocket(path + "/Port");
        ASSERT_EQ(::chmod((path + "/Port").c_str(), 0660), 0);
    }
    EXPECT_FALSE(claimAs(kBert, "Port"));
    EXPECT_EQ(error, "The port " + path + "/Port cannot be made: another user has that name.");
    EXPECT_TRUE(claimAs(kAnna, "Port")) << error;
}

TEST_F(SharedPortSocketTest, TheServersNameIsTheOwnersAlone)
{
    EXPECT_FALSE(claimAs(kAnna, "TelephonyServer"));
    EXPECT_NE(error.find("Only the owner of the ports directory"), std::string::npos) << error;
    // A live one that a member has put there by other means.
    std::optional<PortSocket> squatter = claimAs(kAnna, "Squatter");
    ASSERT_TRUE(squatter) << error;
    std::filesystem::rename(path + "/Squatter", path + "/TelephonyServer");
    const auto server = claimAs(kOwner, "TelephonyServer");
    ASSERT_TRUE(server) << error;
    squatter.reset();
    EXPECT_EQ(trust(*server, kOwner, "TelephonyServer", kAnna, kGroup, {}), (Trust{true, true}));
    EXPECT_FALSE(claimAs(kOwner, "TelephonyServer")) << "of two servers the first stays";
}

TEST_F(SharedPortSocketTest, NothingThatAMemberPutsThereKeepsTheServerFromStarting)
{
    const std::string name = path + "/TelephonyServer";
    const auto asAnna = [&](auto action) {
        const EffectiveUser anna(kAnna, kGroup);
        action();
    };
    asAnna([&] { std::ofstream(name) << "x"; });
    EXPECT_TRUE(claimAs(kOwner, "TelephonyServer")) << error;
    asAnna([&] { std::filesystem::create_directories(name + "/full"); });
    EXPECT_TRUE(claimAs(kOwner, "TelephonyServer")) << error;
    asAnna([&] { std::filesystem::create_symlink("nowhere", name); });
    EXPECT_TRUE(claimAs(kOwner, "TelephonyServer")) << error;
    // The name to which a stale server's file would be moved is taken, too.
    {
        const EffectiveUser owner(kOwner, kGroup);
        leaveStaleSocket(name);
    }
    struct stat found {
    };
    ASSERT_EQ(::lstat(name.c_str(), &found), 0);
    asAnna([&] {
        std::filesystem::create_directories(path + "/~" + std::to_string(found.st_ino) + "/full");
    });
    EXPECT_TRUE(claimAs(kOwner, "TelephonyServer")) << error;
}

TEST_F(SharedPortSocketTest, TheServerServesTheMembersOfTheGroupAndRoot)
{
    const auto server = claimAs(kOwner, "TelephonyServer");
    ASSERT_TRUE(server) << error;
    const auto callFrom = [&](uid_t user, gid_t group, const std::vector<gid_t>& groups) {
        return trust(*server, kOwner, "TelephonyServer", user, group, groups);
    };
    // More groups than fit into the first buffer.
    std::vector<gid_t> many(200);
    std::iota(many.begin(), many.end(), 4000);
    many.back() = kGroup;
    EXPECT_EQ(callFrom(kAnna, kGroup, {}), (Trust{true, true})) << "primary group";
    EXPECT_EQ(callFrom(kBert, kUsers, {kUsers, kGroup}), (Trust{true, true})) << "another group";
    EXPECT_EQ(callFrom(kBert, kUsers, many), (Trust{true, true}));
    EXPECT_EQ(callFrom(0, 0, {}), (Trust{true, true}));
    EXPECT_THAT(services.log.errors(), ::testing::IsEmpty());

    ASSERT_EQ(::chmod(path.c_str(), 0777), 0);
    ASSERT_EQ(::chmod((path + "/TelephonyServer").c_str(), 0666), 0);
    EXPECT_FALSE(callFrom(kBert, kUsers, {kUsers}).ofCaller) << "not a member";
    EXPECT_THAT(services.log.errors(),
                ::testing::ElementsAre("A connection with a process of user 2003 is refused\n"));
}

TEST_F(SharedPortSocketTest, AMembersPortServesItsUserTheServerAndRoot)
{
    const auto port = claimAs(kAnna, "OrvaneApp.Anna");
    ASSERT_TRUE(port) << error;
    const auto callFrom = [&](uid_t user) {
        return trust(*port, kAnna, "OrvaneApp.Anna", user, kGroup, {});
    };
    EXPECT_EQ(callFrom(kAnna), (Trust{true, true}));
    EXPECT_EQ(callFrom(kOwner), (Trust{true, true}));
    EXPECT_TRUE(callFrom(0).ofCaller);
    EXPECT_EQ(callFrom(kBert), (Trust{false, false}));
}

TEST_F(SharedPortSocketTest, AMemberTakesAServerFromTheOwnerAlone)
{
    const auto squatter = claimAs(kAnna, "Squatter");
    ASSERT_TRUE(squatter) << error;
    std::filesystem::rename(path + "/Squatter", path + "/TelephonyServer");
    EXPECT_FALSE(trust(*squatter, kAnna, "TelephonyServer", kBert, kGroup, {}).ofListener);
    EXPECT_FALSE(trust(*squatter, kAnna, "TelephonyServer", kAnna, kGroup, {}).ofListener)
        << "not even from the own user";
}

} // namespace
} // namespace orvane

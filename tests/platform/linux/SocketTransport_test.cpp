#include "platform/linux/SocketTransport.h"

#include "platform/linux/EffectiveUser.h"
#include "platform/linux/TransportTest.h"

#include <fcntl.h>
#include <filesystem>
#include <fstream>
#include <sys/resource.h>
#include <sys/socket.h>
#include <sys/stat.h>

namespace orvane
{
namespace
{

class SocketTransportTest : public TransportTest
{
protected:
    // A socket file as a killed program leaves it.
    void leaveStaleSocket(const std::string& name)
    {
        const auto address = socketAddress(pathOf(name), error);
        const FileDescriptor socket = newStreamSocket();
        ASSERT_EQ(
            ::bind(socket.get(), reinterpret_cast<const sockaddr*>(&*address), sizeof *address), 0);
        ASSERT_EQ(::listen(socket.get(), 1), 0);
    }

    bool isServed(FrameListener& listener, const std::string& name)
    {
        int callers = 0;
        listener.setConnectionCallback([&](std::unique_ptr<FrameConnection>) { ++callers; });
        const auto connection = transport.connect(name, error);
        return connection && runUntil([&] { return callers == 1; });
    }
};

TEST_F(SocketTransportTest, AListenersSocketIsThereAsLongAsItIs)
{
    auto listener = listen("TelephonyServer");
    ASSERT_TRUE(listener);
    EXPECT_TRUE(std::filesystem::is_socket(pathOf("TelephonyServer")));
    EXPECT_TRUE(isServed(*listener, "TelephonyServer"));
    listener.reset();
    EXPECT_TRUE(std::filesystem::is_empty(directory.path()));
    EXPECT_FALSE(transport.connect("TelephonyServer", error));
    EXPECT_EQ(error, "The port " + pathOf("TelephonyServer") +
                         " cannot be reached: No such file or directory");
}

TEST_F(SocketTransportTest, AStaleSocketIsReplaced)
{
    leaveStaleSocket("Port");
    EXPECT_FALSE(transport.connect("Port", error));
    EXPECT_EQ(error, "The port " + pathOf("Port") + " cannot be reached: Connection refused");
    const auto listener = listen("Port");
    ASSERT_TRUE(listener) << error;
    EXPECT_TRUE(isServed(*listener, "Port"));
}

TEST_F(SocketTransportTest, ALivePortMakesListeningFailAndKeepsServing)
{
    const auto first = listen("Port");
    ASSERT_TRUE(first);
    EXPECT_EQ(refusal("Port"),
              "The port " + pathOf("Port") +
                  " is in use by a running program: end that, or choose another directory with "
                  "--ports DIR");
    EXPECT_TRUE(isServed(*first, "Port"));
}

TEST_F(SocketTransportTest, WhatIsNoSocketIsLeftAlone)
{
    std::ofstream(pathOf("File")) << "precious";
    std::filesystem::create_directory(pathOf("Directory"));
    std::filesystem::create_symlink(pathOf("nowhere"), pathOf("Link"));
    for (const char* name : {"File", "Directory", "Link"}) {
        EXPECT_EQ(refusal(name),
                  "The port " + pathOf(name) + " cannot be made: something else has that name.");
        EXPECT_TRUE(std::filesystem::exists(std::filesystem::symlink_status(pathOf(name))));
        EXPECT_FALSE(transport.connect(name, error));
    }
}

TEST_F(SocketTransportTest, NamesThatAreNoneAreRefused)
{
    for (const std::string& name :
         {std::string(), std::string("."), std::string(".."), std::string("../Port"),
          std::string("a/b"), std::string("a b"), std::string("a\0b", 3), std::string(65, 'a'),
          std::string("\xc3\xa4")}) {
        EXPECT_NE(refusal(name).find("cannot name a port"), std::string::npos) << name;
        error.clear();
        EXPECT_FALSE(transport.connect(name, error));
        EXPECT_NE(error.find("cannot name a port"), std::string::npos) << name;
    }
    EXPECT_TRUE(listen(std::string(64, 'a')));
}

TEST_F(SocketTransportTest, APathLongerThanAnAddressIsRefusedInPlainWords)
{
    // An address holds 107 bytes and the zero byte that ends it.
    for (const std::size_t length : {107U, 108U, 250U}) {
        const std::string name(20, 'P');
        const std::size_t folder = length - pathOf("").size() - name.size() - 1;
        const std::string deep = pathOf(std::string(folder, 'd'));
        std::filesystem::create_directory(deep);
        SocketTransport deepTransport(PortsDirectory::unchecked(deep));
        const std::string path = deep + '/' + name;
        ASSERT_EQ(path.size(), length);
        const auto listener = deepTransport.listen(name, error);
        if (length <= 107) {
            ASSERT_TRUE(listener) << error;
            EXPECT_TRUE(deepTransport.connect(name, error)) << error;
            continue;
        }
        const std::string expected =
            "The path " + path +
            " is longer than the 107 bytes that a socket can have; choose a shorter directory "
            "with --ports DIR.";
        EXPECT_FALSE(listener);
        EXPECT_EQ(error, expected);
        error.clear();
        EXPECT_FALSE(deepTransport.connect(name, error));
        EXPECT_EQ(error, expected);
    }
}

TEST_F(SocketTransportTest, AListenerLeavesASocketThatHasTakenItsPlace)
{
    auto first = listen("Port");
    std::filesystem::remove(pathOf("Port"));
    const auto second = listen("Port");
    ASSERT_TRUE(second) << error;
    first.reset();
    EXPECT_TRUE(isServed(*second, "Port"));
}

TEST_F(SocketTransportTest, ADirectoryThatIsGoneIsAnError)
{
    std::filesystem::remove(directory.path());
    EXPECT_EQ(refusal("Port"),
              "The port " + pathOf("Port") + " cannot be made: No such file or directory");
    EXPECT_FALSE(transport.connect("Port", error));
}

TEST_F(SocketTransportTest, CallersWaitForAConnectionCallback)
{
    const auto listener = listen("Port");
    const auto caller = transport.connect("Port", error);
    ASSERT_TRUE(caller);
    caller->send(5, 0, false, false, {});
    turnOnce();
    std::unique_ptr<FrameConnection> accepted;
    int received = 0;
    listener->setConnectionCallback([&](std::unique_ptr<FrameConnection> connection) {
        accepted = std::move(connection);
        accepted->setFrameCallback(
            [&](const FrameReader::View& frame) { received = frame.messageId; });
    });
    EXPECT_TRUE(runUntil([&] { return received == 5; }));
}

TEST_F(SocketTransportTest, TheConnectionCallbackMayDestroyTheListener)
{
    auto listener = listen("Port");
    bool wasCalled = false;
    listener->setConnectionCallback([&](std::unique_ptr<FrameConnection> connection) {
        listener.reset();
        wasCalled = connection->isOpen();
    });
    const auto one = transport.connect("Port", error);
    const auto other = transport.connect("Port", error);
    EXPECT_TRUE(runUntil([&] { return wasCalled; }));
    bool isRefused = false;
    other->setClosedCallback([&] { isRefused = true; });
    EXPECT_TRUE(runUntil([&] { return isRefused; })) << "nobody is left to accept the second";
    EXPECT_TRUE(std::filesystem::is_empty(directory.path()));
}

TEST_F(SocketTransportTest, SocketsAreNotInherited)
{
    const auto listener = listen("Port");
    const auto connection = transport.connect("Port", error);
    std::unique_ptr<FrameConnection> accepted;
    listener->setConnectionCallback(
        [&](std::unique_ptr<FrameConnection> caller) { accepted = std::move(caller); });
    ASSERT_TRUE(runUntil([&] { return accepted != nullptr; }));
    int sockets = 0;
    for (int descriptor = 3; descriptor < 256; ++descriptor) {
        struct stat found {
        };
        if (::fstat(descriptor, &found) != 0 || !S_ISSOCK(found.st_mode))
            continue;
        ++sockets;
        EXPECT_NE(::fcntl(descriptor, F_GETFD) & FD_CLOEXEC, 0) << descriptor;
    }
    EXPECT_GE(sockets, 3);
}

// The undefined-behaviour sanitizer opens descriptors for its checks of objects. Its reports are
// wrong if it cannot.
#ifdef __has_feature
#define ORVANE_UNDEFINED_SANITIZER __has_feature(undefined_behavior_sanitizer)
#else
#define ORVANE_UNDEFINED_SANITIZER 0
#endif
#if !ORVANE_UNDEFINED_SANITIZER
TEST_F(SocketTransportTest, ACallerWaitsUntilThereIsADescriptorForIt)
{
    const auto listener = listen("Port");
    int accepted = 0;
    listener->setConnectionCallback([&](std::unique_ptr<FrameConnection>) { ++accepted; });
    const auto caller = transport.connect("Port", error);
    ASSERT_TRUE(caller);
    rlimit before{};
    ASSERT_EQ(::getrlimit(RLIMIT_NOFILE, &before), 0);
    rlimit none = before;
    none.rlim_cur = 3; // fewer than there are
    ASSERT_EQ(::setrlimit(RLIMIT_NOFILE, &none), 0);
    const bool isReported = runUntil([&] { return !log.lines.empty(); });
    turnOnce();
    turnOnce();
    EXPECT_EQ(::setrlimit(RLIMIT_NOFILE, &before), 0);
    EXPECT_TRUE(isReported);
    EXPECT_EQ(accepted, 0);
    EXPECT_EQ(log.errors(),
              std::vector<std::string>{"A connection cannot be accepted: Too many open files\n"})
        << "one line, not one for each turn";
    EXPECT_TRUE(runUntil([&] { return accepted == 1; }));
}

#endif

TEST_F(SocketTransportTest, ACallerOfAnotherUserIsRefused)
{
    ORVANE_SKIP_UNLESS_ROOT();
    const auto listener = listen("Port");
    listener->setConnectionCallback([](std::unique_ptr<FrameConnection>) { FAIL(); });
    ASSERT_EQ(::chmod(directory.path().c_str(), 0755), 0);
    ASSERT_EQ(::chmod(pathOf("Port").c_str(), 0777), 0);
    FileDescriptor caller;
    {
        const EffectiveUser other(65534, 65534);
        caller = connectPlainly("Port");
    }
    char byte = 0;
    EXPECT_TRUE(runUntil([&] { return ::recv(caller.get(), &byte, 1, 0) == 0; }));
    EXPECT_EQ(log.errors(),
              std::vector<std::string>{"A connection with a process of user 65534 is refused\n"});
}

TEST_F(SocketTransportTest, AListenerOfAnotherUserIsRefused)
{
    ORVANE_SKIP_UNLESS_ROOT();
    const auto address = socketAddress(pathOf("Port"), error);
    const FileDescriptor socket = newStreamSocket();
    ASSERT_EQ(::bind(socket.get(), reinterpret_cast<const sockaddr*>(&*address), sizeof *address),
              0);
    {
        const EffectiveUser other(65534, 65534);
        ASSERT_EQ(::listen(socket.get(), 1), 0);
    }
    EXPECT_FALSE(transport.connect("Port", error));
    EXPECT_EQ(error, "The port " + pathOf("Port") + " belongs to another user.");
}

TEST_F(SocketTransportTest, APortThatNobodyAcceptsOnHasNoListener)
{
    EXPECT_FALSE(transport.hasListener("Port"));
    leaveStaleSocket("Port");
    EXPECT_FALSE(transport.hasListener("Port"));
    const auto listener = listen("Port");
    EXPECT_TRUE(transport.hasListener("Port"));
}

} // namespace
} // namespace orvane

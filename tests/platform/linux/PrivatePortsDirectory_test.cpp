#include "platform/linux/PrivatePortsDirectory.h"

#include "platform/linux/PortSocket.h"
#include "platform/linux/StaleSocket.h"
#include "support/TemporaryDirectory.h"

#include <gtest/gtest.h>

#include <cstdlib>
#include <filesystem>
#include <fstream>
#include <sys/stat.h>

namespace orvane
{
namespace
{

class PrivatePortsDirectoryTest : public testing::Test
{
protected:
    PrivatePortsDirectoryTest() { ::setenv("XDG_RUNTIME_DIR", runtime.path().c_str(), 1); }
    ~PrivatePortsDirectoryTest() override { ::unsetenv("XDG_RUNTIME_DIR"); }

    // As mkdtemp() makes it.
    std::string makeDirectory(const std::string& name)
    {
        const std::string path = runtime.path() + '/' + name;
        EXPECT_EQ(::mkdir(path.c_str(), 0700), 0);
        return path;
    }
    static void removeAbandoned(std::time_t later = 0)
    {
        PrivatePortsDirectory::removeAbandoned(std::time(nullptr) + later);
    }

    TemporaryDirectory runtime;
};

TEST_F(PrivatePortsDirectoryTest, IsPrivateAndGoneWithEverythingInItAtTheEnd)
{
    std::string path;
    {
        const PrivatePortsDirectory directory;
        path = directory.path();
        struct stat found {
        };
        ASSERT_EQ(::stat(path.c_str(), &found), 0);
        EXPECT_EQ(found.st_mode & 07777, 0700U);
        EXPECT_TRUE(path.starts_with(runtime.path() + "/orvane-"));
        std::ofstream(path + "/left behind") << "x";
        EXPECT_NE(PrivatePortsDirectory().path(), path);
    }
    EXPECT_FALSE(std::filesystem::exists(path));
}

TEST_F(PrivatePortsDirectoryTest, OneThatAKilledProgramLeftIsRemoved)
{
    const std::string path = makeDirectory("orvane-abcdef");
    leaveStaleSocket(path + "/TelephonyServer");
    leaveStaleSocket(path + "/OrvaneApp.1");
    removeAbandoned();
    EXPECT_FALSE(std::filesystem::exists(path));
}

TEST_F(PrivatePortsDirectoryTest, OneWithoutAServerIsRemovedOnceItIsOlderThanAMinute)
{
    const std::string path = makeDirectory("orvane-abcdef");
    removeAbandoned();
    EXPECT_TRUE(std::filesystem::exists(path)) << "its program may be about to start its server";
    removeAbandoned(62);
    EXPECT_FALSE(std::filesystem::exists(path));
}

TEST_F(PrivatePortsDirectoryTest, OneInUseStays)
{
    const PrivatePortsDirectory directory;
    std::string error;
    const auto server = PortSocket::claim(directory.directory(), "TelephonyServer", error);
    leaveStaleSocket(directory.path() + "/OrvaneApp.1");
    removeAbandoned(3600);
    EXPECT_TRUE(std::filesystem::exists(directory.path() + "/OrvaneApp.1"));
}

TEST_F(PrivatePortsDirectoryTest, WhatMayBelongToSomethingElseStays)
{
    const std::string withFile = makeDirectory("orvane-abcdeg");
    leaveStaleSocket(withFile + "/TelephonyServer");
    std::ofstream(withFile + "/precious") << "x";
    const std::string otherName = makeDirectory("orvane-preferences");
    const std::string otherMode = makeDirectory("orvane-abcdeh");
    ASSERT_EQ(::chmod(otherMode.c_str(), 0755), 0);
    const std::string target = makeDirectory("target");
    std::filesystem::create_directory_symlink(target, runtime.path() + "/orvane-abcdei");
    removeAbandoned(3600);
    for (const std::string& path : {withFile + "/TelephonyServer", otherName, otherMode, target})
        EXPECT_TRUE(std::filesystem::exists(path)) << path;
}

} // namespace
} // namespace orvane

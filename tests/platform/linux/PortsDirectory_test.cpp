#include "platform/linux/PortsDirectory.h"

#include <gtest/gtest.h>

#include <cstdlib>
#include <filesystem>
#include <fstream>
#include <sys/stat.h>
#include <unistd.h>

namespace orvane
{
namespace
{

class PortsDirectoryTest : public testing::Test
{
protected:
    PortsDirectoryTest()
    {
        ::unsetenv("ORVANE_PORTS");
        ::unsetenv("XDG_RUNTIME_DIR");
    }

    [[nodiscard]] std::string below(const std::string& name) const
    {
        return _base.path() + '/' + name;
    }

    // The path that is opened, or else why not.
    static std::string open(const std::string& option)
    {
        std::string error;
        const auto opened = PortsDirectory::open(option, error);
        EXPECT_EQ(opened.has_value(), error.empty());
        EXPECT_EQ(error.find('\n'), std::string::npos);
        return opened ? opened->path() : error;
    }

    static mode_t permissions(const std::string& path)
    {
        struct stat found {
        };
        EXPECT_EQ(::stat(path.c_str(), &found), 0) << path;
        return found.st_mode & 07777;
    }

    static std::string makeDirectory(const std::string& path, mode_t mode)
    {
        EXPECT_EQ(::mkdir(path.c_str(), 0700), 0);
        EXPECT_EQ(::chmod(path.c_str(), mode), 0);
        return path;
    }

private:
    PrivatePortsDirectory _base;
};

TEST_F(PortsDirectoryTest, TheOptionIsTakenBeforeTheVariables)
{
    ::setenv("ORVANE_PORTS", below("variable").c_str(), 1);
    ::setenv("XDG_RUNTIME_DIR", below("runtime").c_str(), 1);
    EXPECT_EQ(open(below("option")), below("option"));
    EXPECT_EQ(open(""), below("variable"));
    EXPECT_FALSE(std::filesystem::exists(below("runtime")));
}

TEST_F(PortsDirectoryTest, WithoutThoseItIsTelephonyInTheRuntimeDirectory)
{
    ::setenv("XDG_RUNTIME_DIR", makeDirectory(below("runtime"), 0700).c_str(), 1);
    EXPECT_EQ(open(""), below("runtime/telephony"));
    ::setenv("ORVANE_PORTS", "", 1);
    EXPECT_EQ(open(""), below("runtime/telephony")) << "an empty variable is not set";
}

TEST_F(PortsDirectoryTest, WithoutARuntimeDirectoryItIsTheUsersOwnInTmp)
{
    const std::string own = "/tmp/telephony-" + std::to_string(::geteuid());
    const bool wasThere = std::filesystem::exists(own);
    for (const char* runtime : {"", "relative"}) {
        ::setenv("XDG_RUNTIME_DIR", runtime, 1);
        EXPECT_NE(open("").find(own), std::string::npos);
    }
    if (!wasThere)
        ::rmdir(own.c_str());
}

TEST_F(PortsDirectoryTest, AMissingDirectoryIsMadePrivate)
{
    ::setenv("XDG_RUNTIME_DIR", makeDirectory(below("runtime"), 0700).c_str(), 1);
    const mode_t before = ::umask(0);
    EXPECT_EQ(permissions(open("")), 0700U);
    EXPECT_EQ(permissions(open(below("option"))), 0700U);
    ::umask(before);
}

TEST_F(PortsDirectoryTest, MissingParentsAreMadeWhereSomebodyNamedThePath)
{
    EXPECT_EQ(open(below("a/b/c")), below("a/b/c"));
    EXPECT_EQ(permissions(below("a")), 0700U);
    ::setenv("ORVANE_PORTS", below("d/e").c_str(), 1);
    EXPECT_EQ(open(""), below("d/e"));
    ::unsetenv("ORVANE_PORTS");

    ::setenv("XDG_RUNTIME_DIR", below("missing").c_str(), 1);
    EXPECT_EQ(open(""), "The ports directory " + below("missing/telephony") +
                            " cannot be made (No such file or directory); choose another with "
                            "--ports DIR.");
    EXPECT_FALSE(std::filesystem::exists(below("missing")));
}

TEST_F(PortsDirectoryTest, ADirectoryThatOthersCanOnlyReadIsFine)
{
    EXPECT_EQ(open(makeDirectory(below("readable"), 0755)), below("readable"));
    EXPECT_EQ(open(below("readable/")), below("readable"));
}

TEST_F(PortsDirectoryTest, ADirectoryThatGroupOrOthersCanWriteIsRefused)
{
    for (const mode_t mode : {0720U, 0702U, 0777U, 01777U}) {
        const std::string path = makeDirectory(below("open" + std::to_string(mode)), mode);
        EXPECT_EQ(open(path), "The ports directory " + path +
                                  " can be written by its group or by others; take that away with "
                                  "chmod go-w " +
                                  path + " or choose another with --ports DIR.");
        EXPECT_EQ(permissions(path), mode);
    }
}

TEST_F(PortsDirectoryTest, ADirectoryOfSomebodyElseIsRefused)
{
    std::string path = "/"; // root's
    std::string owner = "0";
    if (::geteuid() == 0) {
        path = makeDirectory(below("others"), 0755);
        ASSERT_EQ(::chown(path.c_str(), 65534, 65534), 0);
        owner = "65534";
    }
    EXPECT_EQ(open(path), "The ports directory " + path + " belongs to user " + owner +
                              "; choose another with --ports DIR.");
}

TEST_F(PortsDirectoryTest, WhatIsNoDirectoryIsRefused)
{
    const std::string path = below("file");
    std::ofstream(path) << "x";
    EXPECT_EQ(open(path), "The ports directory " + path +
                              " is not a directory; choose another with --ports DIR.");
    EXPECT_EQ(open(path + "/below"), "The ports directory " + path +
                                         "/below cannot be made (Not a directory); choose another "
                                         "with --ports DIR.");
}

TEST_F(PortsDirectoryTest, ALinkOfTheUsersOwnIsFollowedAndItsTargetChecked)
{
    makeDirectory(below("good"), 0700);
    makeDirectory(below("bad"), 0777);
    std::filesystem::create_symlink(below("good"), below("to-good"));
    std::filesystem::create_symlink(below("bad"), below("to-bad"));
    std::filesystem::create_symlink(below("none"), below("to-none"));
    EXPECT_EQ(open(below("to-good")), below("to-good"));
    EXPECT_NE(open(below("to-bad")).find("can be written"), std::string::npos);
    EXPECT_NE(open(below("to-none")).find("cannot be used"), std::string::npos);
}

TEST_F(PortsDirectoryTest, ALinkOfSomebodyElseIsRefusedWhereverItLeads)
{
    if (::geteuid() != 0)
        GTEST_SKIP() << "only root can make one";
    makeDirectory(below("good"), 0700);
    const std::string link = below("link");
    std::filesystem::create_symlink(below("good"), link);
    ASSERT_EQ(::lchown(link.c_str(), 65534, 65534), 0);
    for (const std::string& path : {link, link + "/"})
        EXPECT_EQ(open(path), "The ports directory " + link +
                                  " is a symbolic link of user 65534; choose another with --ports "
                                  "DIR.");
}

TEST_F(PortsDirectoryTest, APrivateDirectoryIsGoneWithAllInItAtTheEnd)
{
    std::string path;
    {
        const PrivatePortsDirectory directory;
        path = directory.path();
        EXPECT_EQ(permissions(path), 0700U);
        std::ofstream(path + "/left behind") << "x";
        EXPECT_NE(PrivatePortsDirectory().path(), path);
    }
    EXPECT_FALSE(std::filesystem::exists(path));
}

} // namespace
} // namespace orvane

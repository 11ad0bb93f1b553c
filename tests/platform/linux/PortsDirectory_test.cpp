#include "platform/linux/PortsDirectory.h"

#include "platform/linux/EffectiveUser.h"
#include "platform/linux/PrivatePortsDirectory.h"

#include <gtest/gtest.h>

#include <array>
#include <cstdio>
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

    // The path that is opened, or the error.
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

TEST_F(PortsDirectoryTest, ADirectoryOfTheUsersOwnNeedsTheModeThatKeepsAllOthersOut)
{
    EXPECT_EQ(open(makeDirectory(below("private"), 0700) + "/"), below("private"));
    for (const mode_t mode : {0755U, 0711U, 0720U, 0702U, 0777U, 01777U, 01770U, 02700U, 0500U}) {
        const std::string path = makeDirectory(below("mode" + std::to_string(mode)), mode);
        std::array<char, 8> text{};
        std::snprintf(text.data(), text.size(), "%04o", mode);
        EXPECT_EQ(open(path), "The ports directory " + path + " has the mode " + text.data() +
                                  " instead of 0700; choose another with --ports DIR.");
        EXPECT_EQ(permissions(path), mode);
    }
}

TEST_F(PortsDirectoryTest, TheDirectoryForTemporaryFilesIsRefusedWithoutAdviceToChangeIt)
{
    const std::string error = open("/tmp");
    EXPECT_EQ(error.find("chmod"), std::string::npos) << error;
    EXPECT_NE(error.find("choose another with --ports DIR."), std::string::npos) << error;
}

TEST_F(PortsDirectoryTest, ADirectoryMadeBelowASetGroupIdOneIsPrivateAllTheSame)
{
    makeDirectory(below("team"), 02770);
    EXPECT_EQ(open(below("team/ports")), below("team/ports"));
    EXPECT_EQ(permissions(below("team/ports")), 0700U);
}

TEST_F(PortsDirectoryTest, ASharedDirectoryBelongsToItsUserAndHasExactlyItsMode)
{
    ORVANE_SKIP_UNLESS_ROOT();
    constexpr uid_t kOwner = 2001;
    constexpr gid_t kGroup = 3001;
    const std::string path = makeDirectory(below("shared"), 0700);
    std::string error;
    const auto openAs = [&](mode_t mode, std::optional<uid_t> sharedOwner) {
        error.clear();
        EXPECT_EQ(::chown(path.c_str(), kOwner, kGroup), 0);
        EXPECT_EQ(::chmod(path.c_str(), mode), 0);
        return PortsDirectory::existing(path, error, sharedOwner);
    };
    const auto shared = openAs(01770, kOwner);
    ASSERT_TRUE(shared) << error;
    EXPECT_TRUE(shared->isShared());
    EXPECT_EQ(shared->owner(), kOwner);
    EXPECT_EQ(shared->group(), kGroup);

    for (const mode_t mode : {0770U, 01777U, 01775U, 03770U, 01700U}) {
        EXPECT_FALSE(openAs(mode, kOwner)) << mode;
        EXPECT_NE(error.find("of user telephonyd has the mode "), std::string::npos) << error;
        EXPECT_NE(error.find("instead of 1770"), std::string::npos) << error;
    }
    EXPECT_FALSE(openAs(01770, std::nullopt));
    EXPECT_NE(error.find("belongs to user 2001"), std::string::npos) << error;
    EXPECT_FALSE(openAs(01770, kOwner + 1));
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
    EXPECT_NE(open(below("to-bad")).find("has the mode 0777"), std::string::npos);
    EXPECT_NE(open(below("to-none")).find("cannot be used"), std::string::npos);
}

TEST_F(PortsDirectoryTest, ALinkOfSomebodyElseIsRefusedWhereverItIsInThePath)
{
    ORVANE_SKIP_UNLESS_ROOT();
    makeDirectory(below("good"), 0700);
    makeDirectory(below("good/inner"), 0700);
    const std::string link = below("link");
    std::filesystem::create_symlink(below("good"), link);
    ASSERT_EQ(::lchown(link.c_str(), 65534, 65534), 0);
    for (const char* rest : {"", "/", "/.", "/./", "//.", "/inner", "/./inner", "/../good"})
        EXPECT_NE(open(link + rest)
                      .find("is reached through a symbolic link of user 65534; choose "
                            "another with --ports DIR."),
                  std::string::npos)
            << rest;
}

} // namespace
} // namespace orvane

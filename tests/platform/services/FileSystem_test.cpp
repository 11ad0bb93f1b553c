#include "platform/services/FileSystem.h"

#include "support/TemporaryDirectory.h"

#include <gtest/gtest.h>

#include <cerrno>
#include <csignal>
#include <filesystem>
#include <sys/resource.h>
#include <sys/stat.h>
#include <unistd.h>

namespace orvane
{
namespace
{

namespace fs = std::filesystem;

Bytes numbered(std::size_t size)
{
    Bytes bytes(size);
    for (std::size_t i = 0; i < size; ++i)
        bytes[i] = static_cast<std::uint8_t>(i * 31);
    return bytes;
}

TEST(FileSystemTest, PathsAreTakenBelowTheRoot)
{
    struct Case {
        const char* root;
        const char* path;
        const char* located;
    };
    for (const auto& [root, path, located] : {
             Case{"/",         "/a/b", "/a/b"      },
             Case{"",          "/a/b", "/a/b"      },
             Case{"/tmp/x",    "/a/b", "/tmp/x/a/b"},
             Case{"/tmp/x/",   "/a/b", "/tmp/x/a/b"},
             Case{"/tmp/x///", "/a",   "/tmp/x/a"  },
             Case{"relative",  "/a",   "relative/a"},
    })
        EXPECT_EQ(FileSystem(root).located(path), located) << root << ' ' << path;
    EXPECT_EQ(FileSystem().located("/a"), "/a");
}

TEST(FileSystemTest, ExistenceIsAskedBelowTheRoot)
{
    const TemporaryDirectory directory;
    const FileSystem files(directory.path());
    EXPECT_FALSE(files.exists("/marker"));
    ASSERT_TRUE(writeFile(directory.path() + "/marker", {}));
    EXPECT_TRUE(files.exists("/marker"));
    EXPECT_FALSE(files.exists("/marker/below"));
    fs::create_directory(directory.path() + "/folder");
    EXPECT_TRUE(files.exists("/folder"));
    EXPECT_FALSE(FileSystem(directory.path() + "/folder").exists("/marker"));
}

TEST(FileSystemTest, FoldersAreMadeForTheUserAlone)
{
    const TemporaryDirectory directory;
    const FileSystem files(directory.path());
    EXPECT_FALSE(files.makeOwnFolder("/a/b/c"));
    for (const char* folder : {"/a", "/a/b", "/a/b/c"})
        EXPECT_EQ(fs::status(directory.path() + folder).permissions(), fs::perms::owner_all);
    EXPECT_FALSE(files.makeOwnFolder("/a/b/c"));
    ASSERT_TRUE(writeFile(directory.path() + "/file", {}));
    for (const char* folder : {"/file", "/file/below"})
        EXPECT_EQ(files.makeOwnFolder(folder), std::errc::not_a_directory) << folder;
}

TEST(FileSystemTest, NoFolderIsMadeInAnotherUsersFolder)
{
    if (geteuid() != 0)
        GTEST_SKIP() << "only root can give a folder to another user";
    const TemporaryDirectory directory;
    const FileSystem files(directory.path());
    fs::create_directory(directory.path() + "/theirs");
    ASSERT_EQ(chown((directory.path() + "/theirs").c_str(), 65534, 65534), 0);
    EXPECT_EQ(files.makeOwnFolder("/theirs/mine"), std::errc::no_such_file_or_directory);
    EXPECT_TRUE(fs::is_empty(directory.path() + "/theirs"));
    EXPECT_FALSE(files.makeOwnFolder("/theirs")); // exists
}

TEST(FileSystemTest, WhatIsWrittenIsRead)
{
    const TemporaryDirectory directory;
    const std::string path = directory.path() + "/file";
    // Shorter files after longer ones: nothing of the earlier file may be left. 65536 bytes are
    // read at a time.
    for (const std::size_t size : {200000U, 131072U, 65537U, 65536U, 65535U, 1U, 0U}) {
        ASSERT_TRUE(writeFile(path, numbered(size))) << size;
        EXPECT_EQ(readFile(path), numbered(size)) << size;
    }
}

TEST(FileSystemTest, FileLongerThanTheLimitIsNotRead)
{
    const TemporaryDirectory directory;
    const std::string path = directory.path() + "/file";
    for (const std::size_t size : {0U, 1U, 1000U, 65536U, 70000U}) {
        ASSERT_TRUE(writeFile(path, numbered(size)));
        EXPECT_EQ(readFile(path, size), numbered(size)) << size;
        EXPECT_EQ(readFile(path, size + 1), numbered(size)) << size;
        if (size > 0) {
            EXPECT_FALSE(readFile(path, size - 1)) << size;
        }
    }
}

TEST(FileSystemTest, WhatIsNoReadableFileIsNotRead)
{
    const TemporaryDirectory directory;
    EXPECT_FALSE(readFile(directory.path() + "/missing"));
    EXPECT_FALSE(readFile(directory.path() + "/missing/file"));
    EXPECT_FALSE(readFile(directory.path()));
    EXPECT_FALSE(readFile(""));
}

TEST(FileSystemTest, WritingWhereThereIsNoFolderFails)
{
    const TemporaryDirectory directory;
    EXPECT_FALSE(writeFile(directory.path() + "/missing/file", numbered(1)));
    EXPECT_FALSE(fs::exists(directory.path() + "/missing"));
    EXPECT_FALSE(writeFile(directory.path(), numbered(1)));
    EXPECT_TRUE(fs::is_directory(directory.path()));
}

// While it exists, files longer than that many bytes cannot be written, as on a full disk.
class FileSizeLimit
{
public:
    explicit FileSizeLimit(rlim_t bytes) : _signalBefore(std::signal(SIGXFSZ, SIG_IGN))
    {
        getrlimit(RLIMIT_FSIZE, &_before);
        rlimit limited = _before;
        limited.rlim_cur = bytes;
        setrlimit(RLIMIT_FSIZE, &limited);
    }
    ~FileSizeLimit()
    {
        setrlimit(RLIMIT_FSIZE, &_before);
        std::signal(SIGXFSZ, _signalBefore);
    }
    FileSizeLimit(const FileSizeLimit&) = delete;
    FileSizeLimit& operator=(const FileSizeLimit&) = delete;

private:
    void (*_signalBefore)(int);
    rlimit _before{};
};

TEST(FileSystemTest, FailedWriteLeavesNoHalfFile)
{
    const TemporaryDirectory directory;
    const std::string path = directory.path() + "/file";
    // Long contents fail while they are written, the short one when the file is closed.
    for (const std::size_t size : {1000000U, 100000U, 2000U}) {
        bool isWritten = true;
        {
            const FileSizeLimit limit(1000);
            isWritten = writeFile(path, numbered(size));
        }
        EXPECT_FALSE(isWritten) << size;
        EXPECT_FALSE(fs::exists(path)) << size;
    }
    ASSERT_TRUE(writeFile(path, numbered(2000)));
    EXPECT_EQ(readFile(path), numbered(2000));
}

TEST(FileSystemTest, OnlyARegularFileIsReplaced)
{
    const TemporaryDirectory directory;
    const std::string target = directory.path() + "/target";
    ASSERT_TRUE(writeFile(target, numbered(10)));
    const std::string link = directory.path() + "/link";
    const std::string dangling = directory.path() + "/dangling";
    const std::string pipe = directory.path() + "/pipe";
    fs::create_symlink(target, link);
    fs::create_symlink(directory.path() + "/nowhere", dangling);
    ASSERT_EQ(::mkfifo(pipe.c_str(), 0600), 0);
    for (const std::string& path : {link, dangling, pipe, std::string("/dev/full")}) {
        errno = 0;
        EXPECT_FALSE(writeFile(path, numbered(20))) << path;
        EXPECT_EQ(errno, EEXIST) << path;
        EXPECT_FALSE(fs::is_regular_file(fs::symlink_status(path))) << path;
    }
    EXPECT_EQ(readFile(target), numbered(10));
    EXPECT_FALSE(fs::exists(directory.path() + "/nowhere"));
}

TEST(FileSystemTest, AnEarlierFileIsReplacedByANewOne)
{
    const TemporaryDirectory directory;
    const std::string path = directory.path() + "/file";
    const std::string other = directory.path() + "/other";
    ASSERT_TRUE(writeFile(path, numbered(10)));
    fs::create_hard_link(path, other);
    ASSERT_TRUE(writeFile(path, numbered(20)));
    EXPECT_EQ(readFile(path), numbered(20));
    EXPECT_EQ(readFile(other), numbered(10));
}

TEST(FileSystemTest, AFileOfAnotherUserIsNotReplaced)
{
    if (::geteuid() != 0)
        GTEST_SKIP() << "only root can make one";
    const TemporaryDirectory directory;
    const std::string path = directory.path() + "/file";
    ASSERT_TRUE(writeFile(path, numbered(10)));
    ASSERT_EQ(::chown(path.c_str(), 65534, 65534), 0);
    EXPECT_FALSE(writeFile(path, numbered(20)));
    EXPECT_EQ(readFile(path), numbered(10));
}

TEST(FileSystemTest, FailedWriteOverAnEarlierFileLeavesNoHalfFile)
{
    const TemporaryDirectory directory;
    const std::string path = directory.path() + "/file";
    ASSERT_TRUE(writeFile(path, numbered(10)));
    {
        const FileSizeLimit limit(1000);
        EXPECT_FALSE(writeFile(path, numbered(100000)));
    }
    EXPECT_FALSE(fs::exists(path));
}

TEST(FileSystemTest, ANamedPipeIsNotReadAndNotWaitedFor)
{
    const TemporaryDirectory directory;
    const std::string path = directory.path() + "/pipe";
    ASSERT_EQ(::mkfifo(path.c_str(), 0600), 0);
    EXPECT_EQ(readFile(path), std::nullopt);
    EXPECT_EQ(readFile("/dev/zero", 100), std::nullopt);
}

} // namespace
} // namespace orvane

#include "dlf/BlockFile.h"

#include "platform/services/FileSystem.h"
#include "support/TemporaryDirectory.h"

#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include <cerrno>
#include <csignal>
#include <fcntl.h>
#include <filesystem>
#include <sys/resource.h>
#include <sys/stat.h>
#include <unistd.h>

namespace orvane
{

namespace
{

using ::testing::HasSubstr;
using Existing = DiskBlockFile::Existing;

class BlockFileTest : public ::testing::Test
{
protected:
    std::unique_ptr<DiskBlockFile> create(Existing existing = Existing::Refused)
    {
        return DiskBlockFile::create(path, existing, error);
    }

    TemporaryDirectory directory;
    std::string path = directory.path() + "/drive.dlf";
    std::string error;
};

// Lets no file of this process grow beyond so many bytes.
class FileSizeLimit
{
public:
    explicit FileSizeLimit(rlim_t bytes)
    {
        getrlimit(RLIMIT_FSIZE, &_before);
        rlimit limit = _before;
        limit.rlim_cur = bytes;
        setrlimit(RLIMIT_FSIZE, &limit);
    }
    ~FileSizeLimit()
    {
        setrlimit(RLIMIT_FSIZE, &_before);
        std::signal(SIGXFSZ, _handler);
    }
    FileSizeLimit(const FileSizeLimit&) = delete;
    FileSizeLimit& operator=(const FileSizeLimit&) = delete;

private:
    rlimit _before{};
    void (*_handler)(int) = std::signal(SIGXFSZ, SIG_IGN);
};

TEST_F(BlockFileTest, BlocksAreInTheFileAtOnce)
{
    const auto file = create();
    ASSERT_TRUE(file) << error;
    EXPECT_EQ(file->append(Bytes{1, 2, 3}), 0);
    EXPECT_EQ(file->append(Bytes{4}), 0);
    EXPECT_EQ(readFile(path), (Bytes{1, 2, 3, 4}));
    EXPECT_EQ(file->synchronise(), 0);
}

TEST_F(BlockFileTest, AnExistingFileIsRefusedAndLeftAlone)
{
    ASSERT_TRUE(writeFile(path, Bytes{9, 9}));
    EXPECT_FALSE(create());
    EXPECT_EQ(error,
              "\"" + path + "\" already exists: give --force to overwrite it, or another name");
    EXPECT_EQ(readFile(path), (Bytes{9, 9}));
}

TEST_F(BlockFileTest, ADeviceIsRefusedWithoutForce)
{
    path = "/dev/full";
    EXPECT_FALSE(create());
    EXPECT_EQ(error, "\"/dev/full\" is not a regular file: give --force to write to it anyway, "
                     "or another name");
    EXPECT_TRUE(create(Existing::Overwritten));
}

TEST_F(BlockFileTest, AnExistingFileIsOverwrittenWhereThatIsAskedFor)
{
    ASSERT_TRUE(writeFile(path, Bytes{9, 9}));
    const auto file = create(Existing::Overwritten);
    ASSERT_TRUE(file) << error;
    EXPECT_EQ(file->append(Bytes{1}), 0);
    EXPECT_EQ(readFile(path), Bytes{1});
}

TEST_F(BlockFileTest, WhatCannotBeMadeSaysWhy)
{
    path = directory.path() + "/nowhere/drive.dlf";
    EXPECT_FALSE(create());
    EXPECT_THAT(error, HasSubstr("No such file or directory"));

    path = directory.path();
    for (const Existing existing : {Existing::Refused, Existing::Overwritten}) {
        EXPECT_FALSE(create(existing));
        EXPECT_THAT(error, HasSubstr("Is a directory"));
    }
}

TEST_F(BlockFileTest, ANamedPipeWithoutAReaderIsNotWaitedFor)
{
    ASSERT_EQ(mkfifo(path.c_str(), 0600), 0);
    EXPECT_FALSE(create(Existing::Overwritten));
    EXPECT_THAT(error, HasSubstr("No such device or address"));
}

TEST_F(BlockFileTest, AFullPipeIsWaitedForWithoutLosingABlock)
{
    ASSERT_EQ(mkfifo(path.c_str(), 0600), 0);
    const int reader = ::open(path.c_str(), O_RDONLY | O_NONBLOCK | O_CLOEXEC);
    ASSERT_GE(reader, 0);
    const auto file = create(Existing::Overwritten);
    ASSERT_TRUE(file) << error;
    Bytes expected;
    for (int i = 0; i < 100; ++i) {
        const Bytes block(5000, static_cast<std::uint8_t>(i));
        ASSERT_EQ(file->append(block), 0) << i;
        expected.insert(expected.end(), block.begin(), block.end());
    }
    EXPECT_TRUE(file->isBehind());
    Bytes got;
    Bytes piece(65536);
    while (got.size() < expected.size()) {
        const ssize_t count = ::read(reader, piece.data(), piece.size());
        ASSERT_GT(count, 0) << got.size();
        got.insert(got.end(), piece.begin(), piece.begin() + count);
        EXPECT_EQ(file->synchronise(), 0);
    }
    EXPECT_FALSE(file->isBehind());
    EXPECT_EQ(got, expected);
    ::close(reader);
}

TEST_F(BlockFileTest, AReaderThatNeverReadsEndsItOnceTooMuchWaits)
{
    ASSERT_EQ(mkfifo(path.c_str(), 0600), 0);
    const int reader = ::open(path.c_str(), O_RDONLY | O_NONBLOCK | O_CLOEXEC);
    const auto file = create(Existing::Overwritten);
    ASSERT_TRUE(file) << error;
    const Bytes block(65536, 1);
    std::size_t taken = 0;
    int failure = 0;
    for (; failure == 0 && taken <= 2 * DiskBlockFile::kMostWaitingBytes; taken += block.size())
        failure = file->append(block);
    EXPECT_EQ(failure, ENOBUFS);
    EXPECT_GE(taken, DiskBlockFile::kMostWaitingBytes);
    ::close(reader);
}

TEST_F(BlockFileTest, AFileThatIsDeletedMeanwhileIsTold)
{
    const auto file = create();
    EXPECT_EQ(file->append(Bytes{1}), 0);
    EXPECT_EQ(file->synchronise(), 0);
    std::filesystem::remove(path);
    EXPECT_EQ(file->synchronise(), ENOENT);
}

TEST_F(BlockFileTest, ABlockThatDoesNotFitIsTakenBack)
{
    const auto file = create();
    ASSERT_TRUE(file) << error;
    EXPECT_EQ(file->append(Bytes(90, 7)), 0);
    {
        const FileSizeLimit limit(100);
        EXPECT_EQ(file->append(Bytes(20, 8)), EFBIG);
        EXPECT_EQ(readFile(path), Bytes(90, 7));
    }
    EXPECT_EQ(file->append(Bytes(20, 8)), 0);
    EXPECT_EQ(std::filesystem::file_size(path), 110U);
}

} // namespace

} // namespace orvane

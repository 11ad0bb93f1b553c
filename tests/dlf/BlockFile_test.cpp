#include "dlf/BlockFile.h"

#include "platform/services/FileSystem.h"
#include "support/TemporaryDirectory.h"

#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include <cerrno>
#include <csignal>
#include <filesystem>
#include <sys/resource.h>
#include <sys/stat.h>

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
              "\"" + path + "\" is there already: give --force to overwrite it, or another name");
    EXPECT_EQ(readFile(path), (Bytes{9, 9}));
}

TEST_F(BlockFileTest, WhatIsNoRegularFileIsSaidToBeNone)
{
    path = "/dev/full";
    EXPECT_FALSE(create());
    EXPECT_EQ(error, "\"/dev/full\" is no regular file: give --force to write to it all the same, "
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

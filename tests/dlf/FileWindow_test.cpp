#include "dlf/FileWindow.h"

#include "platform/services/FileSystem.h"
#include "support/TemporaryDirectory.h"

#include <gtest/gtest.h>

#include <filesystem>
#include <sys/stat.h>

namespace orvane
{
namespace
{

constexpr std::size_t kFileBytes = 5'000'000;

std::uint8_t byteAt(std::uint64_t position) { return static_cast<std::uint8_t>(position * 7 >> 3); }

class FileWindowTest : public ::testing::Test
{
protected:
    FileWindowTest()
    {
        Bytes content(kFileBytes);
        for (std::size_t i = 0; i < content.size(); ++i)
            content[i] = byteAt(i);
        writeFile(path, content);
        file = FileWindow::open(path, error);
    }
    void expectBytes(std::uint64_t position, std::size_t count)
    {
        const ByteView bytes = file->bytes(position, count);
        ASSERT_GE(bytes.size(), std::min<std::uint64_t>(count, file->size() - position));
        for (std::size_t i = 0; i < bytes.size(); ++i)
            ASSERT_EQ(bytes[i], byteAt(position + i)) << position << " + " << i;
    }

    TemporaryDirectory directory;
    std::string path = directory.path() + "/a.dlf";
    std::string error;
    std::shared_ptr<FileWindow> file;
};

TEST_F(FileWindowTest, BytesOfAnyPlaceAreRead)
{
    ASSERT_TRUE(file) << error;
    EXPECT_EQ(file->size(), kFileBytes);
    for (const std::uint64_t position : {0U, 3U, 900'000U, 4'999'990U, 17U, 2'000'000U})
        expectBytes(position, 300'000);
    expectBytes(0, 3'000'000);
}

TEST_F(FileWindowTest, OnlyAWindowIsInMemory)
{
    for (std::uint64_t position = 0; position < kFileBytes; position += 1000)
        EXPECT_LE(file->bytes(position, 100'000).size(), std::size_t{1} << 20);
}

TEST_F(FileWindowTest, AFurtherWindowReadsTheSameFileAlsoOnceItIsDeleted)
{
    std::filesystem::remove(path);
    const std::shared_ptr<FileWindow> other = file->another();
    ASSERT_TRUE(other);
    const ByteView last = other->bytes(kFileBytes - 1, 1);
    expectBytes(0, 10);
    ASSERT_EQ(last.size(), 1U);
    EXPECT_EQ(last[0], byteAt(kFileBytes - 1)) << "windows do not move each other";
}

TEST_F(FileWindowTest, NothingIsBehindTheEnd)
{
    EXPECT_TRUE(file->bytes(kFileBytes, 10).empty());
    EXPECT_TRUE(file->bytes(UINT64_MAX, 10).empty());
    EXPECT_EQ(file->bytes(kFileBytes - 4, 10).size(), 4U);
}

TEST_F(FileWindowTest, WhatIsCutOffMeanwhileIsNotThereAnyMore)
{
    expectBytes(0, 10);
    std::filesystem::resize_file(path, 2'000'000);
    EXPECT_EQ(file->bytes(1'900'000, 300'000).size(), 100'000U);
    EXPECT_EQ(file->size(), 2'000'000U);
    EXPECT_TRUE(file->bytes(3'000'000, 10).empty());
    EXPECT_LE(file->size(), 2'000'000U);
}

TEST_F(FileWindowTest, WhatIsAddedMeanwhileIsNotSeen)
{
    std::filesystem::resize_file(path, kFileBytes + 1000);
    EXPECT_EQ(file->bytes(kFileBytes - 10, 1000).size(), 10U);
    EXPECT_EQ(file->size(), kFileBytes);
}

TEST_F(FileWindowTest, AnEmptyFileHasNoBytes)
{
    std::filesystem::resize_file(path, 0);
    file = FileWindow::open(path, error);
    ASSERT_TRUE(file);
    EXPECT_TRUE(file->bytes(0, 10).empty());
}

TEST_F(FileWindowTest, OnlyRegularFilesAreOpened)
{
    EXPECT_FALSE(FileWindow::open(directory.path() + "/none", error));
    EXPECT_EQ(error, "No such file or directory");
    EXPECT_FALSE(FileWindow::open(directory.path(), error));
    EXPECT_EQ(error, "Is a directory");
    const std::string pipe = directory.path() + "/pipe";
    ASSERT_EQ(mkfifo(pipe.c_str(), 0600), 0);
    EXPECT_FALSE(FileWindow::open(pipe, error));
    EXPECT_EQ(error, "Not a regular file");
}

} // namespace
} // namespace orvane

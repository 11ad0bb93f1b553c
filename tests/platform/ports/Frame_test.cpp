#include "platform/ports/Frame.h"

#include <gmock/gmock.h>

#include <chrono>
#include <stdexcept>

namespace orvane
{
namespace
{

// A frame that owns its data, comparable.
struct Received {
    std::int32_t messageId;
    std::uint32_t serial;
    bool wantsReply;
    bool isReply;
    Bytes data;
    friend bool operator==(const Received&, const Received&) = default;
};

std::vector<Received> takeAll(FrameReader& reader)
{
    std::vector<Received> frames;
    while (const auto frame = reader.next())
        frames.push_back({frame->messageId, frame->serial, frame->wantsReply, frame->isReply,
                          Bytes(frame->data.begin(), frame->data.end())});
    return frames;
}

Bytes framed(std::int32_t messageId, std::uint32_t serial, bool wantsReply, bool isReply,
             const Bytes& data)
{
    Bytes bytes;
    appendFrame(bytes, messageId, serial, wantsReply, isReply, data);
    return bytes;
}

Bytes header(std::uint32_t length, std::uint32_t flags)
{
    Bytes bytes(kFrameHeaderBytes);
    for (unsigned i = 0; i < 4; ++i) {
        bytes[i] = static_cast<std::uint8_t>(length >> (8 * i));
        bytes[12 + i] = static_cast<std::uint8_t>(flags >> (8 * i));
    }
    return bytes;
}

TEST(AppendFrameTest, WritesLengthIdSerialFlagsAndDataInLittleEndian)
{
    Bytes bytes = {0xEE}; // earlier bytes stay
    appendFrame(bytes, -2, 0x01020304, true, true, Bytes{0xAA, 0xBB});
    EXPECT_EQ(bytes, (Bytes{0xEE, 2, 0, 0, 0, 0xFE, 0xFF, 0xFF, 0xFF, 4, 3, 2, 1, 3, 0, 0, 0, 0xAA,
                            0xBB}));
}

TEST(AppendFrameTest, RefusesDataBeyondTheLimit)
{
    Bytes bytes;
    EXPECT_THROW(appendFrame(bytes, 0, 0, false, false, Bytes(kFrameDataLimit + 1)),
                 std::length_error);
    EXPECT_TRUE(bytes.empty());
}

TEST(FrameReaderTest, ReadsBackWhatWasWritten)
{
    const std::vector<Received> frames = {
        {0,         0,          false, false, {}       },
        {1,         7,          true,  false, {1, 2, 3}},
        {-1,        0xFFFFFFFF, false, true,  {0}      },
        {INT32_MIN, 0x80000000, true,  true,  {9, 9}   },
    };
    Bytes stream;
    for (const Received& frame : frames)
        appendFrame(stream, frame.messageId, frame.serial, frame.wantsReply, frame.isReply,
                    frame.data);
    FrameReader reader;
    reader.append(stream);
    EXPECT_EQ(takeAll(reader), frames);
    EXPECT_FALSE(reader.hasFailed());
}

TEST(FrameReaderTest, GivesTheSameFramesHoweverTheStreamIsSplitInTwo)
{
    Bytes stream = framed(1, 2, true, false, {1, 2, 3, 4, 5});
    appendFrame(stream, 3, 4, false, true, {});
    appendFrame(stream, 5, 6, false, false, Bytes(20, 7));
    FrameReader whole;
    whole.append(stream);
    const auto expected = takeAll(whole);
    ASSERT_EQ(expected.size(), 3U);

    for (std::size_t at = 0; at <= stream.size(); ++at) {
        FrameReader reader;
        reader.append(Bytes(stream.begin(), stream.begin() + static_cast<std::ptrdiff_t>(at)));
        auto frames = takeAll(reader);
        reader.append(Bytes(stream.begin() + static_cast<std::ptrdiff_t>(at), stream.end()));
        for (auto& frame : takeAll(reader))
            frames.push_back(std::move(frame));
        EXPECT_EQ(frames, expected) << "split at " << at;
    }
}

TEST(FrameReaderTest, GivesTheSameFramesByteForByte)
{
    Bytes stream = framed(1, 2, true, false, {1, 2, 3, 4, 5});
    appendFrame(stream, 3, 4, false, true, {});
    FrameReader reader;
    std::vector<Received> frames;
    std::vector<std::size_t> completedAt;
    for (std::size_t i = 0; i < stream.size(); ++i) {
        reader.append(ByteView(stream).subspan(i, 1));
        for (auto& frame : takeAll(reader)) {
            frames.push_back(std::move(frame));
            completedAt.push_back(i);
        }
    }
    EXPECT_EQ(frames, (std::vector<Received>{
                          {1, 2, true,  false, {1, 2, 3, 4, 5}},
                          {3, 4, false, true,  {}             }
    }));
    EXPECT_EQ(completedAt, (std::vector<std::size_t>{20, 36}));
}

TEST(FrameReaderTest, TakesAFrameOfExactlyTheLimit)
{
    FrameReader reader;
    reader.append(framed(1, 1, false, false, Bytes(kFrameDataLimit, 0x5A)));
    const auto frame = reader.next();
    ASSERT_TRUE(frame);
    EXPECT_EQ(frame->data.size(), kFrameDataLimit);
    EXPECT_FALSE(reader.hasFailed());
}

TEST(FrameReaderTest, FailsAtOneByteMoreThanTheLimit)
{
    FrameReader reader;
    reader.append(header(kFrameDataLimit + 1, 0));
    EXPECT_FALSE(reader.next());
    EXPECT_TRUE(reader.hasFailed());
    EXPECT_EQ(reader.failedLength(), kFrameDataLimit + 1);
    EXPECT_EQ(reader.failureText(), "Message of 16777217 bytes is larger than the limit of "
                                    "16777216; closing the connection");
}

TEST(FrameReaderTest, GivesTheFramesBeforeAnOversizedOneAndNoneAfter)
{
    Bytes stream = framed(1, 1, false, false, {1});
    const Bytes oversized = header(0xFFFFFFFF, 0);
    stream.insert(stream.end(), oversized.begin(), oversized.end());
    FrameReader reader;
    reader.append(stream);
    EXPECT_EQ(takeAll(reader).size(), 1U);
    EXPECT_TRUE(reader.hasFailed());

    reader.append(framed(2, 2, false, false, {2}));
    EXPECT_FALSE(reader.next());
    EXPECT_TRUE(reader.hasFailed());
    EXPECT_EQ(reader.failedLength(), 0xFFFFFFFF);
}

TEST(FrameReaderTest, LooksOnlyAtTheFlagBitsThatHaveAMeaning)
{
    const struct {
        std::uint32_t flags;
        bool wantsReply;
        bool isReply;
    } kCases[] = {
        {0xFFFFFFFC, false, false},
        {0xFFFFFFFD, true,  false},
        {0x80000002, false, true },
        {0x00000007, true,  true },
    };
    for (const auto& each : kCases) {
        FrameReader reader;
        reader.append(header(0, each.flags));
        const auto frame = reader.next();
        ASSERT_TRUE(frame);
        EXPECT_EQ(frame->wantsReply, each.wantsReply) << each.flags;
        EXPECT_EQ(frame->isReply, each.isReply) << each.flags;
    }
}

TEST(FrameReaderTest, TellsWhichFrameHasArrivedInPart)
{
    FrameReader reader;
    EXPECT_EQ(reader.unfinishedFrame(), std::nullopt);
    const Bytes frame = framed(1, 2, false, false, Bytes(10));
    for (std::uint64_t number = 0; number < 3; ++number) {
        reader.append(ByteView(frame).first(1));
        EXPECT_FALSE(reader.next());
        EXPECT_EQ(reader.unfinishedFrame(), number);
        reader.append(ByteView(frame).subspan(1));
        EXPECT_TRUE(reader.next());
        EXPECT_FALSE(reader.next());
        EXPECT_EQ(reader.unfinishedFrame(), std::nullopt);
    }
}

// If the rest of the buffer were moved for each frame, this would move most of a terabyte.
TEST(FrameReaderTest, TakesManySmallFramesOfOneReadInLinearTime)
{
    constexpr std::size_t kFrames = 100'000;
    Bytes stream;
    for (std::size_t i = 0; i < kFrames; ++i)
        appendFrame(stream, 0, static_cast<std::uint32_t>(i), false, false, Bytes(140));
    FrameReader reader;
    reader.append(stream);
    const auto start = std::chrono::steady_clock::now();
    std::size_t count = 0;
    // Nor may appending between the frames move the rest each time.
    for (; reader.next(); ++count)
        reader.append({});
    EXPECT_EQ(count, kFrames);
    EXPECT_LT(std::chrono::steady_clock::now() - start, std::chrono::seconds(10));
}

} // namespace
} // namespace orvane

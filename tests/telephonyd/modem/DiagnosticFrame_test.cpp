#include "telephonyd/modem/DiagnosticFrame.h"

#include <gmock/gmock.h>

#include <string_view>

namespace orvane
{
namespace
{

using testing::ElementsAre;
using testing::IsEmpty;

Bytes bytesOf(std::string_view text) { return Bytes(text.begin(), text.end()); }

Bytes frameOf(const Bytes& payload)
{
    Bytes frame;
    appendDiagnosticFrame(frame, payload);
    return frame;
}

std::vector<Bytes> payloadsOf(DiagnosticFrameReader& reader, const Bytes& bytes,
                              std::size_t pieceBytes)
{
    std::vector<Bytes> payloads;
    for (std::size_t at = 0; at < bytes.size(); at += pieceBytes) {
        reader.append(ByteView(bytes).subspan(at, std::min(pieceBytes, bytes.size() - at)));
        while (const auto payload = reader.next())
            payloads.emplace_back(payload->begin(), payload->end());
    }
    return payloads;
}

struct Read {
    std::vector<Bytes> payloads;
    std::uint64_t dropped = 0;
};

Read read(const Bytes& bytes, std::size_t pieceBytes = 1000)
{
    DiagnosticFrameReader reader;
    Read result;
    result.payloads = payloadsOf(reader, bytes, pieceBytes);
    result.dropped = reader.droppedFrames();
    return result;
}

Bytes operator+(Bytes left, const Bytes& right)
{
    left.insert(left.end(), right.begin(), right.end());
    return left;
}

TEST(DiagnosticFrameTest, TheChecksumIsThatOfX25)
{
    EXPECT_EQ(crc16X25(bytesOf("123456789")), 0x906E); // the catalogues' check value
    EXPECT_EQ(crc16X25({}), 0);
}

TEST(DiagnosticFrameTest, AFrameIsThePayloadItsChecksumLowByteFirstAndAnEnd)
{
    EXPECT_EQ(frameOf({0}), (Bytes{0x00, 0x78, 0xF0, 0x7E}));
    EXPECT_EQ(frameOf({0x73, 0, 0, 0, 1, 0, 0, 0}),
              (Bytes{0x73, 0, 0, 0, 1, 0, 0, 0, 0x61, 0x9D, 0x7E}));
}

TEST(DiagnosticFrameTest, EndAndEscapeBytesAreEscapedInPayloadAndChecksum)
{
    EXPECT_EQ(frameOf({0x7E, 0x7D, 0x41}), (Bytes{0x7D, 0x5E, 0x7D, 0x5D, 0x41, 0x3E, 0x45, 0x7E}));
    EXPECT_EQ(frameOf({0x1B, 0x00}), (Bytes{0x1B, 0x00, 0x7D, 0x5E, 0x7D, 0x5E, 0x7E}));
}

TEST(DiagnosticFrameTest, FramesInPiecesOfAnySizeReadAsTheSame)
{
    const std::vector<Bytes> payloads = {Bytes(1), bytesOf("~}A"), Bytes(2, 0x1B),
                                         bytesOf("long text")};
    Bytes stream;
    for (const Bytes& payload : payloads)
        appendDiagnosticFrame(stream, payload);
    for (std::size_t piece = 1; piece <= stream.size(); ++piece) {
        const Read result = read(stream, piece);
        EXPECT_EQ(result.payloads, payloads) << piece;
        EXPECT_EQ(result.dropped, 0U) << piece;
    }
}

TEST(DiagnosticFrameTest, AnEmptyFrameIsNothing)
{
    const Read result = read(Bytes{0x7E, 0x7E} + frameOf({5}) + Bytes{0x7E} + frameOf({6}));
    EXPECT_THAT(result.payloads, ElementsAre(Bytes{5}, Bytes{6}));
    EXPECT_EQ(result.dropped, 0U);
}

TEST(DiagnosticFrameTest, WhatCannotBeAFrameIsDroppedAndCountedAndTheNextOneIsRead)
{
    Bytes changed = frameOf(bytesOf("payload"));
    changed[3] ^= 0x55;
    Bytes lost = frameOf(bytesOf("payload"));
    lost.erase(lost.begin() + 3);
    const Bytes bareFrame = {0x00, 0x78, 0xF0};
    const Bytes escapes(200'000, 0x7D);
    const Bytes tooLong(DiagnosticFrameReader::kLongestFrame + 1, 1);
    const Bytes end = {0x7E};
    const std::pair<const char*, Bytes> cases[] = {
        {"text",                     bytesOf("\r\nRDY\r\n+CFUN: 1\r\n~")},
        {"a changed byte",           changed                            },
        {"a lost byte",              lost                               },
        {"one byte",                 bytesOf("A~")                      },
        {"a checksum of nothing",    Bytes(2) + end                     },
        {"an escape before the end", bytesOf("A}~")                     },
        {"a frame and an escape",    bareFrame + bytesOf("}~")          },
        {"more than the most bytes", tooLong + end                      },
        {"escapes without an end",   escapes + end                      },
    };
    for (const auto& [name, bytes] : cases) {
        const Read result = read(bytes + frameOf({5}), 777);
        EXPECT_THAT(result.payloads, ElementsAre(Bytes{5})) << name;
        EXPECT_EQ(result.dropped, 1U) << name;
    }
}

TEST(DiagnosticFrameTest, TheLongestFrameIsRead)
{
    const Bytes payload(DiagnosticFrameReader::kLongestFrame - 2, 1);
    const Bytes frame = frameOf(payload);
    ASSERT_EQ(frame.size(), DiagnosticFrameReader::kLongestFrame + 1);
    EXPECT_THAT(read(frame).payloads, ElementsAre(payload));
    const Read longer = read(frameOf(Bytes(payload.size() + 1, 1)));
    EXPECT_THAT(longer.payloads, IsEmpty());
    EXPECT_EQ(longer.dropped, 1U);
}

} // namespace
} // namespace orvane

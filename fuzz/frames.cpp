// A stream in arbitrary pieces gives the same frames as the stream in one piece.
//
// The input's first byte is the number of piece lengths that follow it, one byte each; they are
// used in turn, again and again. The rest is the stream.

#include "platform/ports/Frame.h"

#include <algorithm>
#include <cstdlib>

namespace
{

using namespace orvane;

struct Parsed {
    Bytes frames; // each written again
    std::size_t count = 0;
    bool failed = false;
    std::uint32_t failedLength = 0;

    bool operator==(const Parsed&) const = default;
};

void takeAll(FrameReader& reader, Parsed& parsed)
{
    while (const auto frame = reader.next()) {
        appendFrame(parsed.frames, frame->messageId, frame->serial, frame->wantsReply,
                    frame->isReply, frame->data);
        ++parsed.count;
    }
    parsed.failed = reader.hasFailed();
    parsed.failedLength = reader.failedLength();
}

Parsed parse(ByteView stream, ByteView pieces)
{
    FrameReader reader;
    Parsed parsed;
    std::size_t turn = 0;
    while (!stream.empty()) {
        std::size_t size = stream.size();
        if (!pieces.empty())
            size = std::min<std::size_t>(size, std::size_t{1} + pieces[turn++ % pieces.size()]);
        // An exactly sized copy, so that the address sanitizer sees one byte too many.
        const Bytes piece(stream.begin(), stream.begin() + static_cast<std::ptrdiff_t>(size));
        reader.append(piece);
        takeAll(reader, parsed);
        stream = stream.subspan(size);
    }
    return parsed;
}

} // namespace

extern "C" int LLVMFuzzerTestOneInput(const std::uint8_t* data, std::size_t size)
{
    const ByteView input(data, size);
    if (input.empty())
        return 0;
    const std::size_t pieceCount = std::min<std::size_t>(input[0], input.size() - 1);
    const ByteView pieces = input.subspan(1, pieceCount);
    const ByteView stream = input.subspan(1 + pieceCount);
    const Parsed whole = parse(stream, {});
    if (parse(stream, pieces) != whole)
        std::abort();
    // Frames that are written again read as the same frames.
    const Parsed again = parse(whole.frames, pieces);
    if (again.frames != whole.frames || again.count != whole.count || again.failed)
        std::abort();
    // No byte of a whole frame is lost: only the last, unfinished one may be missing.
    if (whole.frames.size() > stream.size())
        std::abort();
    return 0;
}

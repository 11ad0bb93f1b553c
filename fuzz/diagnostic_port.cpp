// What a modem may send: any bytes in any pieces to a server that asks its requests meanwhile.
//
// The input's first byte is the number of piece lengths that follow it, one byte each; they are
// used in turn, again and again. The rest is the stream. Frames in pieces must read as the same
// frames as in one piece, and what was read and written again must read as the same.

#include "doubles/ManualMainQueue.h"
#include "platform/services/Services.h"
#include "telephonyd/modem/DiagnosticFrame.h"
#include "telephonyd/modem/DiagnosticModem.h"

#include <algorithm>
#include <cstdlib>

namespace
{

using namespace orvane;
using namespace std::chrono_literals;

struct Parsed {
    Bytes frames; // each written again
    std::uint64_t count = 0;
    std::uint64_t dropped = 0;
    bool operator==(const Parsed&) const = default;
};

template <typename Take>
void inPieces(ByteView stream, ByteView pieces, const Take& take)
{
    std::size_t turn = 0;
    while (!stream.empty()) {
        std::size_t size = stream.size();
        if (!pieces.empty())
            size = std::min<std::size_t>(size, std::size_t{1} + pieces[turn++ % pieces.size()]);
        // An exactly sized copy, so that the address sanitizer sees one byte too many.
        take(Bytes(stream.begin(), stream.begin() + static_cast<std::ptrdiff_t>(size)));
        stream = stream.subspan(size);
    }
}

Parsed parse(ByteView stream, ByteView pieces)
{
    DiagnosticFrameReader reader;
    Parsed parsed;
    inPieces(stream, pieces, [&](const Bytes& piece) {
        reader.append(piece);
        while (const auto payload = reader.next()) {
            appendDiagnosticFrame(parsed.frames, *payload);
            ++parsed.count;
        }
    });
    parsed.dropped = reader.droppedFrames();
    return parsed;
}

// A device that the fuzzer speaks for.
class FuzzedDevice final : public ByteDevice
{
public:
    explicit FuzzedDevice(FuzzedDevice*& self) : _self(self) { _self = this; }
    ~FuzzedDevice() override { _self = nullptr; }
    FuzzedDevice(const FuzzedDevice&) = delete;
    FuzzedDevice& operator=(const FuzzedDevice&) = delete;
    void setCallbacks(ReceivedCallback received, ClosedCallback) override
    {
        _received = std::move(received);
    }
    void write(ByteView) override {}
    void give(ByteView bytes) { _received(bytes); }

private:
    FuzzedDevice*& _self;
    ReceivedCallback _received;
};

void serve(ByteView stream, ByteView pieces)
{
    ManualMainQueue queue;
    FuzzedDevice* device = nullptr;
    DiagnosticModem modem(
        queue, [&device](std::string&) { return std::make_unique<FuzzedDevice>(device); },
        {"fuzzed", std::nullopt});
    if (modem.start())
        std::abort();
    const LogCodes codes = {0xB0C2, 0x4005};
    const auto listener = modem.listen(codes, [&codes](ByteView message) {
        // Nothing but whole items of codes that were asked for.
        if (message.size() < 13 || message[0] != 1)
            std::abort();
        if (!codes.contains(static_cast<std::uint16_t>(message[3] | message[4] << 8)))
            std::abort();
        if (message.size() - 1 != static_cast<std::size_t>(message[1] | message[2] << 8))
            std::abort();
    });
    inPieces(stream, pieces, [&](const Bytes& piece) {
        if (device)
            device->give(piece);
        modem.technology();
        queue.advance(300ms);
    });
    bool isDone = false;
    modem.stop([&isDone] { isDone = true; });
    queue.advance(20s);
    if (!isDone)
        std::abort();
}

} // namespace

extern "C" int LLVMFuzzerTestOneInput(const std::uint8_t* data, std::size_t size)
{
    const ByteView input(data, size);
    if (input.empty())
        return 0;
    static NullLog silence;
    Services::current().setLog(&silence);
    const std::size_t pieceCount = std::min<std::size_t>(input[0], input.size() - 1);
    const ByteView pieces = input.subspan(1, pieceCount);
    const ByteView stream = input.subspan(1 + pieceCount);
    const Parsed whole = parse(stream, {});
    if (parse(stream, pieces) != whole)
        std::abort();
    const Parsed again = parse(whole.frames, pieces);
    if (again.frames != whole.frames || again.count != whole.count || again.dropped != 0)
        std::abort();
    serve(stream, pieces);
    return 0;
}

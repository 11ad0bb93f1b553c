// A modem's log items: from the bytes of its diagnostic port to the messages of those who listen.

#include "doubles/ManualMainQueue.h"
#include "platform/services/Services.h"
#include "telephonyd/modem/DiagnosticFrame.h"
#include "telephonyd/modem/DiagnosticModem.h"

#include <benchmark/benchmark.h>

#include <algorithm>

namespace
{

using namespace orvane;

constexpr std::size_t kItems = 1000;
constexpr std::size_t kPieceBytes = 4096; // as a serial device gives them

Bytes framesOfItems()
{
    // Length, code 0xB0C2, timestamp, 25 bytes, with two that are escaped.
    Bytes payload = {0x10, 0, 37, 0, 37, 0, 0xC2, 0xB0};
    payload.resize(4 + 37, 0x41);
    payload[20] = 0x7E;
    payload[30] = 0x7D;
    Bytes frames;
    for (std::size_t i = 0; i < kItems; ++i)
        appendDiagnosticFrame(frames, payload);
    return frames;
}

template <typename Take>
void inPieces(const Bytes& bytes, const Take& take)
{
    for (std::size_t at = 0; at < bytes.size(); at += kPieceBytes)
        take(ByteView(bytes).subspan(at, std::min(kPieceBytes, bytes.size() - at)));
}

void readFrames(benchmark::State& state)
{
    const Bytes frames = framesOfItems();
    DiagnosticFrameReader reader;
    for (auto _ : state)
        inPieces(frames, [&](ByteView piece) {
            reader.append(piece);
            while (const auto payload = reader.next())
                benchmark::DoNotOptimize(payload->data());
        });
    state.SetItemsProcessed(static_cast<std::int64_t>(state.iterations() * kItems));
    state.SetBytesProcessed(static_cast<std::int64_t>(state.iterations() * frames.size()));
}

// A device that answers each request with what it wants to hear.
class AgreeableDevice final : public ByteDevice
{
public:
    AgreeableDevice(MainQueue& queue, ReceivedCallback& received)
        : _queue(queue), _received(received)
    {
    }
    void setCallbacks(ReceivedCallback received, ClosedCallback) override
    {
        _received = std::move(received);
    }
    void write(ByteView bytes) override
    {
        DiagnosticFrameReader reader;
        reader.append(bytes);
        while (const auto payload = reader.next()) {
            Bytes answer(payload->begin(), payload->end());
            if (answer.size() >= 8)
                answer.insert(answer.begin() + 8, 4, 0); // a good status
            if (answer.size() == 12 && answer[4] == 1)
                for (int group = 0; group < 16; ++group)
                    answer.insert(answer.end(), {0xFF, 0x0F, 0, 0});
            Bytes frame;
            appendDiagnosticFrame(frame, answer);
            _queue.async([this, frame] { _received(frame); });
        }
    }

private:
    MainQueue& _queue;
    ReceivedCallback& _received;
};

void itemsToListeners(benchmark::State& state)
{
    static NullLog silence;
    Services::current().setLog(&silence);
    const Bytes frames = framesOfItems();
    ManualMainQueue queue;
    ByteDevice::ReceivedCallback received;
    DiagnosticModem modem(
        queue, [&](std::string&) { return std::make_unique<AgreeableDevice>(queue, received); },
        {"modem", std::nullopt});
    std::size_t messages = 0;
    std::vector<std::unique_ptr<DiagnosticModem::Listener>> listeners;
    for (std::int64_t i = 0; i < state.range(0); ++i)
        listeners.push_back(modem.listen({0xB0C1, 0xB0C2, 0xB179, 0xB17F, 0xB180, 0xB186},
                                         [&messages](ByteView) { ++messages; }));
    modem.start();
    queue.runPending();
    for (auto _ : state)
        inPieces(frames, received);
    if (messages != state.iterations() * kItems * static_cast<std::size_t>(state.range(0)))
        state.SkipWithError("messages are missing");
    state.SetItemsProcessed(static_cast<std::int64_t>(state.iterations() * kItems));
}

BENCHMARK(readFrames);
BENCHMARK(itemsToListeners)->Arg(1)->Arg(10);

} // namespace

// Messages to display rows, as the live view decodes them with its log at rest: a drive through LTE
// as a modem reports it, and the messages that cost most.

#include "LogGenerator/GSM/VRN_GSMLogGenerator.h"
#include "LogGenerator/LTE/LTEClassIndex.h"
#include "LogGenerator/LTE/LTELogGenerator.h"
#include "LogGenerator/UTRAN/UTRANLogGenerator.h"
#include "dlf/DlfReader.h"
#include "platform/base/LogMessage.h"
#include "platform/base/PropertyValue.h"
#include "platform/services/FileSystem.h"
#include "platform/services/Services.h"

#include <benchmark/benchmark.h>

namespace
{

using namespace orvane;

// A refresh comes at the end of this many messages.
constexpr std::size_t kMessagesARefresh = 10000;

std::vector<Bytes> recordedMessages(const char* path)
{
    std::vector<Bytes> messages;
    const Bytes file = readFile(path).value_or(Bytes());
    DlfReader reader(file);
    while (const auto item = reader.next()) {
        messages.push_back({item->type});
        messages.back().insert(messages.back().end(), item->bytes.begin(), item->bytes.end());
    }
    return messages;
}

// A message of the code whose payload bits are all 1.
Bytes largestMessage(std::uint16_t logCode, std::size_t bytes)
{
    Bytes message(bytes, 0xFF);
    message[0] = 1;
    message[3] = static_cast<std::uint8_t>(logCode & 0xFF);
    message[4] = static_cast<std::uint8_t>(logCode >> 8);
    return message;
}

template <typename Generator>
void decode(benchmark::State& state, const std::vector<Bytes>& messages)
{
    DirectoryResources resources(ORVANE_RESOURCES);
    Services::current().setResources(&resources);
    if (messages.empty())
        state.SkipWithError("there are no messages");
    const auto generator = Generator::generator();
    PropertyDictionary display;
    const std::size_t rounds = std::max<std::size_t>(1, kMessagesARefresh / messages.size());
    for (auto _ : state) {
        for (std::size_t round = 0; round < rounds; ++round)
            for (const Bytes& message : messages)
                generator->updateState(display, message);
        benchmark::DoNotOptimize(generator->generateLogUsingState(display));
    }
    state.SetItemsProcessed(state.iterations() * static_cast<std::int64_t>(rounds) *
                            static_cast<std::int64_t>(messages.size()));
    Services::current().setResources(nullptr);
}

void lteDrive(benchmark::State& state)
{
    decode<LTELogGenerator>(state, recordedMessages(ORVANE_TEST_DATA "/lte-drive.dlf"));
}

// The least that decoding can cost: of the same messages only the fields' bits are read and stored.
void lteDriveFloor(benchmark::State& state)
{
    const std::vector<Bytes> messages = recordedMessages(ORVANE_TEST_DATA "/lte-drive.dlf");
    LTEClassIndex index;
    index.init();
    std::vector<std::int64_t> numbers;
    const auto store = [&numbers](PacketView packet, std::span<const Field> fields) {
        for (const Field& field : fields)
            if (const auto raw = field.valueIn(packet))
                numbers.push_back(*raw);
    };
    for (auto _ : state)
        for (const Bytes& message : messages) {
            numbers.clear();
            const auto* sections = index.getSubscribers(logCodeOf(message));
            for (Base* section : sections ? *sections : std::vector<Base*>())
                for (const PacketLayout& layout : static_cast<Section*>(section)->layout().packets)
                    if (layout.logCode == logCodeOf(message)) {
                        store(PacketView(message), layout.fields);
                        if (layout.records)
                            forEachWholeRecord(
                                layout.records->in(PacketView(message)),
                                bytesRead(layout.records->fields),
                                [&](PacketView record) { store(record, layout.records->fields); });
                    }
            benchmark::DoNotOptimize(numbers.data());
        }
    state.SetItemsProcessed(state.iterations() * static_cast<std::int64_t>(messages.size()));
}

void utranWalk(benchmark::State& state)
{
    decode<UTRANLogGenerator>(state, recordedMessages(ORVANE_TEST_DATA "/utran-walk.dlf"));
}
void umtsCity(benchmark::State& state)
{
    decode<VRN_GSMLogGenerator>(state, recordedMessages(ORVANE_TEST_DATA "/umts-city.dlf"));
}
// 32 neighbours of 12 rows.
void lteNeighbors(benchmark::State& state)
{
    decode<LTELogGenerator>(state, {largestMessage(0xB180, 21 + 20 * 32)});
}
// 127 neighbours of 5 rows.
void utranNeighbors(benchmark::State& state)
{
    decode<UTRANLogGenerator>(state, {largestMessage(0xD00A, 168 + 16 * 127)});
}
// 255 UMTS cells of 6 rows and as many GSM cells of 4.
void umtsRanking(benchmark::State& state)
{
    decode<VRN_GSMLogGenerator>(state, {largestMessage(0x4005, 15 + 10 * 255)});
}

BENCHMARK(lteDrive)->Unit(benchmark::kMillisecond);
BENCHMARK(lteDriveFloor)->Unit(benchmark::kMillisecond);
BENCHMARK(utranWalk)->Unit(benchmark::kMillisecond);
BENCHMARK(lteNeighbors)->Unit(benchmark::kMillisecond);
BENCHMARK(utranNeighbors)->Unit(benchmark::kMillisecond);
BENCHMARK(umtsCity)->Unit(benchmark::kMillisecond);
BENCHMARK(umtsRanking)->Unit(benchmark::kMillisecond);

} // namespace

// Diagnostic logs: reading 10 MB (plain, as exported, and damaged in places), and exporting the
// history of a busy channel.

#include "LogGenerator/StateKeys.h"
#include "LogGenerator/VRNLogGenerator.h"
#include "dlf/DlfReader.h"
#include "dlf/DlfTime.h"
#include "platform/base/PropertyValue.h"

#include <benchmark/benchmark.h>

#include <cstdint>

namespace
{

using namespace orvane;

constexpr std::size_t kFileBytes = 10'000'000;
constexpr std::uint64_t kStart = std::uint64_t{1183782848} * kDlfStepsPerSecond << 16;
constexpr std::size_t kItemsBetweenDamages = 2000;

void put(Bytes& to, std::uint64_t value, int width)
{
    for (int i = 0; i < width; ++i)
        to.push_back(static_cast<std::uint8_t>(value >> 8 * i));
}

enum class Kind { Plain, Exported, Damaged };

Bytes makeFile(Kind kind)
{
    Bytes file;
    file.reserve(kFileBytes + 1000);
    for (std::size_t i = 0; file.size() < kFileBytes; ++i) {
        const std::size_t payload = 20 + i * 37 % 120;
        if (kind == Kind::Exported)
            file.push_back(1);
        put(file, payload + 12, 2);
        put(file, 0xB0C0 + i % 64, 2);
        put(file, kStart + i * (std::uint64_t{3} << 16), 8);
        for (std::size_t k = 0; k < payload; ++k)
            file.push_back(static_cast<std::uint8_t>(i * 31 + k * k));
        if (kind == Kind::Damaged && i % kItemsBetweenDamages == 0)
            file.insert(file.end(), 61, 0xED);
    }
    return file;
}

void readFile(benchmark::State& state, Kind kind)
{
    const Bytes file = makeFile(kind);
    std::int64_t items = 0;
    for (auto _ : state) {
        DlfReader reader(file);
        while (const auto item = reader.next()) {
            benchmark::DoNotOptimize(item->logCode);
            ++items;
        }
        benchmark::DoNotOptimize(reader.unplacedBytes());
    }
    state.SetBytesProcessed(state.iterations() * static_cast<std::int64_t>(file.size()));
    state.SetItemsProcessed(items);
}

// Five snapshots of 2 MB each.
void exportHistory(benchmark::State& state)
{
    constexpr std::size_t kSnapshotBytes = 2'000'000;
    const PropertyValue snapshot = PropertyValue::dictionaryOf({
        {kDisplayStateKey, PropertyValue::data(Bytes(kSnapshotBytes, 1))}
    });
    PropertyDictionary model;
    model.set(kHistoryKey,
              PropertyValue::arrayOf({snapshot, snapshot, snapshot, snapshot, snapshot}));
    std::size_t bytes = 0;
    for (auto _ : state)
        bytes += VRNLogGenerator::generateDlfFromState(model)->size();
    state.SetBytesProcessed(static_cast<std::int64_t>(bytes));
}

BENCHMARK(exportHistory)->Unit(benchmark::kMillisecond);
BENCHMARK_CAPTURE(readFile, plain, Kind::Plain)->Unit(benchmark::kMillisecond);
BENCHMARK_CAPTURE(readFile, exported, Kind::Exported)->Unit(benchmark::kMillisecond);
BENCHMARK_CAPTURE(readFile, damaged, Kind::Damaged)->Unit(benchmark::kMillisecond);

} // namespace

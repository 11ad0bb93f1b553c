// Exporting rows of an LTE drive (two of them, and all), and recording a busy channel to disk.

#include "dlf/DlfReader.h"
#include "dlf/DlfTime.h"
#include "platform/base/TelephonyConstants.h"
#include "platform/services/FileSystem.h"
#include "platform/services/MainQueue.h"
#include "platform/services/Services.h"
#include "recordings/CsvRowWriter.h"
#include "recordings/JsonRowWriter.h"
#include "recordings/LogRecorder.h"
#include "recordings/RecordingExport.h"

#include <benchmark/benchmark.h>

#include <filesystem>
#include <unistd.h>

namespace
{

using namespace orvane;

constexpr std::size_t kFileBytes = 4'000'000;
constexpr std::uint64_t kHour = std::uint64_t{3600} * kDlfStepsPerSecond << 16;

std::string temporaryFile(const char* name)
{
    return std::filesystem::temp_directory_path() /
           ("orvane-bench-" + std::to_string(getpid()) + name);
}

// The drive repeated, each round an hour later.
class LongDrive
{
public:
    LongDrive() : path(temporaryFile("-drive.dlf"))
    {
        const Bytes drive = readFile(ORVANE_TEST_DATA "/lte-drive.dlf").value_or(Bytes());
        Bytes file;
        for (std::uint64_t round = 0; !drive.empty() && file.size() < kFileBytes; ++round) {
            DlfReader reader(drive);
            while (const auto item = reader.next()) {
                file.insert(file.end(), item->bytes.begin(), item->bytes.end());
                const std::uint64_t timestamp =
                    item->timestamp == 0 ? 0 : item->timestamp + round * kHour;
                for (std::size_t i = 0; i < 8; ++i)
                    file[file.size() - item->bytes.size() + 4 + i] =
                        static_cast<std::uint8_t>(timestamp >> 8 * i);
            }
        }
        writeFile(path, file);
        bytes = file.size();
    }
    ~LongDrive() { std::filesystem::remove(path); }
    LongDrive(const LongDrive&) = delete;
    LongDrive& operator=(const LongDrive&) = delete;

    std::string path;
    std::size_t bytes = 0;
};

template <typename Writer>
void exportRows(benchmark::State& state, std::vector<std::string> paths)
{
    DirectoryResources resources(ORVANE_RESOURCES);
    Services::current().setResources(&resources);
    const LongDrive drive;
    std::size_t written = 0;
    for (auto _ : state) {
        Writer writer([&written](std::string_view lines) {
            written += lines.size();
            return true;
        });
        RecordingExport recordingExport({drive.path, std::nullopt, std::chrono::seconds(2), paths},
                                        writer, [](double) { return true; });
        if (const auto problem = recordingExport.run())
            state.SkipWithError(problem->c_str());
    }
    benchmark::DoNotOptimize(written);
    state.SetBytesProcessed(state.iterations() * static_cast<std::int64_t>(drive.bytes));
    Services::current().setResources(nullptr);
}

void exportTwoRowsAsCsv(benchmark::State& state)
{
    exportRows<CsvRowWriter>(state, {"/Serving Cell Measurements/Measured RSRP",
                                     "/Serving Cell Measurements/Measured RSRQ"});
}

void exportAllRowsAsCsv(benchmark::State& state) { exportRows<CsvRowWriter>(state, {}); }
void exportAllRowsAsJson(benchmark::State& state) { exportRows<JsonRowWriter>(state, {}); }

// Does nothing, so that only the cost of each message is measured.
class RestingQueue final : public MainQueue
{
public:
    void async(Task) override {}
    void after(std::chrono::nanoseconds, Task) override {}
    std::unique_ptr<Timer> repeatingTimer(std::chrono::nanoseconds, Task) override
    {
        return nullptr;
    }
};

void recordMessages(benchmark::State& state)
{
    RestingQueue queue;
    const std::string path = temporaryFile("-recorded.dlf");
    std::string error;
    const auto recorder = LogRecorder::create(
        queue, path, DiskBlockFile::Existing::Overwritten, [](const std::string&) {}, error);
    if (!recorder) {
        state.SkipWithError(error.c_str());
        return;
    }
    recorder->channelOpened(kTSLogChannelTechnology_Varnel_LTE);
    const Bytes message(64, 1);
    for (auto _ : state)
        recorder->messageReceived(message);
    state.SetItemsProcessed(state.iterations());
    std::filesystem::remove(path);
}

BENCHMARK(exportTwoRowsAsCsv)->Unit(benchmark::kMillisecond);
BENCHMARK(exportAllRowsAsCsv)->Unit(benchmark::kMillisecond);
BENCHMARK(exportAllRowsAsJson)->Unit(benchmark::kMillisecond);
BENCHMARK(recordMessages);

} // namespace

// Recordings: reading a long log, playing it by refresh periods, and jumping in it. The log is the
// LTE drive repeated, each round later than the one before: 10 MB, or as many as
// ORVANE_BENCH_MEGABYTES says.

#include "LogGenerator/LogTechnology.h"
#include "dlf/FileWindow.h"
#include "platform/base/TelephonyConstants.h"
#include "platform/services/FileSystem.h"
#include "platform/services/Services.h"
#include "recordings/LogSurvey.h"
#include "recordings/RefreshPeriods.h"
#include "recordings/SeekableLog.h"

#include <benchmark/benchmark.h>

#include <algorithm>
#include <cstdio>
#include <cstdlib>
#include <filesystem>
#include <fstream>
#include <random>
#include <stdexcept>
#include <unistd.h>

namespace
{

using namespace orvane;

constexpr const char* kTechnology = kTSLogChannelTechnology_Varnel_LTE;
constexpr std::uint64_t kRound = (std::uint64_t{301} * 800) << 16;

std::size_t wantedBytes()
{
    const char* megabytes = std::getenv("ORVANE_BENCH_MEGABYTES");
    return (megabytes ? std::strtoul(megabytes, nullptr, 10) : 10) * 1'000'000;
}

// The long log in a file that is removed at the program's end.
class LongDrive
{
public:
    LongDrive()
        : _path(std::filesystem::temp_directory_path() /
                ("orvane-bench-" + std::to_string(getpid()) + ".dlf"))
    {
        const auto drive = readFile(ORVANE_TEST_DATA "/lte-drive.dlf");
        if (!drive)
            throw std::runtime_error("the recording cannot be read");
        std::ofstream file(_path, std::ios::binary);
        std::size_t written = 0;
        for (std::uint64_t round = 0; written < wantedBytes(); ++round) {
            Bytes bytes = *drive;
            DlfReader reader(*drive);
            while (const auto item = reader.next())
                for (std::size_t i = 0; item->timestamp != 0 && i < 8; ++i)
                    bytes[item->position + 4 + i] =
                        static_cast<std::uint8_t>((item->timestamp + round * kRound) >> 8 * i);
            file.write(reinterpret_cast<const char*>(bytes.data()),
                       static_cast<std::streamsize>(bytes.size()));
            written += bytes.size();
        }
    }
    ~LongDrive()
    {
        std::error_code error;
        std::filesystem::remove(_path, error);
    }

    static std::shared_ptr<FileWindow> open()
    {
        static const LongDrive drive;
        // Without a log and a console, sections write nothing.
        static NullLog log;
        static DirectoryResources resources(ORVANE_RESOURCES);
        Services::current().setLog(&log);
        Services::current().setResources(&resources);
        std::string error;
        auto file = FileWindow::open(drive._path.string(), error);
        if (!file)
            throw std::runtime_error(error);
        return file;
    }

private:
    std::filesystem::path _path;
};

double residentMegabytes()
{
    std::ifstream statm("/proc/self/statm");
    long pages = 0;
    statm >> pages >> pages;
    return static_cast<double>(pages * sysconf(_SC_PAGESIZE)) / 1e6;
}

void survey(benchmark::State& state)
{
    std::int64_t bytes = 0;
    for (auto _ : state) {
        const auto file = LongDrive::open();
        LogSurvey survey(file);
        while (survey.takeSlice()) {
        }
        benchmark::DoNotOptimize(survey.technology());
        bytes += static_cast<std::int64_t>(file->size());
    }
    state.SetBytesProcessed(bytes);
}

void refreshPeriods(benchmark::State& state)
{
    std::int64_t bytes = 0;
    const double before = residentMegabytes();
    for (auto _ : state) {
        const auto file = LongDrive::open();
        RefreshPeriods periods(file, kTechnology, std::chrono::seconds(2));
        while (periods.takeSlice() != RefreshPeriods::Reached::End) {
        }
        bytes += static_cast<std::int64_t>(file->size());
        state.counters["grownMB"] = residentMegabytes() - before;
    }
    state.SetBytesProcessed(bytes);
}

std::unique_ptr<SeekableLog> readLog()
{
    auto log = std::make_unique<SeekableLog>(LongDrive::open(), "drive.dlf", kTechnology);
    while (log->readSlice()) {
    }
    return log;
}

void readForPlaying(benchmark::State& state)
{
    const double before = residentMegabytes();
    std::int64_t bytes = 0;
    for (auto _ : state) {
        benchmark::DoNotOptimize(readLog());
        bytes += static_cast<std::int64_t>(LongDrive::open()->size());
        state.counters["grownMB"] = residentMegabytes() - before;
    }
    state.SetBytesProcessed(bytes);
}

template <typename Move>
void measureMoves(benchmark::State& state, const Move& move)
{
    const auto log = readLog();
    std::mt19937_64 random(1);
    double longest = 0;
    for (auto _ : state) {
        const auto start = std::chrono::steady_clock::now();
        move(*log, random);
        const std::chrono::duration<double, std::milli> took =
            std::chrono::steady_clock::now() - start;
        longest = std::max(longest, took.count());
        benchmark::DoNotOptimize(log->display());
    }
    state.counters["longestMs"] = longest;
}

void jumpAnywhere(benchmark::State& state)
{
    measureMoves(state, [](SeekableLog& log, std::mt19937_64& random) {
        const auto range = static_cast<std::uint64_t>(log.duration().count());
        log.moveTo(LogTime(static_cast<LogTime::rep>(random() % range)));
    });
}

void stepBack(benchmark::State& state)
{
    measureMoves(state, [](SeekableLog& log, std::mt19937_64&) {
        log.moveTo(log.position() - std::chrono::seconds(2));
    });
}

void nextServingCell(benchmark::State& state)
{
    measureMoves(state, [](SeekableLog& log, std::mt19937_64&) {
        if (log.position() == log.duration())
            log.moveTo(LogTime(0));
        log.moveToNextServingCell();
    });
}

BENCHMARK(survey)->Unit(benchmark::kMillisecond);
BENCHMARK(refreshPeriods)->Unit(benchmark::kMillisecond);
BENCHMARK(readForPlaying)->Unit(benchmark::kMillisecond);
BENCHMARK(jumpAnywhere)->Unit(benchmark::kMillisecond);
BENCHMARK(stepBack)->Unit(benchmark::kMillisecond);
BENCHMARK(nextServingCell)->Unit(benchmark::kMillisecond);

} // namespace

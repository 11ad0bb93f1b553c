// A log of 100 MB. Memory must not grow with its size.

#include "dlf/FileWindow.h"
#include "platform/base/PropertyValue.h"
#include "platform/base/TelephonyConstants.h"
#include "recordings/RefreshPeriods.h"
#include "recordings/SeekableLog.h"
#include "recordings/support/LogFiles.h"
#include "support/Recording.h"
#include "support/Sanitizers.h"
#include "support/TemporaryDirectory.h"

#include <gtest/gtest.h>

#include <fstream>
#include <random>
#include <unistd.h>

namespace orvane
{
namespace
{

using namespace std::chrono_literals;

constexpr const char* kLte = kTSLogChannelTechnology_Varnel_LTE;
constexpr std::size_t kFileBytes = 100'000'000;
constexpr std::size_t kPayloadBytes = 4000;
constexpr long kMostGrowth = 24'000'000;

long residentBytes()
{
    std::ifstream statm("/proc/self/statm");
    long pages = 0;
    statm >> pages >> pages;
    return pages * sysconf(_SC_PAGESIZE);
}

// For each second a measurement, whose channel is the number of the second, and a long item that
// no decoder takes.
class LongLogTest : public ::testing::Test
{
protected:
    LongLogTest()
    {
        services.useShippedResources();
        std::ofstream file(path, std::ios::binary);
        for (std::size_t written = 0; written < kFileBytes; ++seconds) {
            LogBuilder builder;
            builder.measurement(kLogStart + seconds * kLogSecond,
                                static_cast<std::uint16_t>(seconds));
            builder.item(0x1234, kLogStart + seconds * kLogSecond + kLogStep,
                         Bytes(kPayloadBytes, 7));
            file.write(reinterpret_cast<const char*>(builder.bytes.data()),
                       static_cast<std::streamsize>(builder.bytes.size()));
            written += builder.bytes.size();
        }
        residentAtFirst = residentBytes();
    }
    [[nodiscard]] std::shared_ptr<ByteSource> open() const
    {
        std::string error;
        return FileWindow::open(path, error);
    }
    void expectNoGrowth() const
    {
        if (!ORVANE_ADDRESS_SANITIZER) {
            EXPECT_LT(residentBytes() - residentAtFirst, kMostGrowth);
        }
    }
    static std::string channel(const PropertyValue& display)
    {
        return display["Serving Cell Measurements"]["E-ARFCN"].description();
    }

    TestServices services;
    TemporaryDirectory directory;
    std::string path = directory.path() + "/long.dlf";
    std::uint64_t seconds = 0;
    long residentAtFirst = 0;
};

TEST_F(LongLogTest, IsReadAndMovedAboutInWithoutGrowing)
{
    SeekableLog log(open(), path, kLte);
    int slices = 0;
    while (log.readSlice())
        ++slices;
    EXPECT_GT(slices, 40);
    EXPECT_EQ(log.duration(), std::chrono::seconds(seconds - 1) + 1250us);
    expectNoGrowth();

    std::mt19937_64 random(1);
    for (int i = 0; i < 100; ++i) {
        const std::uint64_t second = random() % (seconds - 1);
        log.moveTo(std::chrono::seconds(second) + 1ms);
        ASSERT_EQ(channel(log.display()), std::to_string(second));
    }
    expectNoGrowth();
}

TEST_F(LongLogTest, IsGoneThroughByPeriodsWithoutGrowing)
{
    RefreshPeriods periods(open(), kLte, 100s);
    std::uint64_t count = 0;
    for (auto reached = periods.takeSlice(); reached != RefreshPeriods::Reached::End;
         reached = periods.takeSlice())
        if (reached == RefreshPeriods::Reached::Period) {
            ++count;
            const std::uint64_t last = std::min(count * 100, seconds) - 1;
            ASSERT_EQ(channel(periods.decoder().display()), std::to_string(last));
        }
    EXPECT_EQ(count, (seconds + 99) / 100);
    expectNoGrowth();
}

} // namespace
} // namespace orvane

// A modem that logs as fast as a pseudo-terminal takes it: nothing is lost, and memory stays small.

#include "dlf/DlfReader.h"
#include "modems/ModemTest.h"
#include "platform/services/FileSystem.h"
#include "support/PseudoTerminal.h"
#include "support/Sanitizers.h"
#include "telephonyd/modem/DiagnosticFrame.h"

#include <gmock/gmock.h>

#include <chrono>
#include <filesystem>
#include <poll.h>
#include <sstream>

namespace orvane
{
namespace
{

using Clock = std::chrono::steady_clock;

constexpr std::size_t kItems = 100'000;
// A serving-cell packet as in the item: length, code 0xB0C2, timestamp, 25 bytes.
constexpr std::size_t kItemBytes = 37;

void put(Bytes& bytes, std::size_t offset, std::size_t width, std::uint64_t value)
{
    for (std::size_t i = 0; i < width; ++i)
        bytes[offset + i] = static_cast<std::uint8_t>(value >> 8 * i);
}

// The frames of all items, made beforehand, each with its number in its timestamp.
Bytes framesOfItems()
{
    Bytes frames;
    for (std::size_t number = 0; number < kItems; ++number) {
        Bytes payload(4 + kItemBytes);
        payload[0] = 0x10;
        put(payload, 2, 2, kItemBytes);
        put(payload, 4, 2, kItemBytes);
        put(payload, 6, 2, 0xB0C2);
        put(payload, 8, 8, (std::uint64_t{1} << 56) + number);
        appendDiagnosticFrame(frames, payload);
    }
    return frames;
}

// Kilobytes that the process has in memory.
long residentKilobytes(pid_t pid)
{
    std::ifstream status("/proc/" + std::to_string(pid) + "/status");
    for (std::string line; std::getline(status, line);)
        if (line.starts_with("VmRSS:"))
            return std::stol(line.substr(6));
    return 0;
}

// Seconds of processor time that the process has used.
double processorSeconds(pid_t pid)
{
    std::ifstream stat("/proc/" + std::to_string(pid) + "/stat");
    std::string text;
    std::getline(stat, text);
    // After the program's name, which is in parentheses.
    std::istringstream fields(text.substr(text.rfind(')') + 1));
    std::string skipped;
    for (int i = 0; i < 11; ++i)
        fields >> skipped;
    long user = 0;
    long system = 0;
    fields >> user >> system;
    return static_cast<double>(user + system) / static_cast<double>(::sysconf(_SC_CLK_TCK));
}

class ThroughputTest : public ModemTest
{
protected:
    // Serves the modem's side: answers each request with what it wants to hear. Returns once a mask
    // has been set.
    void answerUntilCodesAreOn()
    {
        DiagnosticFrameReader reader;
        bool isOn = false;
        const auto end = Clock::now() + std::chrono::seconds(30);
        while (!isOn && Clock::now() < end) {
            Bytes bytes;
            terminal.readInto(bytes);
            reader.append(bytes);
            while (const auto payload = reader.next()) {
                Bytes answer(payload->begin(), payload->end());
                if (answer.size() >= 8)
                    answer.insert(answer.begin() + 8, 4, 0); // a good status
                if (answer.size() == 12 && answer[4] == 1)
                    for (int group = 0; group < 16; ++group)
                        answer.insert(answer.end(), {0xFF, 0x0F, 0, 0});
                isOn = answer.size() > 12 && answer[4] == 3;
                Bytes frame;
                appendDiagnosticFrame(frame, answer);
                ASSERT_EQ(terminal.write(frame), frame.size());
            }
            pollfd waiting{terminal.descriptor(), POLLIN, 0};
            ::poll(&waiting, 1, 10);
        }
        ASSERT_TRUE(isOn);
    }
    // Writes as the other side takes it.
    void send(ByteView bytes)
    {
        while (!bytes.empty()) {
            const std::size_t taken = terminal.write(bytes);
            bytes = bytes.subspan(taken);
            pollfd waiting{terminal.descriptor(), POLLOUT, 0};
            if (taken == 0) {
                ASSERT_EQ(::poll(&waiting, 1, 30'000), 1);
            }
        }
    }

    PseudoTerminal terminal;
};

TEST_F(ThroughputTest, ItemsAsFastAsThePortTakesThemAllReachTheViewer)
{
    const Bytes frames = framesOfItems();
    const auto server = telephonyd({"--port", terminal.path(), "--technology", "lte"});
    const std::string recording = file("all.dlf");
    std::unique_ptr<ChildProcess> program;
    ASSERT_TRUE(server->waitForError("Serving in"));
    program = viewer({"--record", recording, "--refresh", "2", "--log", "none"});
    answerUntilCodesAreOn();

    const double processorBefore = processorSeconds(server->pid());
    const auto begin = Clock::now();
    send(frames);
    const auto recordedBytes = [&] {
        std::error_code error;
        const auto size = std::filesystem::file_size(recording, error);
        return error ? 0 : size;
    };
    EXPECT_TRUE(PretendModem::waitUntil([&] { return recordedBytes() >= kItems * kItemBytes; }));
    const std::chrono::duration<double> taken = Clock::now() - begin;
    const double processor = processorSeconds(server->pid()) - processorBefore;
    const long resident = residentKilobytes(server->pid());
    std::printf("%.0f items a second, %.2f s of processor time for each 100,000, %ld KB resident\n",
                static_cast<double>(kItems) / taken.count(), processor, resident);
    if (!ORVANE_ADDRESS_SANITIZER) {
        EXPECT_LT(resident, 15'000);
    }

    program->writeLine("quit");
    EXPECT_EQ(program->waitForEnd(), 0);
    const Bytes recorded = readFile(recording).value_or(Bytes());
    DlfReader reader(recorded);
    std::size_t count = 0;
    while (const auto item = reader.next())
        if (item->logCode == 0xB0C2 && item->timestamp == (std::uint64_t{1} << 56) + count)
            ++count;
    EXPECT_EQ(count, kItems);
}

} // namespace
} // namespace orvane

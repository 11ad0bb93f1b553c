#pragma once

#include "platform/base/Calendar.h"
#include "platform/services/Clock.h"
#include "platform/services/Console.h"
#include "platform/services/Services.h"
#include "platform/services/SystemLog.h"

#include <algorithm>
#include <map>
#include <string>
#include <vector>

namespace orvane
{

// A log that keeps its lines for tests.
class RecordingLog final : public SystemLog
{
public:
    struct Line {
        LogPriority priority;
        std::string text; // with its newline, if it has one
        friend bool operator==(const Line&, const Line&) = default;
    };

    RecordingLog() : SystemLog(LogPriority::Info) {}
    void write(LogPriority priority, std::string_view text) override
    {
        lines.push_back({priority, std::string(text)});
    }

    [[nodiscard]] std::vector<std::string> texts(LogPriority priority) const
    {
        std::vector<std::string> found;
        for (const Line& line : lines)
            if (line.priority == priority)
                found.push_back(line.text);
        return found;
    }
    // All lines in order, of every priority.
    [[nodiscard]] std::vector<std::string> texts() const
    {
        std::vector<std::string> found;
        for (const Line& line : lines)
            found.push_back(line.text);
        return found;
    }
    [[nodiscard]] std::vector<std::string> errors() const { return texts(LogPriority::Error); }
    [[nodiscard]] std::vector<std::string> warnings() const { return texts(LogPriority::Warning); }
    [[nodiscard]] std::size_t count(std::string_view text) const
    {
        return static_cast<std::size_t>(std::count_if(
            lines.begin(), lines.end(), [text](const Line& line) { return line.text == text; }));
    }

    std::vector<Line> lines;
};

class RecordingConsole final : public Console
{
public:
    void writeLine(std::string_view line) override { lines.emplace_back(line); }
    std::vector<std::string> lines;
};

// Resources that a test sets, by "NAME.TYPE"; their paths are "/resources/NAME.TYPE".
class MemoryResources final : public Resources
{
public:
    [[nodiscard]] std::optional<Bytes> load(std::string_view name,
                                            std::string_view type) const override;
    [[nodiscard]] std::vector<std::string> pathsOfType(std::string_view type) const override;
    void put(const std::string& fileName, std::string_view text);

private:
    std::map<std::string, Bytes> _files;
};

// A clock and a time zone that the test sets.
class TestClock final : public Clock
{
public:
    [[nodiscard]] double secondsSince1970() const override { return now; }
    [[nodiscard]] TimeZone timeZoneAt(double) const override { return zone; }
    double now = 1795255200; // 2026-11-21 10:00:00 UTC
    TimeZone zone;
};

// Replaces the services of the process by recording ones during its lifetime.
struct TestServices {
    TestServices();
    ~TestServices();
    TestServices(const TestServices&) = delete;
    TestServices& operator=(const TestServices&) = delete;

    RecordingLog log;
    RecordingConsole console;
    MemoryResources memoryResources;
    // The shipped resources; useShippedResources() makes them current.
    DirectoryResources shippedResources;
    TestClock clock;

    void useShippedResources();
};

} // namespace orvane

#pragma once

#include <optional>
#include <string_view>

namespace orvane
{

// The system log's priorities, with its numbers: a smaller number is more urgent.
enum class LogPriority { Error = 3, Warning = 4, Notice = 5, Info = 6 };

// "error", "warning", "notice" or "info".
const char* logPriorityName(LogPriority priority);
// The inverse; nullopt for any other text.
std::optional<LogPriority> logPriorityNamed(std::string_view name);

// Where the program's log lines go. write() may be called from any thread.
class SystemLog
{
public:
    explicit SystemLog(LogPriority lowest = LogPriority::Warning) : _lowest(lowest) {}
    virtual ~SystemLog() = default;
    SystemLog(const SystemLog&) = delete;
    SystemLog& operator=(const SystemLog&) = delete;

    // Whether a line of this priority is passed on. Ask before making a costly text.
    [[nodiscard]] bool accepts(LogPriority priority) const { return priority <= _lowest; }
    // The text may end in a newline, which is not part of the line.
    virtual void write(LogPriority priority, std::string_view text) = 0;

private:
    LogPriority _lowest;
};

// Passes nothing on.
class NullLog final : public SystemLog
{
public:
    NullLog() : SystemLog(static_cast<LogPriority>(0)) {}
    void write(LogPriority, std::string_view) override {}
};

// Writes "PRIORITY: TEXT" lines to standard error, as printableText() makes them.
class StandardErrorLog final : public SystemLog
{
public:
    using SystemLog::SystemLog;
    void write(LogPriority priority, std::string_view text) override;
};

// Hands lines to syslog(3) under the given program name, which must outlive it.
class SyslogLog final : public SystemLog
{
public:
    SyslogLog(const char* programName, LogPriority lowest);
    ~SyslogLog() override;
    void write(LogPriority priority, std::string_view text) override;
};

// Format as printf does and write to the process's log (Services::log); nothing is formatted for a
// priority that the log does not accept.
[[gnu::format(printf, 2, 3)]] void logLine(LogPriority priority, const char* format, ...);
[[gnu::format(printf, 1, 2)]] void logError(const char* format, ...);
[[gnu::format(printf, 1, 2)]] void logWarning(const char* format, ...);

} // namespace orvane

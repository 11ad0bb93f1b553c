#include "platform/services/SystemLog.h"

#include "platform/base/FormatText.h"
#include "platform/base/Utf8.h"
#include "platform/services/Services.h"

#include <cstdarg>
#include <cstdio>
#include <string>
#include <syslog.h>

namespace orvane
{

namespace
{

std::string_view withoutNewline(std::string_view text)
{
    return text.ends_with('\n') ? text.substr(0, text.size() - 1) : text;
}

[[gnu::format(printf, 2, 0)]] void logFormatted(LogPriority priority, const char* format,
                                                std::va_list arguments)
{
    SystemLog& log = Services::current().log();
    if (!log.accepts(priority))
        return;
    if (const auto text = formatText(format, arguments))
        log.write(priority, *text);
}

} // namespace

const char* logPriorityName(LogPriority priority)
{
    switch (priority) {
    case LogPriority::Error:
        return "error";
    case LogPriority::Warning:
        return "warning";
    case LogPriority::Notice:
        return "notice";
    case LogPriority::Info:
        return "info";
    }
    return "info";
}

std::optional<LogPriority> logPriorityNamed(std::string_view name)
{
    for (const LogPriority priority :
         {LogPriority::Error, LogPriority::Warning, LogPriority::Notice, LogPriority::Info})
        if (name == logPriorityName(priority))
            return priority;
    return std::nullopt;
}

void StandardErrorLog::write(LogPriority priority, std::string_view text)
{
    // One call a line, so that lines of several threads and processes do not mix.
    std::string line = logPriorityName(priority);
    line += ": ";
    // Texts of files and of the network may be part of it.
    line += printableText(withoutNewline(text));
    line += '\n';
    std::fwrite(line.data(), 1, line.size(), stderr);
}

SyslogLog::SyslogLog(const char* programName, LogPriority lowest) : SystemLog(lowest)
{
    openlog(programName, LOG_PID, LOG_USER);
}

SyslogLog::~SyslogLog() { closelog(); }

void SyslogLog::write(LogPriority priority, std::string_view text)
{
    text = withoutNewline(text);
    syslog(static_cast<int>(priority), "%.*s", static_cast<int>(text.size()), text.data());
}

void logLine(LogPriority priority, const char* format, ...)
{
    std::va_list arguments;
    va_start(arguments, format);
    logFormatted(priority, format, arguments);
    va_end(arguments);
}

void logError(const char* format, ...)
{
    std::va_list arguments;
    va_start(arguments, format);
    logFormatted(LogPriority::Error, format, arguments);
    va_end(arguments);
}

void logWarning(const char* format, ...)
{
    std::va_list arguments;
    va_start(arguments, format);
    logFormatted(LogPriority::Warning, format, arguments);
    va_end(arguments);
}

} // namespace orvane

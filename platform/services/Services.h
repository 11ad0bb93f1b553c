#pragma once

#include "platform/services/Clock.h"
#include "platform/services/Console.h"
#include "platform/services/Resources.h"
#include "platform/services/SystemLog.h"

#include <optional>
#include <string>
#include <utility>

namespace orvane
{

// The process-wide services, for operations that have no other way to them (factories, the history,
// log lines). main() and tests set them; until then the log and the console take nothing, there are
// no resources, and the clock is the machine's. None of them is owned.
class Services
{
public:
    static Services& current();

    [[nodiscard]] SystemLog& log() const { return *_log; }
    [[nodiscard]] Console& console() const { return *_console; }
    [[nodiscard]] Resources& resources() const { return *_resources; }
    [[nodiscard]] Clock& clock() const { return *_clock; }

    // Null brings the default back.
    void setLog(SystemLog* log);
    void setConsole(Console* console);
    void setResources(Resources* resources);
    void setClock(Clock* clock);

    // The application's version, if it has one.
    [[nodiscard]] const std::optional<std::string>& version() const { return _version; }
    void setVersion(std::optional<std::string> version) { _version = std::move(version); }

private:
    Services();

    SystemLog* _log;
    Console* _console;
    Resources* _resources;
    Clock* _clock;
    std::optional<std::string> _version;
};

} // namespace orvane

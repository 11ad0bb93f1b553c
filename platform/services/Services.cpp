#include "platform/services/Services.h"

#include "platform/base/Bytes.h"

namespace orvane
{

namespace
{

class NullConsole final : public Console
{
public:
    void writeLine(std::string_view) override {}
};

class NoResources final : public Resources
{
public:
    [[nodiscard]] std::optional<Bytes> load(std::string_view, std::string_view) const override
    {
        return std::nullopt;
    }
    [[nodiscard]] std::vector<std::string> pathsOfType(std::string_view) const override
    {
        return {};
    }
};

struct Defaults {
    NullLog log;
    NullConsole console;
    NoResources resources;
    RealClock clock;
};

Defaults& defaults()
{
    // Never destroyed: destructors of other static objects may still log.
    static auto* const services = new Defaults;
    return *services;
}

} // namespace

Services::Services()
    : _log(&defaults().log), _console(&defaults().console), _resources(&defaults().resources),
      _clock(&defaults().clock)
{
}

Services& Services::current()
{
    static auto* const services = new Services;
    return *services;
}

void Services::setLog(SystemLog* log) { _log = log ? log : &defaults().log; }

void Services::setConsole(Console* console) { _console = console ? console : &defaults().console; }

void Services::setResources(Resources* resources)
{
    _resources = resources ? resources : &defaults().resources;
}

void Services::setClock(Clock* clock) { _clock = clock ? clock : &defaults().clock; }

} // namespace orvane

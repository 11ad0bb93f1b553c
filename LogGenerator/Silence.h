#pragma once

#include "platform/services/Services.h"

namespace orvane
{

// For as long as it lives, the process's log takes nothing, or errors only, and its console
// nothing: for what generators tell of their coming and going, and of messages that they are given
// again.
class Silence
{
public:
    enum class Of { Everything, AllButErrors };

    explicit Silence(Of of = Of::Everything) : _errors(Services::current().log())
    {
        Services& services = Services::current();
        services.setLog(of == Of::Everything ? static_cast<SystemLog*>(&_nothing) : &_errors);
        services.setConsole(nullptr);
    }
    ~Silence()
    {
        Services::current().setLog(&_errors.log);
        Services::current().setConsole(&_console);
    }
    Silence(const Silence&) = delete;
    Silence& operator=(const Silence&) = delete;

private:
    struct ErrorsOnly final : SystemLog {
        explicit ErrorsOnly(SystemLog& of) : SystemLog(LogPriority::Error), log(of) {}
        void write(LogPriority priority, std::string_view text) override
        {
            if (log.accepts(priority))
                log.write(priority, text);
        }
        SystemLog& log;
    };

    NullLog _nothing;
    ErrorsOnly _errors;
    Console& _console = Services::current().console();
};

} // namespace orvane

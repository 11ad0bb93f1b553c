#pragma once

#include "app/AppOptions.h"
#include "app/OrvaneApp.h"

#include <memory>

namespace orvane
{

class QtEventLoop;

// Shows the application to a user or a script, and takes their input.
class FrontEnd
{
public:
    virtual ~FrontEnd() = default;
    // Makes the live view that this front end shows: one with panes unless overridden. Everything
    // passed must outlive it.
    [[nodiscard]] virtual std::unique_ptr<LiveApp>
    makeApp(ModelEnvironment environment, const FileSystem& files, PreferencesStore& preferences)
    {
        return std::make_unique<OrvaneApp>(std::move(environment), files, preferences);
    }
    // The application is about to start. It must not be used once the event loop has ended.
    virtual void begin(LiveApp&) {}
    // The event loop has ended: gives the screen back, before the application's last work.
    virtual void end() {}
    // The exit status of the program, after printing what is wrong.
    [[nodiscard]] virtual int exitStatus() { return 0; }
};

// Everything passed must outlive the front end. Throws std::runtime_error with a line for the user
// if it cannot work here.
std::unique_ptr<FrontEnd> makeOutputFrontEnd(FrontEndKind kind, const AppOptions& options,
                                             QtEventLoop& loop);

// Exit statuses.
inline constexpr int kFailure = 1;
inline constexpr int kUnusableArguments = 2;

// Prints one line on standard error, with the program's name before it.
void complain(const std::string& text);

} // namespace orvane

#pragma once

#include "app/AppOptions.h"
#include "app/OrvaneApp.h"

#include <memory>

namespace orvane
{

class QtEventLoop;

// A way to show the application to a person or a script, and to take what they do.
class FrontEnd
{
public:
    virtual ~FrontEnd() = default;
    // Makes the application's root pane, where it is one of the front end's own; null else.
    [[nodiscard]] virtual OrvaneApp::MakeRootPane rootPaneMaker() { return nullptr; }
    // The application is about to start. It must not be used once the event loop has ended.
    virtual void begin(OrvaneApp&) {}
    // What the program ends with; what is wrong has been told then.
    [[nodiscard]] virtual int exitStatus() { return 0; }
};

// Everything is referred to and must outlive the front end. Throws std::runtime_error with a line
// for the user where it cannot work here.
std::unique_ptr<FrontEnd> makeOutputFrontEnd(FrontEndKind kind, const AppOptions& options,
                                             QtEventLoop& loop);

// Exit statuses.
inline constexpr int kFailure = 1;
inline constexpr int kUnusableArguments = 2;

// Prints one line on standard error as this program's.
void complain(const std::string& text);

} // namespace orvane

#pragma once

#include "app/LiveApp.h"
#include "screens/print/Printer.h"

#include <functional>
#include <string_view>

namespace orvane
{

// The commands that the text and JSON front ends take, a line each: "save DESCRIPTION" and "quit".
class CommandInterpreter
{
public:
    // All must outlive this object.
    CommandInterpreter(LiveApp& app, Printer& output, std::function<void()> quit)
        : _app(app), _output(output), _quit(std::move(quit))
    {
    }

    // One line without its newline; `wasCut` where it was longer than can be read.
    void takeLine(std::string_view line, bool wasCut);

private:
    void save(std::string_view description);

    LiveApp& _app;
    Printer& _output;
    std::function<void()> _quit;
};

} // namespace orvane

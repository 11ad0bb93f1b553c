#pragma once

#include "app/OrvaneApp.h"
#include "screens/print/OutputPane.h"

#include <functional>
#include <string_view>

namespace orvane
{

// The commands that the text and JSON front ends take, a line each: "save DESCRIPTION" and "quit".
class CommandInterpreter
{
public:
    // All are referred to and must outlive this.
    CommandInterpreter(OrvaneApp& app, OutputPane& output, std::function<void()> quit)
        : _app(app), _output(output), _quit(std::move(quit))
    {
    }

    // One line without its newline; `wasCut` where it was longer than can be read.
    void takeLine(std::string_view line, bool wasCut);

private:
    void save(std::string_view description);

    OrvaneApp& _app;
    OutputPane& _output;
    std::function<void()> _quit;
};

} // namespace orvane

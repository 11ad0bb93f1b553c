#pragma once

#include <string_view>

namespace orvane
{

// The one sink for lines that are meant for a person at the console, apart from the data that a
// front end writes to standard output.
class Console
{
public:
    virtual ~Console() = default;
    // One line, without its newline. May be called from any thread.
    virtual void writeLine(std::string_view line) = 0;
};

class StandardErrorConsole final : public Console
{
public:
    void writeLine(std::string_view line) override;
};

// Writes to the process's console (Services::console), formatted as printf does.
[[gnu::format(printf, 1, 2)]] void consoleLine(const char* format, ...);

} // namespace orvane

#pragma once

#include <cstdio>
#include <string_view>

namespace orvane
{

// Where lines for a person at the console go, apart from the data that a front end writes to
// standard output.
class Console
{
public:
    virtual ~Console() = default;
    // One line, without its newline, from any thread.
    virtual void writeLine(std::string_view line) = 0;
};

// Writes lines as printableText() makes them.
class StreamConsole final : public Console
{
public:
    // Standard output or standard error; not owned.
    explicit StreamConsole(std::FILE* stream) : _stream(stream) {}
    void writeLine(std::string_view line) override;

private:
    std::FILE* _stream;
};

// Writes to the process's console (Services::console), formatted as printf does.
[[gnu::format(printf, 1, 2)]] void consoleLine(const char* format, ...);

} // namespace orvane

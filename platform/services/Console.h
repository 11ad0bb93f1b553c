#pragma once

#include <cstdio>
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

#pragma once

#include <chrono>
#include <functional>
#include <optional>
#include <string>
#include <sys/types.h>
#include <vector>

namespace orvane
{

// A program run as a user runs it, with pipes at its three standard streams. Killed at the end if
// it still runs.
class ChildProcess
{
public:
    // argv[0] is the program's path; `environment` are "NAME=VALUE" texts set in addition.
    explicit ChildProcess(const std::vector<std::string>& arguments,
                          const std::vector<std::string>& environment = {});
    ~ChildProcess();
    ChildProcess(const ChildProcess&) = delete;
    ChildProcess& operator=(const ChildProcess&) = delete;

    // Reads on until a line of standard output is accepted, and returns it; nothing when the
    // program has closed its output or the time is over.
    std::optional<std::string>
    waitForLine(const std::function<bool(const std::string&)>& accepts,
                std::chrono::milliseconds timeout = std::chrono::seconds(30));
    // The same for a line that holds the text.
    std::optional<std::string>
    waitForText(const std::string& text,
                std::chrono::milliseconds timeout = std::chrono::seconds(30));
    // Reads on until standard error holds the text.
    bool waitForError(const std::string& text,
                      std::chrono::milliseconds timeout = std::chrono::seconds(30));

    // Waits, without reading, until the pipe at standard output of a program that writes without
    // pause takes no more.
    [[nodiscard]] bool
    waitForFullOutput(std::chrono::milliseconds timeout = std::chrono::seconds(30)) const;

    void writeLine(const std::string& line);
    void closeInput();
    void closeOutput();
    void sendSignal(int signal) const;
    // The exit status, or minus the signal that ended it; nothing when it still runs at the end of
    // the time. What it still writes is kept.
    std::optional<int> waitForEnd(std::chrono::milliseconds timeout = std::chrono::seconds(30));

    // All lines of standard output so far, and all of standard error.
    [[nodiscard]] const std::vector<std::string>& lines() const { return _lines; }
    [[nodiscard]] const std::string& errors() const { return _errors; }
    [[nodiscard]] pid_t pid() const { return _pid; }

private:
    bool readSome(std::chrono::milliseconds timeout);
    bool readUntil(const std::function<bool()>& done, std::chrono::milliseconds timeout);

    pid_t _pid = -1;
    int _input = -1;
    int _output = -1;
    int _error = -1;
    std::string _partialLine;
    std::vector<std::string> _lines;
    std::size_t _linesSeen = 0;
    std::string _errors;
    std::optional<int> _status;
};

} // namespace orvane

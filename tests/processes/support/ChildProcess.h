#pragma once

#include <chrono>
#include <functional>
#include <optional>
#include <string>
#include <sys/types.h>
#include <vector>

namespace orvane
{

// Runs a program with pipes as its three standard streams. The destructor kills it if it still
// runs.
class ChildProcess
{
public:
    // arguments[0] is the program's path. Adds the "NAME=VALUE" texts to the environment.
    explicit ChildProcess(const std::vector<std::string>& arguments,
                          const std::vector<std::string>& environment = {});
    ~ChildProcess();
    ChildProcess(const ChildProcess&) = delete;
    ChildProcess& operator=(const ChildProcess&) = delete;

    // Reads until a line of standard output is accepted, and returns it; nullopt when the program
    // closes its output first or after the time-out.
    std::optional<std::string>
    waitForLine(const std::function<bool(const std::string&)>& accepts,
                std::chrono::milliseconds timeout = std::chrono::seconds(30));
    // The same for a line that contains the text.
    std::optional<std::string>
    waitForText(const std::string& text,
                std::chrono::milliseconds timeout = std::chrono::seconds(30));
    // Reads until standard error contains the text; false after the time-out.
    bool waitForError(const std::string& text,
                      std::chrono::milliseconds timeout = std::chrono::seconds(30));

    // Waits without reading until the pipe of standard output is full. The program must write
    // without pause. False after the time-out.
    [[nodiscard]] bool
    waitForFullOutput(std::chrono::milliseconds timeout = std::chrono::seconds(30)) const;

    void writeLine(const std::string& line);
    void closeInput();
    void closeOutput();
    void sendSignal(int signal) const;
    // Waits for the end and keeps what the program still writes. Returns the exit status, minus
    // the signal number if a signal ended it, or nullopt after the time-out.
    std::optional<int> waitForEnd(std::chrono::milliseconds timeout = std::chrono::seconds(30));

    // What has been read so far: the lines of standard output, and standard error.
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

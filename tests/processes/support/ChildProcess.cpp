#include "processes/support/ChildProcess.h"

#include <array>
#include <cerrno>
#include <csignal>
#include <cstdlib>
#include <fcntl.h>
#include <poll.h>
#include <stdexcept>
#include <sys/ioctl.h>
#include <sys/wait.h>
#include <unistd.h>
#include <utility>

namespace orvane
{

namespace
{

using Clock = std::chrono::steady_clock;

std::array<int, 2> makePipe()
{
    std::array<int, 2> ends{};
    if (::pipe2(ends.data(), O_CLOEXEC) != 0)
        throw std::runtime_error("no pipe");
    return ends;
}

void closeDescriptor(int& descriptor)
{
    if (descriptor >= 0)
        ::close(descriptor);
    descriptor = -1;
}

} // namespace

ChildProcess::ChildProcess(const std::vector<std::string>& arguments,
                           const std::vector<std::string>& environment)
{
    auto input = makePipe();
    auto output = makePipe();
    auto error = makePipe();
    std::vector<char*> argv;
    for (const std::string& argument : arguments)
        argv.push_back(const_cast<char*>(argument.c_str()));
    argv.push_back(nullptr);
    _pid = ::fork();
    if (_pid < 0)
        throw std::runtime_error("no process");
    if (_pid == 0) {
        ::dup2(input[0], STDIN_FILENO);
        ::dup2(output[1], STDOUT_FILENO);
        ::dup2(error[1], STDERR_FILENO);
        for (const std::string& variable : environment)
            ::putenv(const_cast<char*>(variable.c_str()));
        ::execv(argv[0], argv.data());
        ::_exit(127);
    }
    closeDescriptor(input[0]);
    closeDescriptor(output[1]);
    closeDescriptor(error[1]);
    _input = input[1];
    _output = output[0];
    _error = error[0];
}

ChildProcess::~ChildProcess()
{
    if (!_status) {
        ::kill(_pid, SIGKILL);
        ::waitpid(_pid, nullptr, 0);
    }
    closeDescriptor(_input);
    closeDescriptor(_output);
    closeDescriptor(_error);
}

bool ChildProcess::readSome(std::chrono::milliseconds timeout)
{
    std::array<pollfd, 2> waiting{
        {{_output, POLLIN, 0}, {_error, POLLIN, 0}}
    };
    if (_output < 0 && _error < 0)
        return false;
    const int ready = ::poll(waiting.data(), waiting.size(), static_cast<int>(timeout.count()));
    if (ready <= 0)
        return ready == 0 || errno == EINTR;
    std::array<char, 65536> block{};
    if (waiting[0].revents != 0) {
        const ssize_t count = ::read(_output, block.data(), block.size());
        if (count <= 0)
            closeDescriptor(_output);
        for (ssize_t i = 0; i < count; ++i) {
            const char character = block[static_cast<std::size_t>(i)];
            if (character == '\n')
                _lines.push_back(std::exchange(_partialLine, {}));
            else
                _partialLine += character;
        }
    }
    if (waiting[1].revents != 0) {
        const ssize_t count = ::read(_error, block.data(), block.size());
        if (count <= 0)
            closeDescriptor(_error);
        else
            _errors.append(block.data(), static_cast<std::size_t>(count));
    }
    return true;
}

bool ChildProcess::readUntil(const std::function<bool()>& done, std::chrono::milliseconds timeout)
{
    const auto deadline = Clock::now() + timeout;
    while (!done()) {
        const auto left =
            std::chrono::duration_cast<std::chrono::milliseconds>(deadline - Clock::now());
        if (left.count() <= 0 || !readSome(left))
            return done();
    }
    return true;
}

std::optional<std::string>
ChildProcess::waitForLine(const std::function<bool(const std::string&)>& accepts,
                          std::chrono::milliseconds timeout)
{
    std::optional<std::string> found;
    readUntil(
        [&] {
            while (!found && _linesSeen < _lines.size())
                if (accepts(_lines[_linesSeen++]))
                    found = _lines[_linesSeen - 1];
            return found.has_value();
        },
        timeout);
    return found;
}

std::optional<std::string> ChildProcess::waitForText(const std::string& text,
                                                     std::chrono::milliseconds timeout)
{
    return waitForLine(
        [&text](const std::string& line) { return line.find(text) != std::string::npos; }, timeout);
}

bool ChildProcess::waitForError(const std::string& text, std::chrono::milliseconds timeout)
{
    return readUntil([&] { return _errors.find(text) != std::string::npos; }, timeout);
}

bool ChildProcess::waitForFullOutput(std::chrono::milliseconds timeout) const
{
    constexpr int kSteadyChecks = 50;
    const auto deadline = Clock::now() + timeout;
    int waiting = 0;
    int before = 0;
    for (int steady = 0; steady < kSteadyChecks && Clock::now() < deadline; ++steady) {
        if (::ioctl(_output, FIONREAD, &waiting) != 0)
            return false;
        if (waiting != before || waiting == 0)
            steady = 0;
        before = waiting;
        ::poll(nullptr, 0, 10);
    }
    return Clock::now() < deadline;
}

void ChildProcess::writeLine(const std::string& line)
{
    const std::string whole = line + "\n";
    if (::write(_input, whole.data(), whole.size()) != static_cast<ssize_t>(whole.size()))
        throw std::runtime_error("the program takes no input");
}

void ChildProcess::closeInput() { closeDescriptor(_input); }

void ChildProcess::closeOutput() { closeDescriptor(_output); }

void ChildProcess::sendSignal(int signal) const { ::kill(_pid, signal); }

std::optional<int> ChildProcess::waitForEnd(std::chrono::milliseconds timeout)
{
    const auto deadline = Clock::now() + timeout;
    // Both streams end before the process does, or with it.
    readUntil([this] { return _output < 0 && _error < 0; }, timeout);
    while (!_status) {
        int status = 0;
        const pid_t ended = ::waitpid(_pid, &status, WNOHANG);
        if (ended == _pid)
            _status = WIFEXITED(status) ? WEXITSTATUS(status) : -WTERMSIG(status);
        else if (Clock::now() >= deadline)
            return std::nullopt;
        else
            ::poll(nullptr, 0, 1);
    }
    return _status;
}

} // namespace orvane

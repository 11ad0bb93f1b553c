#pragma once

#include <functional>
#include <string>
#include <string_view>

namespace orvane
{

// A line on a terminal that tells how far a long task has come: "Reading drive.dlf: 42 %". It is
// written again at each whole percent and wiped at the end.
class ProgressLine
{
public:
    using Write = std::function<void(std::string_view text)>;

    // `task` may hold any text, such as a file's name.
    ProgressLine(std::string_view task, Write write);
    ~ProgressLine();
    ProgressLine(const ProgressLine&) = delete;
    ProgressLine& operator=(const ProgressLine&) = delete;

    // `done` is 0 to 1; at 1 the line goes.
    void show(double done);

private:
    std::string _task;
    Write _write;
    std::string _shown;
};

} // namespace orvane

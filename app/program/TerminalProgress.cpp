#include "app/program/TerminalProgress.h"

#include <cstdio>
#include <sys/stat.h>
#include <unistd.h>

namespace orvane
{

namespace
{

bool canShowProgress()
{
    struct stat error {
    };
    struct stat output {
    };
    if (!isatty(STDERR_FILENO) || fstat(STDERR_FILENO, &error) != 0)
        return false;
    return !isatty(STDOUT_FILENO) || fstat(STDOUT_FILENO, &output) != 0 ||
           output.st_rdev != error.st_rdev;
}

} // namespace

std::unique_ptr<ProgressLine> progressOnTerminal(const std::string& task)
{
    if (!canShowProgress())
        return nullptr;
    return std::make_unique<ProgressLine>(
        task, [](std::string_view text) { std::fwrite(text.data(), 1, text.size(), stderr); });
}

} // namespace orvane

#include "app/program/StandardInput.h"

#include <cerrno>
#include <cstdlib>
#include <cstring>
#include <fcntl.h>
#include <stdexcept>
#include <unistd.h>
#include <vector>

namespace orvane
{

namespace
{

[[noreturn]] void fail(const std::string& folder)
{
    throw std::runtime_error("standard input cannot be kept in " + folder + " (" +
                             std::strerror(errno) + "): set TMPDIR to a folder with more room");
}

// A new file that is gone when its descriptor is closed.
int makeNamelessFile(const std::string& folder)
{
    std::string name = folder + "/orvane-XXXXXX";
    const int file = mkostemp(name.data(), O_CLOEXEC);
    if (file < 0)
        fail(folder);
    unlink(name.c_str());
    return file;
}

bool openAsStandardInput(const char* path)
{
    const int input = open(path, O_RDWR | O_CLOEXEC);
    if (input < 0)
        return false;
    dup2(input, STDIN_FILENO);
    close(input);
    return true;
}

} // namespace

std::string keepStandardInput()
{
    const char* variable = std::getenv("TMPDIR");
    const std::string folder = variable && *variable ? variable : "/var/tmp";
    const int file = makeNamelessFile(folder);
    std::vector<char> block(std::size_t{1} << 16);
    for (;;) {
        const ssize_t count = read(STDIN_FILENO, block.data(), block.size());
        if (count < 0 && errno == EINTR)
            continue;
        if (count <= 0)
            break;
        for (ssize_t done = 0; done < count;) {
            const ssize_t written =
                write(file, block.data() + done, static_cast<std::size_t>(count - done));
            if (written < 0)
                fail(folder);
            done += written;
        }
    }
    if (!openAsStandardInput("/dev/tty"))
        closeStandardInput();
    return "/proc/self/fd/" + std::to_string(file);
}

void closeStandardInput() { openAsStandardInput("/dev/null"); }

} // namespace orvane

#include "platform/linux/StandardDescriptors.h"

#include <cerrno>
#include <csignal>
#include <fcntl.h>
#include <initializer_list>
#include <unistd.h>

namespace orvane
{

void prepareStandardDescriptors()
{
    // open() takes the lowest free number: in ascending order that is the missing one.
    for (const int descriptor : {STDIN_FILENO, STDOUT_FILENO, STDERR_FILENO})
        if (::fcntl(descriptor, F_GETFD) < 0 && errno == EBADF) [[maybe_unused]]
            const int opened = ::open("/dev/null", O_RDWR);
    std::signal(SIGPIPE, SIG_IGN);
    std::signal(SIGXFSZ, SIG_IGN);
}

} // namespace orvane

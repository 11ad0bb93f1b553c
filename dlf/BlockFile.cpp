#include "dlf/BlockFile.h"

#include <cerrno>
#include <cstring>
#include <fcntl.h>
#include <filesystem>
#include <unistd.h>

namespace orvane
{

namespace
{

std::string whyNot(const std::string& path, int error)
{
    std::error_code ignored;
    const std::filesystem::file_type type = std::filesystem::status(path, ignored).type();
    if (error == EEXIST && type == std::filesystem::file_type::regular)
        return "\"" + path + "\" is there already: give --force to overwrite it, or another name";
    if (error == EEXIST && type != std::filesystem::file_type::directory)
        return "\"" + path +
               "\" is no regular file: give --force to write to it all the same, or another name";
    return "\"" + path + "\" cannot be written (" +
           std::strerror(error == EEXIST ? EISDIR : error) + "): give another name to record to";
}

} // namespace

std::unique_ptr<DiskBlockFile> DiskBlockFile::create(const std::string& path, Existing existing,
                                                     std::string& error)
{
    // Without O_NONBLOCK, a named pipe would be waited for.
    const int flags = O_WRONLY | O_CREAT | O_CLOEXEC | O_NONBLOCK |
                      (existing == Existing::Overwritten ? O_TRUNC : O_EXCL);
    const int descriptor = ::open(path.c_str(), flags, 0666);
    if (descriptor < 0) {
        error = whyNot(path, errno);
        return nullptr;
    }
    return std::unique_ptr<DiskBlockFile>(new DiskBlockFile(descriptor));
}

DiskBlockFile::~DiskBlockFile() { ::close(_descriptor); }

int DiskBlockFile::append(ByteView block)
{
    ByteView rest = block;
    while (!rest.empty()) {
        const ssize_t written = ::write(_descriptor, rest.data(), rest.size());
        if (written > 0) {
            rest = rest.subspan(static_cast<std::size_t>(written));
        } else if (written == 0 || errno != EINTR) {
            const int error = written == 0 ? EIO : errno;
            [[maybe_unused]] const int cut = ::ftruncate(_descriptor, _length);
            ::lseek(_descriptor, _length, SEEK_SET);
            return error;
        }
    }
    _length += static_cast<std::int64_t>(block.size());
    return 0;
}

int DiskBlockFile::synchronise()
{
    // Devices and pipes, which keep nothing, answer that there is nothing to do.
    return ::fdatasync(_descriptor) == 0 || errno == EINVAL || errno == EROFS ? 0 : errno;
}

} // namespace orvane

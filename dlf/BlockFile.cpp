#include "dlf/BlockFile.h"

#include <cerrno>
#include <cstring>
#include <fcntl.h>
#include <filesystem>
#include <sys/stat.h>
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
        return "\"" + path + "\" already exists: give --force to overwrite it, or another name";
    if (error == EEXIST && type != std::filesystem::file_type::directory)
        return "\"" + path +
               "\" is not a regular file: give --force to write to it anyway, or another name";
    return "\"" + path + "\" cannot be written (" +
           std::strerror(error == EEXIST ? EISDIR : error) + "): give another name to record to";
}

} // namespace

std::unique_ptr<DiskBlockFile> DiskBlockFile::create(const std::string& path, Existing existing,
                                                     std::string& error)
{
    // Opening a named pipe without O_NONBLOCK would wait for a reader.
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

// Writes from `rest` what the file takes now. EAGAIN if it is a pipe and full.
int DiskBlockFile::write(ByteView& rest)
{
    while (!rest.empty()) {
        const ssize_t written = ::write(_descriptor, rest.data(), rest.size());
        if (written > 0)
            rest = rest.subspan(static_cast<std::size_t>(written));
        else if (written == 0 || errno != EINTR)
            return written == 0 ? EIO : errno;
    }
    return 0;
}

int DiskBlockFile::writeWaiting()
{
    ByteView rest = _waiting;
    const int error = write(rest);
    _waiting.erase(_waiting.begin(), _waiting.end() - static_cast<std::ptrdiff_t>(rest.size()));
    return error == EAGAIN ? 0 : error;
}

int DiskBlockFile::append(ByteView block)
{
    if (const int error = writeWaiting(); error != 0)
        return error;
    ByteView rest = block;
    const int error = _waiting.empty() ? write(rest) : EAGAIN;
    if (error == EAGAIN) {
        if (rest.size() > kMostWaitingBytes - _waiting.size())
            return ENOBUFS;
        _waiting.insert(_waiting.end(), rest.begin(), rest.end());
    } else if (error != 0) {
        [[maybe_unused]] const int cut = ::ftruncate(_descriptor, _length);
        ::lseek(_descriptor, _length, SEEK_SET);
        return error;
    }
    _length += static_cast<std::int64_t>(block.size());
    return 0;
}

int DiskBlockFile::synchronise()
{
    if (const int error = writeWaiting(); error != 0)
        return error;
    struct stat status {
    };
    if (::fstat(_descriptor, &status) == 0 && S_ISREG(status.st_mode) && status.st_nlink == 0)
        return ENOENT;
    // Devices and pipes, which keep nothing, answer that there is nothing to do.
    return ::fdatasync(_descriptor) == 0 || errno == EINVAL || errno == EROFS ? 0 : errno;
}

} // namespace orvane

#include "platform/services/FileSystem.h"

#include <cerrno>
#include <cstdio>
#include <fcntl.h>
#include <filesystem>
#include <memory>
#include <sys/stat.h>
#include <unistd.h>
#include <vector>

namespace orvane
{

namespace
{

struct FileCloser {
    void operator()(std::FILE* file) const { std::fclose(file); }
};

} // namespace

std::string FileSystem::located(std::string_view path) const
{
    std::string whole = _root;
    while (whole.ends_with('/'))
        whole.pop_back();
    return whole + std::string(path);
}

bool FileSystem::exists(std::string_view path) const
{
    std::error_code error;
    return std::filesystem::exists(located(path), error);
}

std::error_code FileSystem::makeOwnFolder(std::string_view path) const
{
    const auto problem = [] { return std::error_code(errno, std::generic_category()); };
    std::vector<std::string> missing;
    struct stat status = {};
    std::string folder = located(path);
    while (stat(folder.c_str(), &status) != 0) {
        const std::size_t slash = folder.rfind('/');
        if (errno != ENOENT || slash == std::string::npos || slash == 0)
            return problem();
        missing.push_back(folder);
        folder.resize(slash);
    }
    if (!S_ISDIR(status.st_mode))
        return std::make_error_code(std::errc::not_a_directory);
    if (!missing.empty() && status.st_uid != geteuid())
        return std::make_error_code(std::errc::no_such_file_or_directory);
    for (; !missing.empty(); missing.pop_back())
        if (mkdir(missing.back().c_str(), S_IRWXU) != 0 && errno != EEXIST)
            return problem();
    return {};
}

std::optional<Bytes> readFile(const std::string& path, std::size_t limit)
{
    // Opening a named pipe without O_NONBLOCK would wait for a writer.
    const int descriptor = ::open(path.c_str(), O_RDONLY | O_CLOEXEC | O_NONBLOCK);
    if (descriptor < 0)
        return std::nullopt;
    struct stat status {
    };
    if (::fstat(descriptor, &status) != 0 || !S_ISREG(status.st_mode)) {
        ::close(descriptor);
        return std::nullopt;
    }
    const std::unique_ptr<std::FILE, FileCloser> file(::fdopen(descriptor, "rb"));
    if (!file) {
        ::close(descriptor);
        return std::nullopt;
    }
    Bytes content;
    std::uint8_t block[65536];
    while (const std::size_t count = std::fread(block, 1, sizeof block, file.get())) {
        if (count > limit - content.size())
            return std::nullopt;
        content.insert(content.end(), block, block + count);
    }
    if (std::ferror(file.get()) != 0)
        return std::nullopt;
    return content;
}

namespace
{

// Makes way for a new file: removes an earlier regular file of the own user. Returns false, with
// errno set, when something else has the name.
bool removeOwnFile(const std::string& path)
{
    struct stat found {
    };
    if (::lstat(path.c_str(), &found) != 0)
        return errno == ENOENT;
    if (!S_ISREG(found.st_mode) || found.st_uid != ::geteuid()) {
        errno = EEXIST;
        return false;
    }
    return ::unlink(path.c_str()) == 0;
}

// Returns whether everything is written; errno says why not.
bool writeAll(int descriptor, ByteView content)
{
    while (!content.empty()) {
        const auto written = ::write(descriptor, content.data(), content.size());
        if (written < 0 && errno == EINTR)
            continue;
        if (written < 0)
            return false;
        content = content.subspan(static_cast<std::size_t>(written));
    }
    return true;
}

} // namespace

bool writeFile(const std::string& path, ByteView content)
{
    if (!removeOwnFile(path))
        return false;
    // O_EXCL: never follows, opens or waits for a file that somebody has put there meanwhile.
    const int descriptor = ::open(path.c_str(), O_WRONLY | O_CREAT | O_EXCL | O_CLOEXEC, 0666);
    if (descriptor < 0)
        return false;
    const bool isWritten = writeAll(descriptor, content);
    int problem = errno;
    // Some file systems report a full disk only here.
    const bool isClosed = ::close(descriptor) == 0;
    if (isWritten && isClosed)
        return true;
    problem = isWritten ? errno : problem;
    ::unlink(path.c_str()); // half a file could be taken for a whole one
    errno = problem;
    return false;
}

} // namespace orvane

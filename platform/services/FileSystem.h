#pragma once

#include "platform/base/Bytes.h"

#include <optional>
#include <string>
#include <string_view>
#include <system_error>

namespace orvane
{

// The files that the system keeps at fixed places (log folder, install marker), all taken below one
// root directory.
class FileSystem
{
public:
    // `root` is "/" for the machine itself.
    explicit FileSystem(std::string root = "/") : _root(std::move(root)) {}

    // Where an absolute path of the system really is: "/a/b" below root "/tmp/x" is "/tmp/x/a/b".
    [[nodiscard]] std::string located(std::string_view path) const;
    [[nodiscard]] bool exists(std::string_view path) const;
    // Makes the folder, for its user alone, and the ones above it that are missing, where the
    // nearest folder that exists belongs to the user. Does nothing to a folder that exists.
    // Returns why there is no such folder afterwards.
    [[nodiscard]] std::error_code makeOwnFolder(std::string_view path) const;

private:
    std::string _root;
};

// Returns the whole file; nullopt if it is not a regular file, cannot be read or is longer than
// `limit` bytes.
std::optional<Bytes> readFile(const std::string& path, std::size_t limit = SIZE_MAX);
// Creates the file and writes it directly. An earlier regular file of the own user is removed
// first; anything else of that name (a symbolic link, a pipe, another user's file) makes it fail
// and stays. A file that cannot be finished is removed. Where it returns false, errno says why.
bool writeFile(const std::string& path, ByteView content);

} // namespace orvane

#pragma once

#include <cstdlib>
#include <filesystem>
#include <stdexcept>
#include <string>

namespace orvane
{

// A new directory in the system's temporary directory; the destructor removes it and its content.
class TemporaryDirectory
{
public:
    TemporaryDirectory()
        : _path((std::filesystem::temp_directory_path() / "orvane-test-XXXXXX").string())
    {
        if (!mkdtemp(_path.data()))
            throw std::runtime_error("cannot make a temporary directory");
    }
    ~TemporaryDirectory()
    {
        std::error_code error;
        std::filesystem::remove_all(_path, error);
    }
    TemporaryDirectory(const TemporaryDirectory&) = delete;
    TemporaryDirectory& operator=(const TemporaryDirectory&) = delete;

    [[nodiscard]] const std::string& path() const { return _path; }

private:
    std::string _path;
};

} // namespace orvane

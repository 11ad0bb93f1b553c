#pragma once

#include "dlf/ByteSource.h"
#include "platform/base/Bytes.h"

#include <memory>
#include <string>

namespace orvane
{

// A file of which only a window of about 1 MiB is in memory, however long it is. size() becomes
// less if the file is cut, or cannot be read any more, while it is open. What is appended to the
// file later is not seen.
class FileWindow final : public ByteSource
{
public:
    // Null, with the system's reason in `error`, unless it is a regular file that may be read.
    static std::shared_ptr<FileWindow> open(const std::string& path, std::string& error);
    // A further window on the same file, also if that has been renamed or deleted since. Null if
    // the process has too many open files.
    [[nodiscard]] std::shared_ptr<FileWindow> another() const;
    ~FileWindow() override;
    FileWindow(const FileWindow&) = delete;
    FileWindow& operator=(const FileWindow&) = delete;

    [[nodiscard]] std::uint64_t size() const override { return _size; }
    [[nodiscard]] ByteView bytes(std::uint64_t position, std::size_t count) override;

private:
    FileWindow(int descriptor, std::uint64_t size) : _descriptor(descriptor), _size(size) {}
    void moveTo(std::uint64_t position, std::size_t count);

    int _descriptor;
    std::uint64_t _size;
    std::uint64_t _start = 0; // of the window
    Bytes _window;
};

} // namespace orvane

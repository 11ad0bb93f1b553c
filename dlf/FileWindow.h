#pragma once

#include "dlf/ByteSource.h"
#include "platform/base/Bytes.h"

#include <memory>
#include <string>

namespace orvane
{

// A file of which only a window is in memory, however long it is. What is cut off or cannot be read
// while it is open is not there any more: size() becomes less. What is added later is not seen.
class FileWindow final : public ByteSource
{
public:
    // Null, with the system's reason in `error`, for what is no regular file or may not be read.
    static std::shared_ptr<FileWindow> open(const std::string& path, std::string& error);
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

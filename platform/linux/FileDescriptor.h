#pragma once

#include <unistd.h>
#include <utility>

namespace orvane
{

// Owns a file descriptor; -1 is none.
class FileDescriptor
{
public:
    FileDescriptor() = default;
    explicit FileDescriptor(int descriptor) : _descriptor(descriptor) {}
    ~FileDescriptor() { reset(); }
    FileDescriptor(FileDescriptor&& other) noexcept
        : _descriptor(std::exchange(other._descriptor, -1))
    {
    }
    FileDescriptor& operator=(FileDescriptor&& other) noexcept
    {
        reset();
        _descriptor = std::exchange(other._descriptor, -1);
        return *this;
    }

    [[nodiscard]] int get() const { return _descriptor; }
    explicit operator bool() const { return _descriptor >= 0; }
    void reset()
    {
        if (_descriptor >= 0)
            ::close(std::exchange(_descriptor, -1));
    }

private:
    int _descriptor = -1;
};

} // namespace orvane

#pragma once

#include "platform/base/Bytes.h"

#include <array>
#include <cerrno>
#include <cstdlib>
#include <fcntl.h>
#include <stdexcept>
#include <string>
#include <unistd.h>

namespace orvane
{

// A pseudo-terminal whose name stands for a serial device, and the other side of it, where a test
// plays the device. Nothing waits.
class PseudoTerminal
{
public:
    PseudoTerminal() : _master(::posix_openpt(O_RDWR | O_NOCTTY | O_NONBLOCK | O_CLOEXEC))
    {
        std::array<char, 128> name{};
        if (_master < 0 || ::grantpt(_master) != 0 || ::unlockpt(_master) != 0 ||
            ::ptsname_r(_master, name.data(), name.size()) != 0)
            throw std::runtime_error("no pseudo-terminal");
        _path = name.data();
    }
    ~PseudoTerminal() { hangUp(); }
    PseudoTerminal(const PseudoTerminal&) = delete;
    PseudoTerminal& operator=(const PseudoTerminal&) = delete;

    // The device's name.
    [[nodiscard]] const std::string& path() const { return _path; }
    [[nodiscard]] int descriptor() const { return _master; }

    // As many of the bytes as are taken now; returns how many.
    std::size_t write(ByteView bytes) const
    {
        const auto count = ::write(_master, bytes.data(), bytes.size());
        return count < 0 ? 0 : static_cast<std::size_t>(count);
    }
    // Appends what there is to read now.
    void readInto(Bytes& bytes) const
    {
        std::array<std::uint8_t, 4096> block{};
        for (;;) {
            const auto count = ::read(_master, block.data(), block.size());
            if (count <= 0)
                return;
            bytes.insert(bytes.end(), block.begin(), block.begin() + count);
        }
    }
    // The device is unplugged.
    void hangUp()
    {
        if (_master >= 0)
            ::close(_master);
        _master = -1;
    }

private:
    int _master;
    std::string _path;
};

} // namespace orvane

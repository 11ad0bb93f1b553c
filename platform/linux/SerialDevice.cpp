#include "platform/linux/SerialDevice.h"

#include "platform/base/Bytes.h"
#include "platform/linux/DescriptorWatcher.h"
#include "platform/linux/DeviceHolder.h"
#include "platform/linux/FileDescriptor.h"
#include "platform/linux/QtMainQueue.h"

#include <algorithm>
#include <cerrno>
#include <fcntl.h>
#include <grp.h>
#include <sys/file.h>
#include <sys/ioctl.h>
#include <sys/stat.h>
#include <system_error>
#include <termios.h>
#include <unistd.h>
#include <utility>

namespace orvane
{

namespace
{

constexpr std::size_t kReadBlockBytes = 64U * 1024;
// Blocks of one turn of the event loop, so that a device that never pauses leaves time for others.
constexpr int kBlocksATurn = 64;

std::string causeOf(int error) { return std::generic_category().message(error); }

// The group that owns the device, by name where it has one.
std::string groupOf(const std::string& path)
{
    struct stat status {
    };
    if (::stat(path.c_str(), &status) != 0)
        return "";
    const group* found = ::getgrgid(status.st_gid);
    return found ? found->gr_name : std::to_string(status.st_gid);
}

std::string remedyFor(int error, const std::string& path)
{
    switch (error) {
    case ENOENT:
    case ENODEV:
    case ENXIO:
    case ENOTDIR:
        return "plug the modem in, or give the name of its diagnostic port";
    case EACCES:
    case EPERM: {
        const std::string group = groupOf(path);
        return group.empty() ? "ask the administrator for access to it"
                             : "it belongs to the group " + group +
                                   "; add yourself to that group and log in again";
    }
    case EBUSY:
    case EWOULDBLOCK: {
        const std::string holder = programThatHolds(path);
        return holder.empty() ? "end the program that uses it"
                              : holder + " uses it; end that first";
    }
    default:
        return "check that it is a modem's diagnostic port";
    }
}

std::string failureText(const std::string& path, int error)
{
    const std::string cause = error == EWOULDBLOCK ? causeOf(EBUSY) : causeOf(error);
    return "cannot open " + path + ": " + cause + "; " + remedyFor(error, path);
}

// 0 or an error number. Character devices that are not serial take no settings.
int makeRaw(int descriptor)
{
    termios settings{};
    if (::tcgetattr(descriptor, &settings) != 0)
        return errno == ENOTTY || errno == EINVAL ? 0 : errno;
    ::cfmakeraw(&settings);
    ::cfsetspeed(&settings, B115200);
    settings.c_cflag |= CLOCAL | CREAD;
    settings.c_cflag &= ~static_cast<tcflag_t>(CSTOPB | CRTSCTS);
    settings.c_iflag &= ~static_cast<tcflag_t>(IXON | IXOFF | IXANY);
    if (::tcsetattr(descriptor, TCSANOW, &settings) != 0)
        return errno;
    return ::ioctl(descriptor, TIOCEXCL) == 0 ? 0 : errno;
}

} // namespace

// Apart from the device, since a callback may destroy that: whatever calls one keeps this until it
// has returned.
class SerialStream : public std::enable_shared_from_this<SerialStream>
{
public:
    explicit SerialStream(FileDescriptor descriptor) : _descriptor(std::move(descriptor)) {}

    void setCallbacks(ByteDevice::ReceivedCallback received, ByteDevice::ClosedCallback closed)
    {
        _received = std::move(received);
        _closed = std::move(closed);
        if (_descriptor)
            _readWatcher = watch(DescriptorWatcher::For::Reading, &SerialStream::readable);
    }

    void write(ByteView bytes)
    {
        if (!_descriptor)
            return;
        _out.insert(_out.end(), bytes.begin(), bytes.end());
        if (!_writeWatcher)
            flush();
    }

    // No callback comes any more.
    void close()
    {
        _readWatcher.reset();
        _writeWatcher.reset();
        if (!_descriptor)
            return;
        // Otherwise close() may wait for the device to take what is left.
        ::tcflush(_descriptor.get(), TCOFLUSH);
        ::ioctl(_descriptor.get(), TIOCNXCL);
        _descriptor.reset();
    }

private:
    std::unique_ptr<DescriptorWatcher> watch(DescriptorWatcher::For what,
                                             void (SerialStream::*step)())
    {
        return std::make_unique<DescriptorWatcher>(_descriptor.get(), what,
                                                   [weak = weak_from_this(), step] {
                                                       if (const auto stream = weak.lock())
                                                           (stream.get()->*step)();
                                                   });
    }

    void readable()
    {
        thread_local Bytes block(kReadBlockBytes);
        for (int i = 0; i < kBlocksATurn && _descriptor; ++i) {
            const auto count = ::read(_descriptor.get(), block.data(), block.size());
            if (count < 0 && (errno == EAGAIN || errno == EINTR))
                return;
            if (count <= 0) {
                fail(count == 0 ? "it was unplugged or switched off" : causeOf(errno));
                return;
            }
            _received(ByteView(block).first(static_cast<std::size_t>(count)));
        }
    }

    void flush()
    {
        while (!_out.empty()) {
            const auto count = ::write(_descriptor.get(), _out.data(), _out.size());
            if (count < 0 && errno == EINTR)
                continue;
            if (count < 0 && errno == EAGAIN) {
                if (!_writeWatcher)
                    _writeWatcher = watch(DescriptorWatcher::For::Writing, &SerialStream::flush);
                return;
            }
            if (count < 0) {
                _queue.async([this, cause = causeOf(errno)] {
                    const auto keep = shared_from_this();
                    fail(cause);
                });
                break;
            }
            _out.erase(_out.begin(), _out.begin() + count);
        }
        _out.clear();
        _writeWatcher.reset();
    }

    void fail(const std::string& reason)
    {
        if (!_descriptor)
            return;
        close();
        const auto closed = std::move(_closed);
        if (closed)
            closed(reason);
    }

    FileDescriptor _descriptor; // none once closed
    ByteDevice::ReceivedCallback _received;
    ByteDevice::ClosedCallback _closed;
    std::unique_ptr<DescriptorWatcher> _readWatcher;
    std::unique_ptr<DescriptorWatcher> _writeWatcher; // while the device takes no more
    Bytes _out;
    QtMainQueue _queue; // ends with the stream, and what waits in it
};

namespace
{

class SerialDevice final : public ByteDevice
{
public:
    explicit SerialDevice(FileDescriptor descriptor)
        : _stream(std::make_shared<SerialStream>(std::move(descriptor)))
    {
    }
    ~SerialDevice() override { _stream->close(); }
    SerialDevice(const SerialDevice&) = delete;
    SerialDevice& operator=(const SerialDevice&) = delete;

    void setCallbacks(ReceivedCallback received, ClosedCallback closed) override
    {
        _stream->setCallbacks(std::move(received), std::move(closed));
    }
    void write(ByteView bytes) override { _stream->write(bytes); }

private:
    std::shared_ptr<SerialStream> _stream;
};

} // namespace

std::unique_ptr<ByteDevice> openSerialDevice(const std::string& path, std::string& error)
{
    // Asked first, because opening alone does something to a pipe or a tape.
    struct stat status {
    };
    if (::stat(path.c_str(), &status) == 0 && !S_ISCHR(status.st_mode)) {
        error = "cannot open " + path +
                ": it is not a device; give the name of a modem's diagnostic port, such as "
                "/dev/ttyUSB0";
        return nullptr;
    }
    FileDescriptor descriptor(::open(path.c_str(), O_RDWR | O_NOCTTY | O_NONBLOCK | O_CLOEXEC));
    int failure = descriptor ? 0 : errno;
    // Root may open what somebody else has for himself, and only serial devices can be exclusive:
    // the lock keeps a second server out in these cases too.
    if (failure == 0 && ::flock(descriptor.get(), LOCK_EX | LOCK_NB) != 0)
        failure = errno;
    if (failure == 0)
        failure = makeRaw(descriptor.get());
    if (failure != 0) {
        descriptor.reset();
        error = failureText(path, failure);
        return nullptr;
    }
    return std::make_unique<SerialDevice>(std::move(descriptor));
}

} // namespace orvane

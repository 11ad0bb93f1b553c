#include "platform/linux/SocketTransport.h"

#include "platform/linux/DescriptorWatcher.h"
#include "platform/linux/PortPeer.h"
#include "platform/linux/PortSocket.h"
#include "platform/linux/QtMainQueue.h"
#include "platform/linux/SocketConnection.h"
#include "platform/linux/UnixSocket.h"
#include "platform/ports/MessagePort.h"
#include "platform/services/SystemLog.h"

#include <cerrno>

namespace orvane
{

namespace
{

using ConnectionCallback = std::function<void(std::unique_ptr<FrameConnection>)>;

// Callers wait in the socket's backlog until there is a connection callback.
class SocketListener final : public FrameListener
{
public:
    SocketListener(PortSocket socket, const PortsDirectory& directory)
        : _state(std::make_shared<State>(std::move(socket), directory))
    {
    }
    ~SocketListener() override { setConnectionCallback({}); }
    SocketListener(const SocketListener&) = delete;
    SocketListener& operator=(const SocketListener&) = delete;

    void setConnectionCallback(ConnectionCallback callback) override
    {
        _state->callback = std::move(callback);
        _state->watcher.reset();
        if (!_state->callback)
            return;
        _state->watcher = std::make_unique<DescriptorWatcher>(
            _state->socket.descriptor(), DescriptorWatcher::For::Reading,
            [weak = std::weak_ptr(_state)] {
                if (const auto state = weak.lock())
                    state->acceptOne();
            });
    }

private:
    struct State {
        State(PortSocket theSocket, PortsDirectory theDirectory)
            : socket(std::move(theSocket)), directory(std::move(theDirectory))
        {
        }

        void acceptOne()
        {
            FileDescriptor accepted(
                ::accept4(socket.descriptor(), nullptr, nullptr, SOCK_NONBLOCK | SOCK_CLOEXEC));
            if (!accepted) {
                pauseIfFailed(errno);
                return;
            }
            if (!isPeerTrusted(accepted.get(), directory))
                return;
            enlargeBuffers(accepted.get());
            const auto call = callback; // it may set another
            call(std::make_unique<SocketConnection>(std::move(accepted)));
        }

        // A process without free descriptors would hear of the same caller in each turn.
        void pauseIfFailed(int error)
        {
            if (error == EAGAIN || error == EINTR || error == ECONNABORTED)
                return;
            logError("A connection cannot be accepted: %s\n", errorText(error).c_str());
            watcher->setEnabled(false);
            queue.after(std::chrono::milliseconds{100}, [this] {
                if (watcher)
                    watcher->setEnabled(true);
            });
        }

        PortSocket socket;
        PortsDirectory directory;
        ConnectionCallback callback;
        std::unique_ptr<DescriptorWatcher> watcher;
        QtMainQueue queue;
    };
    std::shared_ptr<State> _state;
};

bool isUsable(const std::string& name, std::string& error)
{
    if (isUsablePortName(name))
        return true;
    error = "\"" + name + "\" cannot name a port; use 1 to 64 letters, digits, '.', '-' and '_'.";
    return false;
}

// Returns none, with the reason in `error`, where nobody who is trusted accepts on the name.
FileDescriptor connectedSocket(const PortsDirectory& directory, const std::string& name,
                               std::string& error)
{
    if (!isUsable(name, error))
        return {};
    const std::string path = directory.pathOf(name);
    const auto address = socketAddress(path, error);
    if (!address)
        return {};
    FileDescriptor socket = newStreamSocket();
    const int failure = socket ? connectTo(socket.get(), *address) : errno;
    if (failure != 0) {
        error = "The port " + path + " cannot be reached: " + errorText(failure);
        return {};
    }
    if (!isListenerTrusted(socket.get(), directory, name)) {
        error = "The port " + path + " belongs to another user.";
        return {};
    }
    return socket;
}

} // namespace

std::unique_ptr<FrameListener> SocketTransport::listen(const std::string& name, std::string& error)
{
    if (!isUsable(name, error))
        return nullptr;
    auto socket = PortSocket::claim(_directory, name, error);
    if (!socket)
        return nullptr;
    return std::make_unique<SocketListener>(std::move(*socket), _directory);
}

std::unique_ptr<FrameConnection> SocketTransport::connect(const std::string& name,
                                                          std::string& error)
{
    FileDescriptor socket = connectedSocket(_directory, name, error);
    return socket ? std::make_unique<SocketConnection>(std::move(socket)) : nullptr;
}

bool SocketTransport::hasListener(const std::string& name) const
{
    std::string ignored;
    return static_cast<bool>(connectedSocket(_directory, name, ignored));
}

} // namespace orvane

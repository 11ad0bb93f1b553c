#pragma once

#include "platform/base/Bytes.h"
#include "platform/ports/Frame.h"

#include <chrono>
#include <cstdint>
#include <functional>
#include <memory>
#include <optional>
#include <string>

namespace orvane
{

// A stream of frames to and from one peer, driven by the thread's event loop. Only
// waitUntil() waits.
// Message ports and the telephony server are both built on it.
class FrameConnection
{
public:
    virtual ~FrameConnection() = default;

    // Called for every frame that arrives. Neither this callback nor the next one comes from within
    // a call of the owner. A callback may destroy the connection.
    virtual void setFrameCallback(std::function<void(const FrameReader::View&)> callback) = 0;
    // Called once when the peer has closed or the transport has failed, not after close().
    virtual void setClosedCallback(std::function<void()> callback) = 0;
    // Called whenever the queue of unsent bytes has become shorter.
    virtual void setDrainedCallback(std::function<void()> callback) = 0;

    [[nodiscard]] virtual bool isOpen() const = 0;
    // Queues a frame, which is sent as the peer reads. Returns false when closed.
    // The data must be within kFrameDataLimit (std::length_error otherwise).
    virtual bool send(std::int32_t messageId, std::uint32_t serial, bool wantsReply, bool isReply,
                      ByteView data) = 0;
    // Takes back the frame queued last if none of its bytes has been written. Returns false when
    // some have been, or where the transport cannot take back frames; the frame then stays queued.
    virtual bool withdrawLast() { return false; }
    [[nodiscard]] virtual std::size_t queuedBytes() const = 0;
    // The number of the frame that has arrived in part, the connection's first being 0; nullopt
    // where none has.
    [[nodiscard]] virtual std::optional<std::uint64_t> unfinishedFrame() const = 0;
    // For the few calls that must wait: serves this connection alone (sending what is queued,
    // calling its frame callback) until `done` is true, the timeout is over or the connection has
    // closed. Returns what `done` then says. Other connections, timers and tasks wait meanwhile;
    // the closed callback does not come from within this call but afterwards.
    virtual bool waitUntil(const std::function<bool()>& done,
                           std::chrono::milliseconds timeout) = 0;
    virtual void close() = 0;
};

// A name that accepts connections. Destroying it removes the name.
class FrameListener
{
public:
    virtual ~FrameListener() = default;
    virtual void
    setConnectionCallback(std::function<void(std::unique_ptr<FrameConnection>)> callback) = 0;
};

// Listens and connects in one ports directory.
class FrameTransport
{
public:
    virtual ~FrameTransport() = default;
    // Returns null, with the reason in `error`, when the name is unusable, too long for a socket
    // address, or a live listener has it. A stale name is taken over.
    virtual std::unique_ptr<FrameListener> listen(const std::string& name, std::string& error) = 0;
    // Returns null, with the reason in `error`, when nothing accepts on the name.
    virtual std::unique_ptr<FrameConnection> connect(const std::string& name,
                                                     std::string& error) = 0;
};

} // namespace orvane

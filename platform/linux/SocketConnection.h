#pragma once

#include "platform/base/Bytes.h"
#include "platform/linux/FileDescriptor.h"
#include "platform/ports/FrameConnection.h"

namespace orvane
{

// Frames over a connected socket that does not block. Made by SocketTransport.
//
// A wake-up of the event loop reads one block, so that timers run between the blocks of a peer that
// never pauses. The frames sent in one turn of the loop are written together at its end, or earlier
// once they are many. This adds no latency to a single frame, and under load one write carries
// hundreds.
class SocketConnection final : public FrameConnection
{
public:
    explicit SocketConnection(FileDescriptor socket);
    // close().
    ~SocketConnection() override;
    SocketConnection(const SocketConnection&) = delete;
    SocketConnection& operator=(const SocketConnection&) = delete;

    void setFrameCallback(std::function<void(const FrameReader::View&)> callback) override;
    void setClosedCallback(std::function<void()> callback) override;
    void setDrainedCallback(std::function<void()> callback) override;
    [[nodiscard]] bool isOpen() const override;
    bool send(std::int32_t messageId, std::uint32_t serial, bool wantsReply, bool isReply,
              ByteView data) override;
    bool withdrawLast() override;
    [[nodiscard]] std::size_t queuedBytes() const override;
    [[nodiscard]] std::optional<std::uint64_t> unfinishedFrame() const override;
    bool waitUntil(const std::function<bool()>& done, std::chrono::milliseconds timeout) override;
    // Writes what the peer takes at once of what is queued, and drops the rest.
    void close() override;

private:
    std::shared_ptr<class FrameStream> _stream;
};

} // namespace orvane

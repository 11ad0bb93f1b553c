#pragma once

#include "platform/FrameConnection.h"
#include "platform/qt/FileDescriptor.h"

namespace orvane
{

// Frames over a connected socket that does not block. What QtFrameTransport makes.
//
// A wake-up of the event loop reads one block, so that timers run between the blocks of a peer that
// never pauses. The first frame sent in a turn of the loop is written at once; those that follow in
// the same turn are written together at its end, or earlier once they are many.
class QtFrameConnection final : public FrameConnection
{
public:
    explicit QtFrameConnection(FileDescriptor socket);
    // close().
    ~QtFrameConnection() override;
    QtFrameConnection(const QtFrameConnection&) = delete;
    QtFrameConnection& operator=(const QtFrameConnection&) = delete;

    void setFrameCallback(std::function<void(const FrameReader::View&)> callback) override;
    void setClosedCallback(std::function<void()> callback) override;
    void setDrainedCallback(std::function<void()> callback) override;
    [[nodiscard]] bool isOpen() const override;
    bool send(std::int32_t messageId, std::uint32_t serial, bool wantsReply, bool isReply,
              ByteView data) override;
    [[nodiscard]] std::size_t queuedBytes() const override;
    bool waitUntil(const std::function<bool()>& done, std::chrono::milliseconds timeout) override;
    // Writes what the peer takes at once of what is queued, and drops the rest.
    void close() override;

private:
    std::shared_ptr<class FrameStream> _stream;
};

} // namespace orvane

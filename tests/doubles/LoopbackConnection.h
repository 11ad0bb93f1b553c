#pragma once

#include "doubles/ManualMainQueue.h"
#include "platform/base/Bytes.h"
#include "platform/ports/FrameConnection.h"

#include <memory>
#include <optional>

namespace orvane
{

// One end of a connection of LoopbackTransport: the bytes written to the other end, the bytes that
// arrived from it, and the tasks that deliver them. The LoopbackConnection of its side owns it.
class LoopbackEnd final : public std::enable_shared_from_this<LoopbackEnd>
{
public:
    explicit LoopbackEnd(ManualMainQueue& queue) : _queue(queue) {}
    static void join(const std::shared_ptr<LoopbackEnd>& one,
                     const std::shared_ptr<LoopbackEnd>& other);

    void setFrameCallback(std::function<void(const FrameReader::View&)> callback);
    void setClosedCallback(std::function<void()> callback);
    void setDrainedCallback(std::function<void()> callback);
    [[nodiscard]] bool isOpen() const { return _open; }
    [[nodiscard]] std::size_t queuedBytes() const { return _unsent.size(); }
    [[nodiscard]] std::optional<std::uint64_t> unfinishedFrame() const
    {
        return _reader.unfinishedFrame();
    }
    void send(std::int32_t messageId, std::uint32_t serial, bool wantsReply, bool isReply,
              ByteView data);
    bool withdrawLast();
    bool waitUntil(const std::function<bool()>& done, std::chrono::nanoseconds timeout);
    // Closes it without a callback. The other end sees the close after it has read all data.
    void close();

    // Closes it as a transport failure does, with the closed callback.
    void fail();
    // Bytes on their way to this end.
    void arrive(ByteView bytes);
    // nullopt while this end reads; else the bytes that can still be sent to it.
    void setRoom(std::optional<std::size_t> room);
    void setSegmentBytes(std::optional<std::size_t> bytes) { _segmentBytes = bytes; }

private:
    void write();
    void scheduleDelivery();
    void deliver();
    void readSome();
    void end();

    ManualMainQueue& _queue;
    std::weak_ptr<LoopbackEnd> _other;
    // Shared, since a callback may destroy its connection while it runs.
    std::shared_ptr<std::function<void(const FrameReader::View&)>> _frameCallback;
    std::shared_ptr<std::function<void()>> _closedCallback;
    std::shared_ptr<std::function<void()>> _drainedCallback;
    FrameReader _reader;
    Bytes _unsent;
    std::size_t _lastFrameBytes = 0; // of the frame queued last, as long as it may be withdrawn
    Bytes _arrived;
    std::optional<std::size_t> _room;
    std::optional<std::size_t> _segmentBytes;
    bool _open = true;
    bool _otherClosed = false;
    bool _deliveryScheduled = false;
};

class LoopbackConnection final : public FrameConnection
{
public:
    explicit LoopbackConnection(std::shared_ptr<LoopbackEnd> end) : _end(std::move(end)) {}
    ~LoopbackConnection() override { _end->close(); }
    LoopbackConnection(const LoopbackConnection&) = delete;
    LoopbackConnection& operator=(const LoopbackConnection&) = delete;

    void setFrameCallback(std::function<void(const FrameReader::View&)> callback) override
    {
        _end->setFrameCallback(std::move(callback));
    }
    void setClosedCallback(std::function<void()> callback) override
    {
        _end->setClosedCallback(std::move(callback));
    }
    void setDrainedCallback(std::function<void()> callback) override
    {
        _end->setDrainedCallback(std::move(callback));
    }
    [[nodiscard]] bool isOpen() const override { return _end->isOpen(); }
    bool send(std::int32_t messageId, std::uint32_t serial, bool wantsReply, bool isReply,
              ByteView data) override;
    bool withdrawLast() override { return _end->withdrawLast(); }
    [[nodiscard]] std::size_t queuedBytes() const override { return _end->queuedBytes(); }
    [[nodiscard]] std::optional<std::uint64_t> unfinishedFrame() const override
    {
        return _end->unfinishedFrame();
    }
    bool waitUntil(const std::function<bool()>& done, std::chrono::milliseconds timeout) override;
    void close() override { _end->close(); }

private:
    std::shared_ptr<LoopbackEnd> _end;
};

} // namespace orvane

#include "doubles/LoopbackConnection.h"

#include "platform/base/Bytes.h"
#include "platform/services/SystemLog.h"

#include <algorithm>
#include <utility>

namespace orvane
{

void LoopbackEnd::join(const std::shared_ptr<LoopbackEnd>& one,
                       const std::shared_ptr<LoopbackEnd>& other)
{
    one->_other = other;
    other->_other = one;
}

void LoopbackEnd::setFrameCallback(std::function<void(const FrameReader::View&)> callback)
{
    _frameCallback =
        std::make_shared<std::function<void(const FrameReader::View&)>>(std::move(callback));
    scheduleDelivery();
}

void LoopbackEnd::setClosedCallback(std::function<void()> callback)
{
    _closedCallback = std::make_shared<std::function<void()>>(std::move(callback));
}

void LoopbackEnd::setDrainedCallback(std::function<void()> callback)
{
    _drainedCallback = std::make_shared<std::function<void()>>(std::move(callback));
}

void LoopbackEnd::send(std::int32_t messageId, std::uint32_t serial, bool wantsReply, bool isReply,
                       ByteView data)
{
    appendFrame(_unsent, messageId, serial, wantsReply, isReply, data);
    _lastFrameBytes = kFrameHeaderBytes + data.size();
    write();
}

// Moves to the other end as much as it takes.
void LoopbackEnd::write()
{
    const auto other = _other.lock();
    if (!other || !other->_open)
        return; // as with a socket, the close is found out when it arrives
    const std::size_t taken = std::min(_unsent.size(), other->_room.value_or(_unsent.size()));
    if (taken == 0)
        return;
    if (other->_room)
        *other->_room -= taken;
    other->arrive(ByteView(_unsent).first(taken));
    _unsent.erase(_unsent.begin(), _unsent.begin() + static_cast<std::ptrdiff_t>(taken));
}

bool LoopbackEnd::withdrawLast()
{
    if (_lastFrameBytes == 0 || _lastFrameBytes > _unsent.size())
        return false;
    _unsent.resize(_unsent.size() - _lastFrameBytes);
    _lastFrameBytes = 0;
    return true;
}

void LoopbackEnd::arrive(ByteView bytes)
{
    if (!_open)
        return;
    _arrived.insert(_arrived.end(), bytes.begin(), bytes.end());
    scheduleDelivery();
}

void LoopbackEnd::setRoom(std::optional<std::size_t> room)
{
    _room = room;
    scheduleDelivery();
    const auto other = _other.lock();
    if (!other || !other->_open || other->_unsent.empty())
        return;
    const std::size_t before = other->_unsent.size();
    other->write();
    if (other->_unsent.size() == before)
        return;
    other->_queue.async([weak = std::weak_ptr(other)] {
        const auto end = weak.lock();
        const auto callback = end && end->_open ? end->_drainedCallback : nullptr;
        if (callback && *callback)
            (*callback)();
    });
}

void LoopbackEnd::scheduleDelivery()
{
    if (_deliveryScheduled || !_open || _room || (_arrived.empty() && !_otherClosed))
        return;
    _deliveryScheduled = true;
    _queue.async([weak = weak_from_this()] {
        if (const auto end = weak.lock()) {
            end->_deliveryScheduled = false;
            end->deliver();
        }
    });
}

void LoopbackEnd::deliver()
{
    readSome();
    scheduleDelivery();
}

// Delivers the next segment or, after the last, the close of the other end.
void LoopbackEnd::readSome()
{
    if (!_open || _room || !_frameCallback)
        return;
    if (_arrived.empty()) {
        if (_otherClosed)
            fail();
        return;
    }
    const std::size_t size = std::min(_arrived.size(), _segmentBytes.value_or(_arrived.size()));
    _reader.append(ByteView(_arrived).first(size));
    _arrived.erase(_arrived.begin(), _arrived.begin() + static_cast<std::ptrdiff_t>(size));
    while (const auto frame = _reader.next()) {
        const auto callback = _frameCallback;
        if (*callback)
            (*callback)(*frame);
        if (!_open)
            return;
    }
    if (_reader.hasFailed()) {
        logError("%s", _reader.failureText().c_str());
        fail();
    }
}

bool LoopbackEnd::waitUntil(const std::function<bool()>& done, std::chrono::nanoseconds timeout)
{
    const auto keep = shared_from_this();
    _queue.runOthers(timeout, [&] {
        while (_open && !done() && !_room && _frameCallback && !(_arrived.empty() && !_otherClosed))
            readSome();
        return done() || !_open;
    });
    return done();
}

void LoopbackEnd::fail()
{
    if (!_open)
        return;
    end();
    _queue.async([weak = weak_from_this()] {
        const auto end = weak.lock();
        const auto callback = end ? std::exchange(end->_closedCallback, nullptr) : nullptr;
        if (callback && *callback)
            (*callback)();
    });
}

void LoopbackEnd::close()
{
    _closedCallback.reset();
    end();
}

void LoopbackEnd::end()
{
    if (!std::exchange(_open, false))
        return;
    _unsent.clear();
    _arrived.clear();
    if (const auto other = _other.lock()) {
        other->_otherClosed = true;
        other->scheduleDelivery();
    }
}

bool LoopbackConnection::send(std::int32_t messageId, std::uint32_t serial, bool wantsReply,
                              bool isReply, ByteView data)
{
    if (!_end->isOpen())
        return false;
    _end->send(messageId, serial, wantsReply, isReply, data);
    return true;
}

bool LoopbackConnection::waitUntil(const std::function<bool()>& done,
                                   std::chrono::milliseconds timeout)
{
    const auto end = _end; // a callback may destroy this connection
    return end->waitUntil(done, timeout);
}

} // namespace orvane

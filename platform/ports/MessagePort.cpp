#include "platform/ports/MessagePort.h"

#include <algorithm>
#include <utility>

namespace orvane
{

namespace
{

constexpr std::size_t kPortNameLimit = 64;

// Not std::isalnum, which depends on the locale.
bool isPortNameByte(char byte)
{
    return (byte >= 'A' && byte <= 'Z') || (byte >= 'a' && byte <= 'z') ||
           (byte >= '0' && byte <= '9') || byte == '.' || byte == '-' || byte == '_';
}

} // namespace

MessagePort::MessagePort(MainQueue& mainQueue)
    : _mainQueue(mainQueue), _notice(std::make_shared<Notice>(Notice{*this, nullptr}))
{
}

void MessagePort::setInvalidationCallback(InvalidationCallback callback)
{
    _notice->callback = std::move(callback);
    if (_notice->isDue)
        queueCallback();
}

void MessagePort::hasBecomeInvalid()
{
    if (!std::exchange(_notice->isDue, true))
        queueCallback();
}

void MessagePort::queueCallback()
{
    if (!_notice->callback)
        return;
    _mainQueue.async([weak = std::weak_ptr(_notice)] {
        const auto notice = weak.lock();
        if (!notice)
            return;
        // Taken out first: it is called once, however often queued, and it may destroy the port.
        const auto callback = std::exchange(notice->callback, nullptr);
        if (callback)
            callback(notice->port);
    });
}

bool isUsablePortName(std::string_view name)
{
    // "." and ".." name the directory itself and its parent.
    return !name.empty() && name.size() <= kPortNameLimit && name != "." && name != ".." &&
           std::all_of(name.begin(), name.end(), isPortNameByte);
}

} // namespace orvane

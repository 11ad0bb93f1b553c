#include "telephonyd/ReplaySource.h"

#include "dlf/DlfTime.h"
#include "platform/base/Bytes.h"
#include "platform/base/LogMessage.h"

#include <utility>

namespace orvane
{

namespace
{

using std::chrono::nanoseconds;

// The most that one turn of the queue sends, so that other channels get their turn.
constexpr int kItemsATurn = 1000;

} // namespace

ReplaySource::ReplaySource(MainQueue& queue, Now now, std::shared_ptr<ByteSource> file,
                           ReplaySettings settings)
    : _queue(queue), _now(std::move(now)), _file(std::move(file)), _settings(std::move(settings)),
      _reader(_file)
{
}

void ReplaySource::start(const LogSelection& selection, Send send)
{
    _selection = selection;
    _send = std::move(send);
    _due = _now();
    playAfter(nanoseconds(0));
}

void ReplaySource::resume()
{
    if (std::exchange(_waitsForClient, false))
        playAfter(nanoseconds(0));
}

void ReplaySource::playAfter(nanoseconds delay)
{
    _queue.after(delay, _lifetime.whileAlive([this] { play(); }));
}

void ReplaySource::play()
{
    for (int i = 0; i < kItemsATurn; ++i) {
        if (!_item) {
            _item = _reader.next();
            if (!_item && !startOver())
                return;
            if (!_item)
                continue;
            if (_item->timestamp != 0)
                goOnTo(_item->timestamp);
            if (!isWanted(*_item)) {
                _item.reset();
                continue;
            }
        }
        const nanoseconds wait = _settings.speed ? _due - _now() : nanoseconds(0);
        if (wait > nanoseconds(0)) {
            playAfter(wait);
            return;
        }
        if (!sendItem()) {
            _waitsForClient = true;
            return;
        }
    }
    playAfter(nanoseconds(0));
}

// False when there is nothing more to send.
bool ReplaySource::startOver()
{
    if (!_settings.loops || !std::exchange(_hasSentInRound, false))
        return false;
    _reader = DlfReader(_file);
    _reached.reset();
    _due += atSpeed(static_cast<double>(kLoopPause.count()));
    return true;
}

// The time of the recording advances with every item, sent or not, and never goes back.
void ReplaySource::goOnTo(std::uint64_t timestamp)
{
    if (!_reached) {
        _reached = timestamp;
        return;
    }
    if (timestamp <= *_reached)
        return;
    const double seconds = dlfSecondsSince1970(timestamp) - dlfSecondsSince1970(*_reached);
    _reached = timestamp;
    if (seconds <= static_cast<double>(kLongestGap.count()))
        _due += atSpeed(seconds);
}

bool ReplaySource::sendItem()
{
    _message.assign(1, _item->type);
    _message.insert(_message.end(), _item->bytes.begin(), _item->bytes.end());
    _item.reset();
    _hasSentInRound = true;
    return _send(_message);
}

bool ReplaySource::isWanted(const DlfItem& item) const
{
    const auto& codes = item.type == kServerItem ? _selection.extraCodes : _selection.modemCodes;
    return item.timestamp != 0 && codes.contains(item.logCode);
}

nanoseconds ReplaySource::atSpeed(double seconds) const
{
    return std::chrono::duration_cast<nanoseconds>(
        std::chrono::duration<double>(seconds / _settings.speed.value_or(1)));
}

} // namespace orvane

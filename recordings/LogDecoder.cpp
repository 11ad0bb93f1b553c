#include "recordings/LogDecoder.h"

#include "LogGenerator/MessageTime.h"
#include "LogGenerator/Silence.h"
#include "LogGenerator/StateKeys.h"
#include "platform/base/PropertyValue.h"
#include "platform/base/Technology.h"
#include "recordings/LogSlice.h"
#include "recordings/TimesAhead.h"

#include <algorithm>
#include <exception>
#include <stdexcept>

namespace orvane
{

namespace
{

std::unique_ptr<LogGenerator> newGenerator(const std::string& technology)
{
    const Silence silence;
    auto generator = LogGenerator::generatorFromTechnology(technology);
    if (!generator)
        throw std::invalid_argument("there is no technology \"" + technology + "\"");
    generator->keepNoMessages();
    return generator;
}

} // namespace

LogDecoder::LogDecoder(std::shared_ptr<ByteSource> log, const std::string& technology)
    : _technology(technology), _place{DlfReader(std::move(log)), ServingCell(technology)},
      _generator(newGenerator(technology))
{
}

LogDecoder::~LogDecoder()
{
    const Silence silence;
    _generator.reset();
}

void LogDecoder::lookAhead()
{
    if (_place.hasNext)
        return;
    const std::optional<DlfItem> item = _place.reader.next(LogSlice::kBytes);
    if (!item)
        return;
    _place.hasNext = true;
    _place.nextMessage.assign(1, item->type);
    _place.nextMessage.insert(_place.nextMessage.end(), item->bytes.begin(), item->bytes.end());
    const bool isBelieved = item->timestamp == 0 || believe(item->timestamp);
    _place.nextTime = _place.time;
    if (!isBelieved)
        ++_place.impossibleTimes;
    else
        _place.nextTime = std::max(_place.time, _place.clock.timeOf(item->timestamp));
}

// Whether the next item's time counts. The first one that does sets the clock.
bool LogDecoder::believe(std::uint64_t timestamp)
{
    if (_place.hasClock) {
        const bool isLeap = _place.clock.timeOf(timestamp) - _place.time > TimesAhead::kLongestStep;
        return !isLeap || TimesAhead(_place.reader).allowLeap(timestamp, _place.clock, _place.time);
    }
    if (!TimesAhead(_place.reader).allowStart(timestamp))
        return false;
    _place.clock = LogClock(timestamp);
    _place.hasClock = true;
    return true;
}

void LogDecoder::takeNext()
{
    if (!_place.hasNext)
        return;
    decodeNext();
    _place.hasNext = false;
    _place.time = _place.nextTime;
    ++_place.itemsTaken;
    lookAhead();
    const bool isWholeMoment = !_place.hasNext || _place.nextTime > _place.time;
    if (isWholeMoment && _place.servingCell.note(display()))
        ++_place.servingCellChanges;
}

void LogDecoder::decodeNext()
{
    const Silence silence(_tellsErrors ? Silence::Of::AllButErrors : Silence::Of::Everything);
    const MessageTime time(_place.hasClock ? _place.clock.millisecondsSince1970(_place.nextTime)
                                           : kNoReadingTime);
    try {
        _generator->updateState(_state, _place.nextMessage);
    } catch (const std::exception& failure) {
        logError("Dropping a message of %zu bytes: %s", _place.nextMessage.size(), failure.what());
    }
}

const PropertyValue& LogDecoder::display() const { return _state[kDisplayKey]; }

std::optional<std::string> LogDecoder::problem() const
{
    // A cell monitor has no template: its display begins with the first list of cells.
    if (display() || itemsTaken() == 0 || _technology == kTSLogChannelTechnology_IFX)
        return std::nullopt;
    return "the display template of \"" + nameOfTechnology(_technology) +
           "\" is missing or damaged: install orvane again";
}

std::size_t LogDecoder::Checkpoint::bytes() const
{
    return sizeof *this + generator.bytes + place.nextMessage.size() + place.reader.bytesKept();
}

LogDecoder::Checkpoint LogDecoder::checkpoint() const
{
    return {_place, _generator->checkpoint(_state)};
}

void LogDecoder::restore(const Checkpoint& checkpoint)
{
    _place = checkpoint.place;
    _generator->restore(_state, checkpoint.generator);
}

} // namespace orvane

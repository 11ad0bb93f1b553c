#include "recordings/LogSurvey.h"

#include "dlf/DlfTime.h"
#include "dlf/VersionReport.h"
#include "platform/base/Technology.h"
#include "recordings/LogSlice.h"

#include <algorithm>

namespace orvane
{

namespace
{

constexpr std::size_t kNamedRanges = 3;

// The survey's part of the time that it takes to read a log and decode it, about.
constexpr double kShareOfTime = 0.05;

} // namespace

LogSurvey::LogSurvey(std::shared_ptr<ByteSource> log, std::optional<std::string> technology)
    : _log(std::move(log)), _given(std::move(technology)), _reader(_log)
{
}

bool LogSurvey::takeSlice()
{
    if (_given)
        return false;
    for (LogSlice slice(_reader); slice.goesOn();) {
        const auto item = _reader.next(LogSlice::kBytes);
        if (!item)
            return !_reader.isAtEnd();
        if (item->position == 0 && item->logCode == kDlfVersionReportCode)
            _beginsWithReport = true;
        else
            take(*item);
    }
    return true;
}

void LogSurvey::take(const DlfItem& item)
{
    _hasItems = true;
    _finder.take(item);
    if (item.timestamp < kFirstTimelyTimestamp)
        return;
    const bool isFuture = item.timestamp >= kFirstFutureTimestamp;
    const bool isFirst = _lastTimestamp == 0;
    const bool agrees =
        !isFuture &&
        (isFirst || areTimestampsWithin(kDlfStepsPerDay, _lastTimestamp, item.timestamp));
    ++(agrees ? _timelyItems : _untimelyItems);
    if (!isFuture)
        _lastTimestamp = item.timestamp;
}

double LogSurvey::progress() const
{
    if (_given)
        return 1;
    const auto size = static_cast<double>(_log->size());
    return size > 0 ? std::min(static_cast<double>(_reader.position()) / size, 1.0) : 1.0;
}

double LogSurvey::progressWith(double decoded) const
{
    if (_given)
        return decoded;
    return kShareOfTime * progress() + (1 - kShareOfTime) * decoded;
}

// Almost any two bytes are a plausible length, so most of any file could be items. Only the items
// of a log have timestamps that agree with each other.
bool LogSurvey::isLog() const
{
    return _beginsWithReport ||
           (_reader.placedBytes() > _reader.unplacedBytes() && _timelyItems >= _untimelyItems);
}

std::optional<std::string> LogSurvey::technology() const
{
    if (_given)
        return _given;
    return isLog() ? _finder.technology() : std::nullopt;
}

std::string LogSurvey::complaint(const std::string& path) const
{
    if (isLog() && !_hasItems)
        return "\"" + path +
               "\": the log is empty, nothing follows its version report: name another file";
    // Without a report only agreeing times distinguish a log of unknown codes from foreign bytes.
    if (isLog() && (_beginsWithReport || _timelyItems > 1))
        return "\"" + path +
               "\" holds no log codes that tell its technology: name it with --technology, one "
               "of " +
               technologyNames();
    return "\"" + path +
           "\" is neither a diagnostic log (.dlf) nor a snapshot (.orvane): name another file or, "
           "for a badly damaged log, its technology with --technology, one of " +
           technologyNames();
}

std::string remarkOn(const DlfReader& reader, std::uint64_t impossibleTimes, std::uint64_t size)
{
    std::string text;
    const auto& ranges = reader.unplacedRanges();
    const std::size_t named = std::min(ranges.size(), kNamedRanges);
    for (std::size_t i = 0; i < named; ++i)
        text += (i > 0 ? ", " : "") + std::to_string(ranges[i].length) + " at byte " +
                std::to_string(ranges[i].position);
    if (reader.unplacedRangeCount() > named)
        text += " and at " + std::to_string(reader.unplacedRangeCount() - named) + " more places";
    if (!text.empty())
        text = std::to_string(reader.unplacedBytes()) + " bytes could not be placed: " + text;
    if (impossibleTimes > 0)
        text += (text.empty() ? "" : "; ") + std::to_string(impossibleTimes) +
                (impossibleTimes == 1 ? " item with an impossible time"
                                      : " items with impossible times");
    if (reader.size() < size)
        text += (text.empty() ? "" : "; ") + std::to_string(size - reader.size()) +
                " bytes could not be read: the file ends at byte " + std::to_string(reader.size());
    return text;
}

} // namespace orvane

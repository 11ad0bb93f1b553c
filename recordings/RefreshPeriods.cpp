#include "recordings/RefreshPeriods.h"

#include "recordings/LogSlice.h"
#include "recordings/LogSurvey.h"

#include <utility>

namespace orvane
{

RefreshPeriods::RefreshPeriods(std::shared_ptr<ByteSource> log, const std::string& technology,
                               LogTime period)
    : _bytesAtFirst(log->size()), _play(std::move(log), technology), _period(period)
{
    _play.setTellsErrors(true);
}

RefreshPeriods::Reached RefreshPeriods::takeSlice()
{
    for (LogSlice slice(_play.reader()); slice.goesOn();) {
        _play.lookAhead();
        if (!_play.hasNext()) {
            if (!_play.isAtEnd())
                return Reached::Nothing;
            return std::exchange(_isOpen, false) ? Reached::Period : Reached::End;
        }
        const auto next = _play.nextTime() / _period;
        if (_isOpen && next > _play.time() / _period) {
            _isOpen = false;
            return Reached::Period;
        }
        _isOpen = true;
        _play.takeNext();
    }
    return Reached::Nothing;
}

double RefreshPeriods::progress() const
{
    const auto size = static_cast<double>(_bytesAtFirst);
    return size > 0 ? static_cast<double>(_play.reader().position()) / size : 1;
}

std::string RefreshPeriods::remark() const
{
    return remarkOn(_play.reader(), _play.impossibleTimes(), _bytesAtFirst);
}

} // namespace orvane

#include "recordings/RefreshPeriods.h"

#include "recordings/LogSlice.h"
#include "recordings/LogSurvey.h"

#include <utility>

namespace orvane
{

RefreshPeriods::RefreshPeriods(std::shared_ptr<ByteSource> log, const std::string& technology,
                               LogTime period)
    : _bytesAtFirst(log->size()), _decoder(std::move(log), technology), _period(period)
{
    _decoder.setTellsErrors(true);
}

RefreshPeriods::Reached RefreshPeriods::takeSlice()
{
    for (LogSlice slice(_decoder.reader()); slice.goesOn();) {
        _decoder.lookAhead();
        if (!_decoder.hasNext()) {
            if (!_decoder.isAtEnd())
                return Reached::Nothing;
            return std::exchange(_isOpen, false) ? Reached::Period : Reached::End;
        }
        const auto next = _decoder.nextTime() / _period;
        if (_isOpen && next > _decoder.time() / _period) {
            _isOpen = false;
            return Reached::Period;
        }
        _isOpen = true;
        _decoder.takeNext();
    }
    return Reached::Nothing;
}

double RefreshPeriods::progress() const
{
    const auto size = static_cast<double>(_bytesAtFirst);
    return size > 0 ? static_cast<double>(_decoder.reader().position()) / size : 1;
}

std::string RefreshPeriods::remark() const
{
    return remarkOn(_decoder.reader(), _decoder.impossibleTimes(), _bytesAtFirst);
}

} // namespace orvane

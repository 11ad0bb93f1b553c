#include "telephonyd/phone/DrivenScenario.h"

#include <utility>

namespace orvane
{

std::vector<PhoneMessage> DrivenScenario::step(std::chrono::milliseconds now)
{
    if (_now.count() < 0) {
        _now = {};
        first();
    }
    while (_now + Drive::kStep <= now) {
        _now += Drive::kStep;
        next();
    }
    return std::exchange(_messages, {});
}

} // namespace orvane

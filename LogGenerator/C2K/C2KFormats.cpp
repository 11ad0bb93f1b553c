#include "LogGenerator/C2K/C2KFormats.h"

#include <cmath>

namespace orvane
{

namespace
{

constexpr double kZeroDecibels = 512;

} // namespace

std::string badValue(std::int64_t raw) { return printed("[Bad Value %d]", static_cast<int>(raw)); }
std::string reserved(std::int64_t raw) { return printed("[Reserved %d]", static_cast<int>(raw)); }
std::string otherIndicator(std::int64_t raw) { return printed("ERI - %d", static_cast<int>(raw)); }

double decibelsOfEnergy(std::int64_t energy)
{
    return 10 * std::log10(static_cast<double>(energy) / kZeroDecibels);
}

} // namespace orvane

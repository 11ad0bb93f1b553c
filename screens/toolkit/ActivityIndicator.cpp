#include "screens/toolkit/ActivityIndicator.h"

namespace orvane
{

void ActivityIndicator::setHidesWhenStopped(bool hides)
{
    if (_hidesWhenStopped == hides)
        return;
    _hidesWhenStopped = hides;
    changed();
}

void ActivityIndicator::setAnimating(bool isAnimating)
{
    if (_isAnimating == isAnimating)
        return;
    _isAnimating = isAnimating;
    changed();
}

} // namespace orvane

#include "screens/toolkit/ScrollView.h"

namespace orvane
{

void ScrollView::setContentSize(const Size& size)
{
    if (_contentSize == size)
        return;
    _contentSize = size;
    changed();
}

} // namespace orvane

#pragma once

#include "screens/toolkit/View.h"

namespace orvane
{

// A window onto content that may be wider than itself. How far the user has scrolled it is the
// front end's own.
class ScrollView : public View
{
public:
    [[nodiscard]] const Size& contentSize() const { return _contentSize; }
    void setContentSize(const Size& size);
    [[nodiscard]] bool isScrollable() const { return _contentSize.width > frame().width; }

private:
    Size _contentSize;
};

} // namespace orvane

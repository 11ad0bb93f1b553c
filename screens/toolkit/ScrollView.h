#pragma once

#include "screens/toolkit/View.h"

namespace orvane
{

// Shows a part of content that may be wider than the view. The front end keeps how far the user has
// scrolled.
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

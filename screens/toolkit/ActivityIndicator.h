#pragma once

#include "screens/toolkit/View.h"

namespace orvane
{

// A small grey indicator that turns while the program waits for something.
class ActivityIndicator : public View
{
public:
    [[nodiscard]] bool isAnimating() const { return _isAnimating; }
    void startAnimating() { setAnimating(true); }
    void stopAnimating() { setAnimating(false); }
    void setHidesWhenStopped(bool hides);
    [[nodiscard]] bool isHidden() const override
    {
        return View::isHidden() || (_hidesWhenStopped && !_isAnimating);
    }

private:
    void setAnimating(bool isAnimating);

    bool _isAnimating = false;
    bool _hidesWhenStopped = false;
};

} // namespace orvane

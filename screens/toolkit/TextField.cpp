#include "screens/toolkit/TextField.h"

#include <utility>

namespace orvane
{

void TextField::setText(std::string text)
{
    if (_text == text)
        return;
    _text = std::move(text);
    changed();
}

void TextField::pressReturn()
{
    if (_delegate)
        _delegate->textFieldShouldReturn(*this);
}

void TextField::becomeFirstResponder()
{
    if (_isFirstResponder)
        return;
    _isFirstResponder = true;
    changed();
}

bool TextField::resignFirstResponder()
{
    if (_isFirstResponder) {
        _isFirstResponder = false;
        changed();
    }
    return true;
}

} // namespace orvane

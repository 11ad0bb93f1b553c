#pragma once

#include "screens/toolkit/View.h"

#include <string>

namespace orvane
{

class TextField;

class TextFieldDelegate
{
public:
    virtual ~TextFieldDelegate() = default;
    // Return was pressed. True if the field is to behave as usual.
    virtual bool textFieldShouldReturn(TextField& field) = 0;
};

// One line of text that the user edits. The front end does the editing and calls setText() after
// each change.
class TextField : public View
{
public:
    [[nodiscard]] const std::string& text() const { return _text; } // valid UTF-8
    void setText(std::string text);

    // Not owned; may be null.
    void setDelegate(TextFieldDelegate* delegate) { _delegate = delegate; }
    [[nodiscard]] TextFieldDelegate* delegate() const { return _delegate; }

    // The user has pressed Return.
    void pressReturn();

    // Whether the field has the keyboard.
    [[nodiscard]] bool isFirstResponder() const { return _isFirstResponder; }
    void becomeFirstResponder();
    bool resignFirstResponder() override;

private:
    std::string _text;
    TextFieldDelegate* _delegate = nullptr;
    bool _isFirstResponder = false;
};

} // namespace orvane

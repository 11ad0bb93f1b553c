#pragma once

#include "screens/toolkit/TextField.h"

#include <QObject>

#include <memory>

class QLineEdit;

namespace orvane
{

// Connects a text field with the widget in which the user edits it. Only differences are set, so
// that typing is never disturbed, also with an input method.
class TextFieldBinding final : public QObject
{
public:
    TextFieldBinding(QLineEdit& line, const std::shared_ptr<TextField>& field);

    // Shows what the field holds.
    void sync();

protected:
    bool eventFilter(QObject* watched, QEvent* event) override;

private:
    QLineEdit& _line;
    std::weak_ptr<TextField> _field;
    bool _hadKeyboard = false;
};

} // namespace orvane

#include "screens/window/TextFieldBinding.h"

#include <QFocusEvent>
#include <QLineEdit>

#include <utility>

namespace orvane
{

TextFieldBinding::TextFieldBinding(QLineEdit& line, const std::shared_ptr<TextField>& field)
    : _line(line), _field(field)
{
    field->setText(line.text().toStdString());
    line.installEventFilter(this);
    connect(&line, &QLineEdit::textChanged, this, [this](const QString& text) {
        if (const auto edited = _field.lock())
            edited->setText(text.toStdString());
    });
    connect(&line, &QLineEdit::returnPressed, this, [this] {
        if (const auto edited = _field.lock())
            edited->pressReturn();
    });
}

void TextFieldBinding::sync()
{
    const auto field = _field.lock();
    if (!field)
        return;
    if (const QString text = QString::fromStdString(field->text()); text != _line.text())
        _line.setText(text);
    if (std::exchange(_hadKeyboard, field->isFirstResponder()) == field->isFirstResponder())
        return;
    if (field->isFirstResponder())
        _line.setFocus(Qt::OtherFocusReason);
    else
        _line.parentWidget()->setFocus(Qt::OtherFocusReason); // what is in front keeps the keyboard
}

bool TextFieldBinding::eventFilter(QObject*, QEvent* event)
{
    const auto field = _field.lock();
    const bool isIn = event->type() == QEvent::FocusIn;
    if (!field || (!isIn && event->type() != QEvent::FocusOut))
        return false;
    // When another window comes to the front, the field keeps the keyboard of this one.
    if (static_cast<QFocusEvent*>(event)->reason() == Qt::ActiveWindowFocusReason)
        return false;
    _hadKeyboard = isIn;
    if (isIn)
        field->becomeFirstResponder();
    else
        field->resignFirstResponder();
    return false;
}

} // namespace orvane

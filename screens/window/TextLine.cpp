#include "screens/window/TextLine.h"

#include "screens/window/Drawing.h"
#include "screens/window/Fonts.h"
#include "screens/window/Theme.h"

#include <QPainter>

#include <cmath>

namespace orvane
{

TextLine::TextLine(QWidget* parent) : QWidget(parent)
{
    setSizePolicy(QSizePolicy::Preferred, QSizePolicy::Preferred);
}

void TextLine::setText(const QString& text)
{
    if (_text == text)
        return;
    _text = text;
    setAccessibleName(text);
    updateGeometry();
    update();
}

void TextLine::setLineFont(const QFont& font)
{
    if (this->font() == font)
        return;
    setFont(font);
    updateGeometry();
}

QSize TextLine::sizeHint() const
{
    const QSizeF size = sizeOfLine(_text, font());
    return {static_cast<int>(std::ceil(size.width())), static_cast<int>(std::ceil(size.height()))};
}

QSize TextLine::minimumSizeHint() const { return {0, sizeHint().height()}; }

void TextLine::paintEvent(QPaintEvent*)
{
    const Theme& theme = Theme::of(*this);
    QPainter painter(this);
    painter.setPen(_isQuiet ? theme.quietText : theme.text);
    painter.setFont(font());
    drawLine(painter, rect(), _alignment, _text);
}

} // namespace orvane

#include "screens/window/WrappedText.h"

#include "screens/window/Fonts.h"
#include "screens/window/Theme.h"

#include <QEvent>

namespace orvane
{

WrappedText::WrappedText(QWidget* parent, const Font& font, Tone tone) : QLabel(parent), _tone(tone)
{
    setTextFormat(Qt::PlainText);
    setFont(fontFor(font));
    setAlignment(Qt::AlignHCenter);
    setWordWrap(true);
    applyTheme();
}

void WrappedText::changeEvent(QEvent* event)
{
    if (event->type() == QEvent::PaletteChange)
        applyTheme();
    QLabel::changeEvent(event);
}

void WrappedText::applyTheme()
{
    const Theme& theme = Theme::of(*this);
    const QColor& colour = _tone == Tone::Quiet     ? theme.quietText
                           : _tone == Tone::Warning ? theme.warning
                                                    : theme.text;
    QPalette changed = palette();
    if (changed.color(QPalette::WindowText) == colour)
        return;
    changed.setColor(QPalette::WindowText, colour);
    setPalette(changed);
}

} // namespace orvane

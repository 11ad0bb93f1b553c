#include "screens/window/Theme.h"

#include <QPalette>
#include <QWidget>

namespace orvane
{

namespace
{

Theme makeLight()
{
    return {
        .background = QColor(0xFF, 0xFF, 0xFF),
        .bar = QColor(0xF5, 0xF6, 0xF8),
        .shade = QColor(0x10, 0x14, 0x1A, 0x60),
        .text = QColor(0x1B, 0x1F, 0x24),
        .quietText = QColor(0x5B, 0x65, 0x72),
        .line = QColor(0xDF, 0xE2, 0xE7),
        .pressed = QColor(0xE4, 0xEC, 0xF6),
        .accent = QColor(0x1A, 0x5F, 0xB4),
        .badge = QColor(0xE6, 0xE9, 0xEE),
        .warning = QColor(0xA0, 0x38, 0x00),
        .disabled = QColor(0x8A, 0x93, 0x9E),
    };
}

Theme makeDark()
{
    return {
        .background = QColor(0x18, 0x1A, 0x1F),
        .bar = QColor(0x1F, 0x22, 0x27),
        .shade = QColor(0x00, 0x00, 0x00, 0x90),
        .text = QColor(0xE9, 0xEB, 0xEE),
        .quietText = QColor(0x9C, 0xA6, 0xB2),
        .line = QColor(0x31, 0x35, 0x3C),
        .pressed = QColor(0x27, 0x31, 0x3F),
        .accent = QColor(0x7F, 0xB5, 0xF5),
        .badge = QColor(0x2E, 0x33, 0x3B),
        .warning = QColor(0xFF, 0xA3, 0x66),
        .disabled = QColor(0x6B, 0x74, 0x80),
    };
}

} // namespace

const Theme& Theme::light()
{
    static const Theme theme = makeLight();
    return theme;
}

const Theme& Theme::dark()
{
    static const Theme theme = makeDark();
    return theme;
}

const Theme& Theme::of(const QWidget& widget)
{
    constexpr int kHalfLight = 128;
    return widget.palette().color(QPalette::Window).lightness() < kHalfLight ? dark() : light();
}

} // namespace orvane

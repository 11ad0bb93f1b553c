#include "screens/window/Fonts.h"

#include <QFontDatabase>
#include <QFontMetricsF>
#include <QGuiApplication>

#include <algorithm>
#include <array>
#include <cmath>

namespace orvane
{

namespace
{

bool hasTabularFigures(const QFont& font)
{
    const QFontMetricsF metrics(font);
    const double width = metrics.horizontalAdvance(QLatin1Char('0'));
    for (char figure = '1'; figure <= '9'; ++figure)
        if (std::abs(metrics.horizontalAdvance(QLatin1Char(figure)) - width) > 0.01)
            return false;
    return true;
}

QFont systemFont()
{
    const QFont desktop = QGuiApplication::font();
    if (hasTabularFigures(desktop))
        return desktop;
    constexpr std::array kOthers{"Noto Sans", "DejaVu Sans", "Liberation Sans"};
    const QStringList families = QFontDatabase::families();
    for (const char* family : kOthers)
        if (families.contains(QLatin1String(family)))
            return QFont(QLatin1String(family));
    return desktop;
}

} // namespace

QFont fontFor(const Font& font)
{
    // The desktop's font changes rarely, and finding the widths of its figures takes a while.
    static QFont desktop;
    static QFont system = systemFont();
    if (desktop != QGuiApplication::font()) {
        desktop = QGuiApplication::font();
        system = systemFont();
    }
    QFont result = font.family.empty() ? system : QFont(QString::fromStdString(font.family));
    result.setPixelSize(std::max(1, static_cast<int>(std::lround(font.size))));
    result.setWeight(font.isBold ? QFont::Bold : QFont::Normal);
    return result;
}

QSizeF sizeOfLine(const QString& line, const QFont& font)
{
    const QFontMetricsF metrics(font);
    return {metrics.horizontalAdvance(line), metrics.height()};
}

} // namespace orvane

#include "screens/window/PlainText.h"

#include "platform/base/Utf8.h"

#include <QTextDocument>
#include <QToolTip>
#include <QWidget>

namespace orvane
{

namespace
{

constexpr std::size_t kLongestLine = 4096; // bytes

} // namespace

QString lineOf(std::string_view text)
{
    QString line = QString::fromStdString(printableText(text.substr(0, kLongestLine)));
    if (text.size() > kLongestLine)
        line += QChar(0x2026); // an ellipsis
    return line;
}

QString plainToolTip(const QString& text)
{
    if (!Qt::mightBeRichText(text))
        return text;
    return QStringLiteral("<p style=\"white-space: pre-wrap\">%1</p>").arg(text.toHtmlEscaped());
}

void setPlainToolTip(QWidget& widget, const QString& text)
{
    const QString toolTip = plainToolTip(text);
    widget.setToolTip(toolTip);
    // Where there is no description, screen readers get the tool tip with its tags.
    widget.setAccessibleDescription(toolTip == text ? QString() : text);
}

void showPlainToolTip(const QPoint& onScreen, const QString& text, QWidget& widget,
                      const QRect& area)
{
    QToolTip::showText(onScreen, plainToolTip(text), &widget, area);
}

void setPlainWindowTitle(QWidget& window, QString title)
{
    // Qt's mark for a document that was changed; twice, it stands for itself.
    window.setWindowTitle(title.replace(QLatin1String("[*]"), QLatin1String("[*][*]")));
}

} // namespace orvane

#include "screens/window/EmptyView.h"

#include "screens/window/Drawing.h"
#include "screens/window/Fonts.h"
#include "screens/window/Theme.h"

#include <QFontMetricsF>
#include <QPainter>
#include <QStringList>

#include <algorithm>

namespace orvane
{

namespace
{

constexpr double kSignHeight = 54;
constexpr double kSpacing = 8;
constexpr double kMargin = 24;
constexpr double kWidest = 360;
constexpr double kShareAbove = 0.4; // of the room that the contents leave
constexpr int kFlags = Qt::AlignHCenter | Qt::TextWordWrap;

} // namespace

EmptyView::EmptyView(QWidget* parent, const QString& hint) : QWidget(parent), _hint(hint)
{
    // Touches are for the table below: a swipe from its edge goes back.
    setAttribute(Qt::WA_TransparentForMouseEvents);
    setAccessibleName(text());
}

void EmptyView::setWaiting(bool isWaiting)
{
    if (_isWaiting == isWaiting)
        return;
    _isWaiting = isWaiting;
    setAccessibleName(text());
    update();
}

std::vector<EmptyView::Paragraph> EmptyView::paragraphs() const
{
    std::vector<Paragraph> shown{
        {tr("No data yet"), fontFor(Font::boldSystem(17))}
    };
    if (!_isWaiting)
        return shown;
    shown.push_back({tr("Waiting for the telephony server"), fontFor(Font::system(15))});
    if (!_hint.isEmpty())
        shown.push_back({_hint, fontFor(Font::system(13)), true});
    return shown;
}

QString EmptyView::text() const
{
    QStringList texts;
    for (const Paragraph& paragraph : paragraphs())
        texts += paragraph.text;
    return texts.join(QLatin1Char('\n'));
}

// Sign and texts are placed and drawn together, so that no part is drawn where another one was.
void EmptyView::paintEvent(QPaintEvent*)
{
    const Theme& theme = Theme::of(*this);
    const std::vector<Paragraph> shown = paragraphs();
    const double textWidth = std::clamp(width() - 2 * kMargin, 1.0, kWidest);
    const auto placeBelow = [&](double y, const Paragraph& paragraph) {
        const QRectF room((width() - textWidth) / 2, y, textWidth, 1e6);
        return QFontMetricsF(paragraph.font).boundingRect(room, kFlags, paragraph.text);
    };
    double contents = kSignHeight;
    for (const Paragraph& paragraph : shown)
        contents += kSpacing + placeBelow(0, paragraph).height();

    QPainter painter(this);
    double y = std::max(0.0, (height() - contents) * kShareAbove);
    drawSign(painter, Sign::Signal, {0, y, static_cast<double>(width()), kSignHeight},
             theme.quietText);
    y += kSignHeight;
    for (const Paragraph& paragraph : shown) {
        const QRectF place = placeBelow(y + kSpacing, paragraph);
        painter.setFont(paragraph.font);
        painter.setPen(paragraph.isQuiet ? theme.quietText : theme.text);
        painter.drawText(QRectF((width() - textWidth) / 2, place.top(), textWidth, place.height()),
                         kFlags, paragraph.text);
        y = place.bottom();
    }
}

} // namespace orvane

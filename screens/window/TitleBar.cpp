#include "screens/window/TitleBar.h"

#include "screens/window/FlatButton.h"
#include "screens/window/Fonts.h"
#include "screens/window/TextLine.h"
#include "screens/window/Theme.h"

#include <QPainter>

#include <algorithm>
#include <cmath>

namespace orvane
{

namespace
{

constexpr int kHeight = 48;
constexpr int kMargin = 12;
constexpr double kTitleSize = 16;
constexpr double kMarkSize = 11;
constexpr double kMarkHeight = 17;

} // namespace

TitleBar::TitleBar(QWidget* parent, const QString& mark, std::function<void()> goBack)
    : QWidget(parent), _back(new FlatButton(this)), _title(new TextLine(this)), _mark(mark)
{
    setFixedHeight(kHeight);
    setFont(fontFor(Font::system(kMarkSize)));
    _back->setSign(Sign::Back);
    _back->hide();
    connect(_back, &QAbstractButton::clicked, this, [goBack = std::move(goBack)] { goBack(); });
    _title->setLineFont(fontFor(Font::boldSystem(kTitleSize)));
    _title->setAlignment(Qt::AlignCenter);
    if (!_mark.isEmpty())
        setAccessibleDescription(_mark);
}

const QString& TitleBar::title() const { return _title->text(); }

void TitleBar::show(const QString& title, bool canGoBack, const QString& backTitle)
{
    if (title == _title->text() && backTitle == _back->text() && canGoBack != _back->isHidden())
        return;
    _title->setText(title);
    _back->setText(backTitle);
    _back->setName(tr("Back to %1").arg(backTitle));
    _back->setVisible(canGoBack);
    setAccessibleName(title);
    placeParts();
}

void TitleBar::resizeEvent(QResizeEvent*) { placeParts(); }

void TitleBar::placeParts()
{
    // The title is in the middle of the bar if that leaves room for the back button, else beside
    // the button. A long title has precedence over a long button.
    const int titleWidth = _title->sizeHint().width();
    const int room = std::max(FlatButton::kSize, width() - titleWidth - 2 * kMargin);
    const int backWidth =
        _back->isHidden() ? 0 : std::min({_back->sizeHint().width(), room, width() / 2});
    const int left = backWidth == 0 ? kMargin : backWidth;
    const int middle = (width() - titleWidth) / 2;
    const int x = std::max(left, std::min(middle, width() - kMargin - titleWidth));
    const int titleHeight = _mark.isEmpty() ? kHeight : kHeight - static_cast<int>(kMarkHeight) - 4;
    _back->setGeometry(2, (kHeight - FlatButton::kSize) / 2, backWidth, FlatButton::kSize);
    _title->setGeometry(x, _mark.isEmpty() ? 0 : 2, std::min(titleWidth, width() - kMargin - x),
                        titleHeight);
    update();
}

void TitleBar::paintEvent(QPaintEvent*)
{
    const Theme& theme = Theme::of(*this);
    QPainter painter(this);
    painter.fillRect(rect(), theme.bar);
    painter.fillRect(0, height() - 1, width(), 1, theme.line);
    if (_mark.isEmpty())
        return;
    const double markWidth = sizeOfLine(_mark, font()).width() + 16;
    const double middle = _title->geometry().left() + _title->width() / 2.0;
    const double least = _back->isHidden() ? 4 : _back->geometry().right() + 5;
    const double most = std::max(least, width() - markWidth - 4);
    const double x = std::clamp(middle - markWidth / 2, least, most);
    const QRectF badge(x, kHeight - kMarkHeight - 5, markWidth, kMarkHeight);
    painter.setRenderHint(QPainter::Antialiasing);
    painter.setPen(Qt::NoPen);
    painter.setBrush(theme.badge);
    painter.drawRoundedRect(badge, kMarkHeight / 2, kMarkHeight / 2);
    painter.setPen(theme.quietText);
    drawLine(painter, badge, Qt::AlignCenter, _mark);
}

} // namespace orvane

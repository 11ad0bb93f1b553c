#include "screens/window/EmptyView.h"

#include "screens/window/Drawing.h"
#include "screens/window/Theme.h"
#include "screens/window/WrappedText.h"

#include <QPainter>
#include <QVBoxLayout>

namespace orvane
{

namespace
{

constexpr int kSignHeight = 64;
constexpr int kWidest = 360;

} // namespace

EmptyView::EmptyView(QWidget* parent, const QString& hint)
    : QWidget(parent), _title(new WrappedText(this, Font::boldSystem(17))),
      _reason(new WrappedText(this, Font::system(15))),
      _hint(new WrappedText(this, Font::system(13), WrappedText::Tone::Quiet))
{
    _title->setText(tr("No data yet"));
    _reason->setText(tr("Waiting for the telephony server"));
    _hint->setText(hint);
    // Touches are the table's, from whose edge one goes back.
    setAttribute(Qt::WA_TransparentForMouseEvents);
    auto* column = new QVBoxLayout(this);
    column->setContentsMargins(24, 8, 24, 8);
    column->setSpacing(8);
    column->addStretch(2);
    column->addSpacing(kSignHeight);
    for (WrappedText* label : {_title, _reason, _hint}) {
        label->setMaximumWidth(kWidest);
        auto* row = new QHBoxLayout;
        row->addStretch(0);
        row->addWidget(label, 1);
        row->addStretch(0);
        column->addLayout(row);
    }
    column->addStretch(3);
    setWaiting(false);
}

void EmptyView::setWaiting(bool isWaiting)
{
    if (_reason->isHidden() != isWaiting)
        return;
    _reason->setVisible(isWaiting);
    _hint->setVisible(isWaiting && !_hint->text().isEmpty());
    update();
}

QString EmptyView::text() const
{
    QString text = _title->text();
    for (const WrappedText* label : {_reason, _hint})
        if (!label->isHidden())
            text += QLatin1Char('\n') + label->text();
    return text;
}

void EmptyView::paintEvent(QPaintEvent*)
{
    QPainter painter(this);
    const QRectF place(0, _title->geometry().top() - kSignHeight, width(), kSignHeight - 10);
    drawSign(painter, Sign::Signal, place, Theme::of(*this).quietText);
}

} // namespace orvane

#include "platform/window/EmptyView.h"

#include "platform/window/Drawing.h"
#include "platform/window/Fonts.h"
#include "platform/window/Theme.h"

#include <QEvent>
#include <QLabel>
#include <QPainter>
#include <QVBoxLayout>

namespace orvane
{

namespace
{

constexpr int kSignHeight = 64;
constexpr int kWidest = 360;

QLabel* makeLabel(QWidget* parent, const Font& font, const QString& text)
{
    auto* label = new QLabel(text, parent);
    label->setTextFormat(Qt::PlainText);
    label->setFont(fontFor(font));
    label->setAlignment(Qt::AlignHCenter);
    label->setWordWrap(true);
    label->setMaximumWidth(kWidest);
    return label;
}

} // namespace

EmptyView::EmptyView(QWidget* parent, const QString& hint)
    : QWidget(parent), _title(makeLabel(this, Font::boldSystem(17), tr("No data yet"))),
      _reason(makeLabel(this, Font::system(15), tr("Waiting for the telephony server"))),
      _hint(makeLabel(this, Font::system(13), hint))
{
    // Touches are the table's, from whose edge one goes back.
    setAttribute(Qt::WA_TransparentForMouseEvents);
    auto* column = new QVBoxLayout(this);
    column->setContentsMargins(24, 8, 24, 8);
    column->setSpacing(8);
    column->addStretch(2);
    column->addSpacing(kSignHeight);
    for (QLabel* label : {_title, _reason, _hint}) {
        auto* row = new QHBoxLayout;
        row->addStretch(0);
        row->addWidget(label, 1);
        row->addStretch(0);
        column->addLayout(row);
    }
    column->addStretch(3);
    applyTheme();
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
    for (const QLabel* label : {_reason, _hint})
        if (!label->isHidden())
            text += QLatin1Char('\n') + label->text();
    return text;
}

void EmptyView::changeEvent(QEvent* event)
{
    if (event->type() == QEvent::PaletteChange)
        applyTheme();
    QWidget::changeEvent(event);
}

void EmptyView::applyTheme()
{
    const Theme& theme = Theme::of(*this);
    const auto colour = [](QLabel& label, const QColor& text) {
        QPalette palette = label.palette();
        palette.setColor(QPalette::WindowText, text);
        label.setPalette(palette);
    };
    colour(*_title, theme.text);
    colour(*_reason, theme.text);
    colour(*_hint, theme.quietText);
}

void EmptyView::paintEvent(QPaintEvent*)
{
    QPainter painter(this);
    const QRectF place(0, _title->geometry().top() - kSignHeight, width(), kSignHeight - 10);
    drawSign(painter, Sign::Signal, place, Theme::of(*this).quietText);
}

} // namespace orvane

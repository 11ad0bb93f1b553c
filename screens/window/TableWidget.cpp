#include "screens/window/TableWidget.h"

#include "screens/window/PlainText.h"
#include "screens/window/Theme.h"

#include <QAccessible>
#include <QHelpEvent>
#include <QKeyEvent>
#include <QPainter>
#include <QScrollBar>
#include <QSignalBlocker>
#include <QWheelEvent>

#include <algorithm>
#include <cmath>
#include <utility>

namespace orvane
{

namespace
{

constexpr int kBarWidth = 8;
constexpr int kNotch = 120; // a mouse wheel's, in its own unit
constexpr double kRowsPerNotch = 2;
constexpr double kSidewaysStep = 80; // points a key press

QString barStyle(const Theme& theme)
{
    return QStringLiteral("QScrollBar { background: transparent; width: %1px; margin: 0; }"
                          "QScrollBar::handle { background: %2; border-radius: 2px; margin: 2px;"
                          " min-height: 28px; }"
                          "QScrollBar::add-line, QScrollBar::sub-line { height: 0; }"
                          "QScrollBar::add-page, QScrollBar::sub-page { background: none; }")
        .arg(kBarWidth)
        .arg(theme.line.name());
}

} // namespace

TableWidget::TableWidget(QWidget* parent)
    : QWidget(parent), _touch(*this, *this), _bar(new QScrollBar(Qt::Vertical, this))
{
    setFocusPolicy(Qt::StrongFocus);
    setAttribute(Qt::WA_AcceptTouchEvents);
    setAttribute(Qt::WA_OpaquePaintEvent);
    _bar->setFocusPolicy(Qt::NoFocus);
    _bar->setAccessibleName(tr("Rows"));
    _bar->setStyleSheet(barStyle(Theme::of(*this)));
    connect(_bar, &QScrollBar::valueChanged, this, [this] { placeRows(); });
}

TableWidget::~TableWidget() = default;

int TableWidget::rowHeight() const
{
    const auto table = _table.lock();
    return table ? static_cast<int>(table->rowHeight())
                 : static_cast<int>(TableViewCell::kDefaultHeight);
}

std::size_t TableWidget::rowCount() const
{
    const auto table = _table.lock();
    return table ? table->numberOfRows() : 0;
}

QSize TableWidget::sizeHint() const
{
    constexpr std::size_t kMost = 1000;
    constexpr int kWidth = 320;
    return {kWidth, rowHeight() * static_cast<int>(std::min(rowCount(), kMost))};
}

void TableWidget::sync()
{
    if (const auto table = _table.lock(); table && table->frame().width != width()) {
        const Rect& frame = table->frame();
        table->setFrame({frame.x, frame.y, static_cast<double>(width()), frame.height});
    }
    const std::size_t rows = rowCount();
    if (rows > 0 && _currentRow >= rows)
        _currentRow = rows - 1;
    {
        const QSignalBlocker block(_bar);
        const double content = static_cast<double>(rows) * rowHeight();
        _bar->setRange(0, static_cast<int>(std::clamp(content - height(), 0.0, 2e9)));
        _bar->setPageStep(height());
        _bar->setSingleStep(rowHeight());
        _bar->setVisible(_bar->maximum() > 0);
    }
    placeRows();
    _touch.rowsChanged();
}

void TableWidget::placeRows()
{
    const auto table = _table.lock();
    const auto rowsTall = static_cast<std::size_t>(height() / rowHeight() + 2);
    const auto first = static_cast<std::size_t>(_bar->value() / rowHeight());
    const std::size_t last = std::min(first + rowsTall, rowCount());
    for (auto row = _rows.begin(); row != _rows.end();) {
        if (row->first >= first && row->first < last) {
            ++row;
            continue;
        }
        row->second->hide();
        _spares.push_back(std::move(row->second));
        row = _rows.erase(row);
    }
    if (!table)
        return;
    table->setVisibleRows(first, rowsTall);
    for (std::size_t row = first; row < last; ++row)
        if (const auto cell = table->cellForRow(row))
            showRow(row, cell);
    updateMarks();
}

void TableWidget::showRow(std::size_t row, const std::shared_ptr<TableViewCell>& cell)
{
    auto& widget = _rows[row];
    if (!widget) {
        widget = takeSpare();
        widget->setRow(row);
    }
    widget->setContent(DrawnRow::of(*cell));
    widget->setSideways(scrollPosition(row).x());
    const int top = static_cast<int>(row) * rowHeight() - _bar->value();
    widget->setGeometry(0, top, width(), rowHeight());
    widget->show();
}

std::unique_ptr<RowWidget> TableWidget::takeSpare()
{
    if (_spares.empty()) {
        auto made = std::make_unique<RowWidget>(this);
        _bar->raise();
        return made;
    }
    auto spare = std::move(_spares.back());
    _spares.pop_back();
    return spare;
}

RowWidget* TableWidget::rowWidget(std::size_t row) const
{
    const auto found = _rows.find(row);
    return found == _rows.end() ? nullptr : found->second.get();
}

void TableWidget::updateMarks()
{
    const auto table = _table.lock();
    const auto selected = table ? table->selectedRow() : std::nullopt;
    const auto pressed = _touch.pressedRow();
    for (const auto& [row, widget] : _rows) {
        // A row that opens nothing does not stay marked.
        const bool leadsOn = widget->content().accessory == CellAccessory::DisclosureIndicator;
        widget->setPressed(pressed == row || (selected == row && leadsOn));
        widget->setRing(_isKeyboardUsed && hasFocus() && row == _currentRow);
    }
}

void TableWidget::pressRow(std::size_t row)
{
    _currentRow = row;
    if (const auto table = _table.lock())
        table->selectRow(row);
    updateMarks();
}

bool TableWidget::event(QEvent* event)
{
    if (event->type() == QEvent::MouseButtonPress || event->type() == QEvent::TouchBegin) {
        _isKeyboardUsed = false;
        setFocus(Qt::MouseFocusReason);
        updateMarks();
    }
    if (event->type() == QEvent::ToolTip) {
        showToolTip(*static_cast<QHelpEvent*>(event));
        return true;
    }
    return _touch.takeEvent(*event) || QWidget::event(event);
}

void TableWidget::showToolTip(const QHelpEvent& event)
{
    const auto row = rowAt(event.pos());
    const RowWidget* widget = row ? rowWidget(*row) : nullptr;
    if (widget)
        showPlainToolTip(event.globalPos(), widget->content().cutText(), *this, widget->geometry());
}

void TableWidget::resizeEvent(QResizeEvent*)
{
    _bar->setGeometry(width() - kBarWidth, 0, kBarWidth, height());
    sync();
}

void TableWidget::paintEvent(QPaintEvent*)
{
    QPainter(this).fillRect(rect(), Theme::of(*this).background);
}

void TableWidget::changeEvent(QEvent* event)
{
    if (event->type() == QEvent::PaletteChange)
        _bar->setStyleSheet(barStyle(Theme::of(*this)));
    QWidget::changeEvent(event);
}

void TableWidget::wheelEvent(QWheelEvent* event)
{
    _touch.stop();
    const QPointF notches = QPointF(event->angleDelta()) / kNotch;
    const double pointsPerNotch = kRowsPerNotch * rowHeight();
    QPointF points =
        event->pixelDelta().isNull() ? notches * pointsPerNotch : QPointF(event->pixelDelta());
    if (event->modifiers() & Qt::ShiftModifier)
        points = points.transposed();
    event->accept();
    if (std::abs(points.x()) <= std::abs(points.y()))
        _bar->setValue(_bar->value() - static_cast<int>(std::lround(points.y())));
    else if (const auto row = rowAt(event->position()))
        scrollSideways(*row, -points.x());
}

void TableWidget::keyPressEvent(QKeyEvent* event)
{
    const std::size_t page = static_cast<std::size_t>(std::max(1, height() / rowHeight() - 1));
    const std::size_t rows = rowCount();
    if (rows == 0 || event->modifiers() & (Qt::AltModifier | Qt::ControlModifier))
        return QWidget::keyPressEvent(event);
    switch (event->key()) {
    case Qt::Key_Up:
        return moveTo(_currentRow - std::min<std::size_t>(1, _currentRow));
    case Qt::Key_Down:
        // The first press only shows which row has the keyboard.
        return moveTo(_isKeyboardUsed ? _currentRow + 1 : _currentRow);
    case Qt::Key_PageUp:
        return moveTo(_currentRow - std::min(page, _currentRow));
    case Qt::Key_PageDown:
        return moveTo(_currentRow + page);
    case Qt::Key_Home:
        return moveTo(0);
    case Qt::Key_End:
        return moveTo(rows - 1);
    case Qt::Key_Left:
        return scrollSideways(_currentRow, -kSidewaysStep);
    case Qt::Key_Right:
        return scrollSideways(_currentRow, kSidewaysStep);
    case Qt::Key_Return:
    case Qt::Key_Enter:
    case Qt::Key_Space:
    case Qt::Key_Select:
        moveTo(_currentRow);
        return pressRow(_currentRow);
    default:
        QWidget::keyPressEvent(event);
    }
}

void TableWidget::moveTo(std::size_t row)
{
    _touch.stop();
    _isKeyboardUsed = true;
    _currentRow = std::min(row, std::max<std::size_t>(rowCount(), 1) - 1);
    const int top = static_cast<int>(_currentRow) * rowHeight();
    if (top < _bar->value())
        _bar->setValue(top);
    else if (top + rowHeight() > _bar->value() + height())
        _bar->setValue(top + rowHeight() - height());
    updateMarks();
    if (RowWidget* widget = rowWidget(_currentRow)) {
        QAccessibleEvent focus(widget, QAccessible::Focus);
        QAccessible::updateAccessibility(&focus);
    }
}

void TableWidget::focusInEvent(QFocusEvent* event)
{
    if (event->reason() == Qt::TabFocusReason || event->reason() == Qt::BacktabFocusReason)
        _isKeyboardUsed = true;
    updateMarks();
}

void TableWidget::focusOutEvent(QFocusEvent*) { updateMarks(); }

std::optional<std::size_t> TableWidget::rowAt(const QPointF& position) const
{
    const double y = position.y() + _bar->value();
    const auto row = y < 0 ? rowCount() : static_cast<std::size_t>(y / rowHeight());
    return row < rowCount() ? std::optional(row) : std::nullopt;
}

QString TableWidget::keyOf(std::size_t row) const
{
    const RowWidget* widget = rowWidget(row);
    return widget ? widget->content().key() : QString();
}

QPointF TableWidget::scrollRange(std::optional<std::size_t> row) const
{
    const RowWidget* widget = row ? rowWidget(*row) : nullptr;
    return {widget ? widget->content().sidewaysRange() : 0.0, static_cast<double>(_bar->maximum())};
}

QPointF TableWidget::scrollPosition(std::optional<std::size_t> row) const
{
    const double y = _bar->value();
    const auto found = row ? _sideways.find(*row) : _sideways.end();
    if (found == _sideways.end() || found->second.key != keyOf(*row))
        return {0, y};
    return {std::min(found->second.offset, scrollRange(row).x()), y};
}

void TableWidget::scrollTo(std::optional<std::size_t> row, const QPointF& position)
{
    _bar->setValue(static_cast<int>(std::lround(position.y())));
    RowWidget* widget = row ? rowWidget(*row) : nullptr;
    if (!widget)
        return;
    if (position.x() > 0)
        _sideways[*row] = {keyOf(*row), position.x()};
    else
        _sideways.erase(*row);
    widget->setSideways(position.x());
}

void TableWidget::scrollSideways(std::size_t row, double by)
{
    const QPointF position = scrollPosition(row);
    const double x = std::clamp(position.x() + by, 0.0, scrollRange(row).x());
    scrollTo(row, {x, position.y()});
}

void TableWidget::showPress() { updateMarks(); }

} // namespace orvane

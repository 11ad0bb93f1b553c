#include "screens/window/TableTouch.h"

#include <QMouseEvent>
#include <QScrollEvent>
#include <QScrollPrepareEvent>
#include <QScroller>
#include <QScrollerProperties>
#include <QTouchEvent>
#include <QWidget>

#include <chrono>
#include <cmath>
#include <utility>

namespace orvane
{

namespace
{

constexpr double kEdge = 20;         // points from the left in which a swipe begins
constexpr double kTapReach = 12;     // points that a finger may stray and still press
constexpr double kDragStart = 0.002; // metres
// Longer than it takes to recognise a pan, so that the row under it does not flash.
constexpr std::chrono::milliseconds kShowAfter{70};

void setUpScroller(QScroller& scroller)
{
    QScrollerProperties properties = scroller.scrollerProperties();
    // Either up and down or sideways, never both.
    properties.setScrollMetric(QScrollerProperties::AxisLockThreshold, 1.0);
    properties.setScrollMetric(QScrollerProperties::DragStartDistance, kDragStart);
    for (const auto policy : {QScrollerProperties::HorizontalOvershootPolicy,
                              QScrollerProperties::VerticalOvershootPolicy})
        properties.setScrollMetric(policy, QScrollerProperties::OvershootAlwaysOff);
    scroller.setScrollerProperties(properties);
}

qint64 timeOf(const QInputEvent& event) { return static_cast<qint64>(event.timestamp()); }

} // namespace

TableTouch::TableTouch(QWidget& widget, Table& table) : _widget(widget), _table(table)
{
    setUpScroller(*QScroller::scroller(&widget));
    _showTimer.setSingleShot(true);
    QObject::connect(&_showTimer, &QTimer::timeout, &_showTimer, [this] {
        _isPressShown = true;
        _table.showPress();
    });
}

TableTouch::~TableTouch() = default;

bool TableTouch::takeEvent(QEvent& event)
{
    switch (event.type()) {
    case QEvent::MouseButtonPress:
    case QEvent::MouseButtonDblClick:
    case QEvent::MouseMove:
    case QEvent::MouseButtonRelease:
        return takeMouse(static_cast<QMouseEvent&>(event), event);
    case QEvent::TouchBegin:
    case QEvent::TouchUpdate:
    case QEvent::TouchEnd:
        takeTouch(static_cast<QTouchEvent&>(event));
        event.accept();
        return true;
    case QEvent::TouchCancel:
        cancel(timeOf(static_cast<QTouchEvent&>(event)));
        return true;
    case QEvent::ScrollPrepare: {
        auto& prepare = static_cast<QScrollPrepareEvent&>(event);
        _panRow = _table.rowAt(prepare.startPos());
        const QPointF range = _table.scrollRange(_panRow);
        prepare.setViewportSize(_widget.size());
        prepare.setContentPosRange({0, 0, range.x(), range.y()});
        prepare.setContentPos(_table.scrollPosition(_panRow));
        prepare.accept();
        return true;
    }
    case QEvent::Scroll:
        _table.scrollTo(_panRow, static_cast<QScrollEvent&>(event).contentPos());
        event.accept();
        return true;
    default:
        return false;
    }
}

bool TableTouch::takeMouse(const QMouseEvent& event, QEvent& accepted)
{
    const bool isMove = event.type() == QEvent::MouseMove;
    if (isMove ? !_isDown : event.button() != Qt::LeftButton)
        return false;
    accepted.accept();
    const Finger finger{event.position(), event.globalPosition(), timeOf(event)};
    if (isMove)
        move(finger);
    else if (event.type() == QEvent::MouseButtonRelease)
        end(finger);
    else
        begin(finger);
    return true;
}

void TableTouch::takeTouch(QTouchEvent& event)
{
    if (event.pointCount() == 0)
        return;
    // Other fingers are ignored.
    const QEventPoint& first = event.point(0);
    const Finger finger{first.position(), first.globalPosition(), timeOf(event)};
    if (event.type() == QEvent::TouchBegin)
        begin(finger);
    else if (event.type() == QEvent::TouchEnd)
        end(finger);
    else
        move(finger);
}

void TableTouch::begin(const Finger& finger)
{
    QScroller* scroller = QScroller::scroller(&_widget);
    // A touch that stops a moving table does not press a row.
    const bool wasInMotion = scroller->state() == QScroller::Scrolling;
    _isDown = true;
    _start = finger;
    const bool canSwipe = finger.position.x() < kEdge && _edgeSwipe.begin && !wasInMotion;
    _swipe = canSwipe ? Swipe::Possible : Swipe::None;
    scroller->handleInput(QScroller::InputPress, finger.position, finger.time);
    dropPress();
    const auto row = _table.rowAt(finger.position);
    if (wasInMotion || !row)
        return;
    _press = Press{*row, _table.keyOf(*row)};
    _showTimer.start(kShowAfter);
}

void TableTouch::move(const Finger& finger)
{
    if (!_isDown)
        return;
    const QPointF way = finger.onScreen - _start.onScreen;
    if (_swipe == Swipe::UnderWay) {
        _edgeSwipe.move(way.x());
        return;
    }
    QScroller* scroller = QScroller::scroller(&_widget);
    if (_swipe == Swipe::Possible && way.manhattanLength() > kTapReach) {
        const bool isRightwards = way.x() > std::abs(way.y());
        _swipe = isRightwards && _edgeSwipe.begin() ? Swipe::UnderWay : Swipe::None;
        if (_swipe == Swipe::UnderWay) {
            dropPress();
            scroller->handleInput(QScroller::InputRelease, _start.position, finger.time);
            _edgeSwipe.move(way.x());
            return;
        }
    }
    scroller->handleInput(QScroller::InputMove, finger.position, finger.time);
    if (scroller->state() == QScroller::Dragging || way.manhattanLength() > kTapReach)
        dropPress();
}

void TableTouch::end(const Finger& finger)
{
    if (!std::exchange(_isDown, false))
        return;
    if (std::exchange(_swipe, Swipe::None) == Swipe::UnderWay) {
        constexpr double kFarEnough = 0.3;
        const double way = finger.onScreen.x() - _start.onScreen.x();
        _edgeSwipe.end(way > kFarEnough * _widget.width());
        return;
    }
    QScroller::scroller(&_widget)->handleInput(QScroller::InputRelease, finger.position,
                                               finger.time);
    const auto press = _press;
    dropPress();
    if (press)
        _table.pressRow(press->row); // may destroy this
}

void TableTouch::cancel(qint64 time)
{
    if (!std::exchange(_isDown, false))
        return;
    if (std::exchange(_swipe, Swipe::None) == Swipe::UnderWay)
        _edgeSwipe.end(false);
    else
        QScroller::scroller(&_widget)->handleInput(QScroller::InputRelease, _start.position, time);
    dropPress();
}

void TableTouch::rowsChanged()
{
    if (_press && _table.keyOf(_press->row) != _press->key)
        dropPress();
}

void TableTouch::stop()
{
    QScroller* scroller = QScroller::scroller(&_widget);
    if (scroller->state() == QScroller::Scrolling)
        scroller->stop();
}

std::optional<std::size_t> TableTouch::pressedRow() const
{
    return _isPressShown && _press ? std::optional(_press->row) : std::nullopt;
}

void TableTouch::dropPress()
{
    _press.reset();
    _showTimer.stop();
    if (std::exchange(_isPressShown, false))
        _table.showPress();
}

} // namespace orvane

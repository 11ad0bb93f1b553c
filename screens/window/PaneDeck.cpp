#include "screens/window/PaneDeck.h"

#include "screens/window/TableWidget.h"
#include "screens/window/Theme.h"

#include <QEasingCurve>
#include <QPainter>
#include <QStyle>

#include <algorithm>
#include <utility>

namespace orvane
{

namespace
{

constexpr int kSlideMs = 250;
constexpr double kParallax = 0.3; // how far the lower pane moves, as a part of the width

} // namespace

PaneDeck::PaneDeck(QWidget* parent, QString waitingHint, bool isAnimated, std::function<void()> pop)
    : QWidget(parent), _waitingHint(std::move(waitingHint)), _isAnimated(isAnimated),
      _pop(std::move(pop))
{
    setAccessibleName(tr("Panes"));
    _animation.setDuration(kSlideMs);
    _animation.setEasingCurve(QEasingCurve::OutCubic);
    connect(&_animation, &QVariantAnimation::valueChanged, this,
            [this](const QVariant& value) { showSlide(value.toDouble()); });
    connect(&_animation, &QVariantAnimation::finished, this, [this] { endSlide(); });
}

PaneDeck::~PaneDeck() = default;

void PaneDeck::sync(NavigationController* navigation)
{
    Panes panes = panesOf(navigation);
    PaneWidget* const before = std::exchange(_top, panes.empty() ? nullptr : panes.back().get());
    std::swap(_panes, panes);
    // The panes that remain in `panes` have left the stack.
    if (before != _top) {
        const double from = _isSwipe ? _progress : 0;
        endSlide();
        const auto gone = std::find_if(panes.begin(), panes.end(),
                                       [&](const auto& pane) { return pane.get() == before; });
        const bool isPop = gone != panes.end();
        if (isPop)
            _leaving = std::move(*gone);
        const bool isAnimated = navigation && navigation->isLastChangeAnimated() && before && _top;
        if (isPop)
            startSlide(before, _top, from, 1, isAnimated);
        else
            startSlide(_top, before, 1, 0, isAnimated);
    }
    if (_top)
        _top->sync();
}

PaneDeck::Panes PaneDeck::panesOf(NavigationController* navigation)
{
    Panes panes;
    if (!navigation)
        return panes;
    for (const auto& controller : navigation->viewControllers()) {
        auto pane = takePane(controller);
        if (!pane && controller.get() == navigation->topViewController()) {
            pane = std::make_unique<PaneWidget>(this, controller, _waitingHint, edgeSwipe());
            pane->setGeometry(rect());
        }
        if (pane)
            panes.push_back(std::move(pane));
    }
    return panes;
}

std::unique_ptr<PaneWidget> PaneDeck::takePane(const std::shared_ptr<ViewController>& controller)
{
    for (auto& pane : _panes)
        if (pane && pane->controller() == controller)
            return std::move(pane);
    return nullptr;
}

PaneWidget* PaneDeck::paneBelowTop() const
{
    return _panes.size() > 1 ? _panes[_panes.size() - 2].get() : nullptr;
}

EdgeSwipe PaneDeck::edgeSwipe()
{
    EdgeSwipe swipe;
    swipe.begin = [this] {
        if (!paneBelowTop() || isSliding())
            return false;
        _isSwipe = true;
        showSliding(_top, paneBelowTop());
        showSlide(0);
        return true;
    };
    swipe.move = [this](double way) {
        if (_isSwipe)
            showSlide(std::clamp(way / std::max(width(), 1), 0.0, 1.0));
    };
    swipe.end = [this](bool isFarEnough) {
        if (!_isSwipe)
            return;
        if (isFarEnough)
            _pop();
        else
            startSlide(_over, _under, _progress, 0, true);
    };
    return swipe;
}

void PaneDeck::startSlide(PaneWidget* over, PaneWidget* under, double from, double to,
                          bool isAnimated)
{
    const bool isWanted = _isAnimated && isAnimated && isVisible() && over && under &&
                          style()->styleHint(QStyle::SH_Widget_Animation_Duration) > 0;
    if (!isWanted)
        return endSlide();
    showSliding(over, under);
    showSlide(from);
    _animation.setStartValue(from);
    _animation.setEndValue(to);
    _animation.start();
}

void PaneDeck::showSliding(PaneWidget* over, PaneWidget* under)
{
    _over = over;
    _under = under;
    for (PaneWidget* pane : {under, over}) {
        pane->show();
        pane->raise();
    }
}

void PaneDeck::showSlide(double progress)
{
    _progress = progress;
    if (_over)
        _over->move(static_cast<int>(progress * width()), 0);
    if (_under)
        _under->move(static_cast<int>((progress - 1) * kParallax * width()), 0);
}

void PaneDeck::endSlide()
{
    _animation.stop();
    _isSwipe = false;
    _over = nullptr;
    _under = nullptr;
    if (_leaving) {
        _leaving->hide();
        // The call may come from this pane.
        _leaving.release()->deleteLater();
    }
    for (const auto& pane : _panes)
        if (pane.get() != _top)
            pane->hide();
    if (!_top)
        return;
    _top->move(0, 0);
    _top->show();
    _top->raise();
}

void PaneDeck::resizeEvent(QResizeEvent*)
{
    endSlide();
    for (const auto& pane : _panes)
        pane->setGeometry(rect());
}

void PaneDeck::paintEvent(QPaintEvent*)
{
    QPainter(this).fillRect(rect(), Theme::of(*this).background);
}

} // namespace orvane

#pragma once

#include "screens/toolkit/NavigationController.h"
#include "screens/window/EdgeSwipe.h"
#include "screens/window/PaneWidget.h"

#include <QVariantAnimation>
#include <QWidget>

#include <functional>
#include <memory>
#include <vector>

namespace orvane
{

// The panes of a navigation stack. The top one is shown. A pushed pane slides over the one before;
// a popped pane slides away, following the finger if a swipe began it.
class PaneDeck final : public QWidget
{
public:
    // `pop` pops the stack.
    PaneDeck(QWidget* parent, QString waitingHint, bool isAnimated, std::function<void()> pop);
    ~PaneDeck() override;

    // The stack as it is now; null for none.
    void sync(NavigationController* navigation);

    // Null without a stack.
    [[nodiscard]] PaneWidget* top() const { return _top; }
    [[nodiscard]] bool isSliding() const { return _over != nullptr; }

protected:
    void resizeEvent(QResizeEvent* event) override;
    void paintEvent(QPaintEvent* event) override;

private:
    using Panes = std::vector<std::unique_ptr<PaneWidget>>;

    [[nodiscard]] Panes panesOf(NavigationController* navigation);
    std::unique_ptr<PaneWidget> takePane(const std::shared_ptr<ViewController>& controller);
    [[nodiscard]] PaneWidget* paneBelowTop() const;
    EdgeSwipe edgeSwipe();

    // The progress of a slide is 0 while `_over` is in place and 1 once it has left to the right.
    void startSlide(PaneWidget* over, PaneWidget* under, double from, double to, bool isAnimated);
    void showSliding(PaneWidget* over, PaneWidget* under);
    void showSlide(double progress);
    void endSlide();

    QString _waitingHint;
    bool _isAnimated;
    std::function<void()> _pop;
    Panes _panes;                         // panes shown so far, from the root upwards
    std::unique_ptr<PaneWidget> _leaving; // popped, and still sliding away
    PaneWidget* _top = nullptr;
    PaneWidget* _over = nullptr; // while something slides
    PaneWidget* _under = nullptr;
    double _progress = 0;
    bool _isSwipe = false; // a finger moves the pane, or has let it go
    QVariantAnimation _animation;
};

} // namespace orvane

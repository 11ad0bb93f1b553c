#include "screens/window/WindowTest.h"

#include "screens/window/QtWindowApplication.h"
#include "screens/window/TitleBar.h"

#include <QApplication>
#include <QDeadlineTimer>
#include <QPointingDevice>
#include <QTest>

#include <chrono>
#include <utility>

namespace orvane
{

namespace
{

NodePointer childAt(const NodePointer& node, std::string_view path)
{
    if (path.size() < 2 || !node)
        return node;
    const std::string_view rest = path.substr(1);
    const auto end = rest.find('/');
    const std::string_view name = rest.substr(0, end);
    if (const auto* children = node->childNodes())
        for (const NodePointer& child : *children)
            if (child->displayName() == name)
                return childAt(child, end == rest.npos ? "" : rest.substr(end));
    return nullptr;
}

// Qt's application object for all tests, on the platform without a display.
class WindowEnvironment final : public testing::Environment
{
public:
    void SetUp() override
    {
        qputenv("QT_QPA_PLATFORM", "offscreen");
        _application = std::make_unique<QtWindowApplication>();
        touchDevice.reset(QTest::createTouchDevice());
    }
    void TearDown() override
    {
        touchDevice.reset();
        _application.reset();
    }

    static inline std::unique_ptr<QPointingDevice> touchDevice;

private:
    std::unique_ptr<QtWindowApplication> _application;
};

// GoogleTest owns it.
[[maybe_unused]] const auto* const environment =
    testing::AddGlobalTestEnvironment(new WindowEnvironment);

} // namespace

QPointingDevice* touchScreen() { return WindowEnvironment::touchDevice.get(); }

void turnEvents()
{
    // Events may post further ones.
    for (int round = 0; round < 5; ++round) {
        QCoreApplication::processEvents();
        QCoreApplication::sendPostedEvents(nullptr, QEvent::DeferredDelete);
    }
}

bool turnEventsUntil(const std::function<bool()>& done)
{
    const QDeadlineTimer deadline(std::chrono::seconds{30});
    while (!done() && !deadline.hasExpired())
        QTest::qWait(5);
    return done();
}

QImage pictureOf(QWidget& widget, double scale)
{
    QImage image(widget.size() * scale, QImage::Format_RGB32);
    image.setDevicePixelRatio(scale);
    widget.render(&image);
    return image;
}

NodePointer valueNode(const std::string& name, const std::string& value)
{
    return std::make_shared<OrvaneModelLeafNode>(name, value);
}

NodePointer groupNode(const std::string& name, std::vector<NodePointer> children)
{
    return std::make_shared<OrvaneModelTreeNode>(name, std::move(children));
}

NodePointer rootNode(std::vector<NodePointer> children)
{
    return groupNode("Orvane", std::move(children));
}

QtScreen::Settings WindowTest::stillSettings()
{
    QtScreen::Settings settings;
    settings.isAnimated = false;
    settings.waitingHint = "Start telephonyd, or try the simulated phone: orvane --demo";
    return settings;
}

WindowTest::WindowTest(QtScreen::Settings settings)
    : screen([&] {
          settings.onClose = [this] { ++closeCount; };
          return std::move(settings);
      }())
{
    services.useShippedResources();
    frame().resize(360, 640);
}

WindowTest::~WindowTest() = default;

void WindowTest::show(NodePointer node)
{
    auto pane = std::make_shared<OrvanePaneController>(std::move(node), "/", *this);
    pane->setStatus("Connecting", true);
    _navigation = std::make_shared<NavigationController>(pane);
    _window = std::make_unique<Window>(screen.bounds());
    _window->setRootViewController(_navigation);
    _window->makeKeyAndVisible();
    turnEvents();
}

void WindowTest::refresh(const NodePointer& node)
{
    const auto controllers = _navigation->viewControllers();
    for (const auto& controller : controllers) {
        auto& pane = dynamic_cast<OrvanePaneController&>(*controller);
        pane.reloadWithNode(childAt(node, pane.path()));
    }
    turnEvents();
}

void WindowTest::setStatus(const std::string& text, bool isBusy)
{
    topController().setStatus(text, isBusy);
    turnEvents();
}

OrvanePaneController& WindowTest::topController() const
{
    return dynamic_cast<OrvanePaneController&>(*_navigation->topViewController());
}

QString WindowTest::title() const { return frame().titleBar().title(); }

QPoint WindowTest::middleOf(std::size_t index) const
{
    const RowWidget* widget = row(index);
    return widget ? widget->geometry().center() : QPoint(-1, -1);
}

void WindowTest::clickRow(std::size_t index)
{
    QTest::mouseClick(&table(), Qt::LeftButton, {}, middleOf(index));
    turnEvents();
}

void WindowTest::showSaveView()
{
    if (_saveScreen)
        return;
    _saveScreen = OrvaneSaveViewController::withSaveHistory(saveContents, *this);
    _navigation->presentModalViewController(_saveScreen, true);
}

void WindowTest::closeSaveView()
{
    if (!std::exchange(_saveScreen, nullptr))
        return;
    _navigation->dismissModalViewController(true);
}

} // namespace orvane

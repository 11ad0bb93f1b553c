// A refresh of a pane with 1,000 rows in the window: every value new, the visible rows drawn.

#include "screens/toolkit/Window.h"
#include "doubles/ManualMainQueue.h"
#include "screens/toolkit/NavigationController.h"
#include "screens/window/QtScreen.h"
#include "screens/window/QtWindowApplication.h"
#include "screens/window/WindowFrame.h"
#include "ui/OrvanePaneController.h"

#include <benchmark/benchmark.h>

#include <QImage>

#include <string>
#include <vector>

using namespace orvane;

namespace
{

class BenchmarkShell final : public Shell
{
public:
    [[nodiscard]] bool allowSaveButton() const override { return true; }
    void showSaveView() override {}
    void closeSaveView() override {}
    [[nodiscard]] MainQueue& mainQueue() override { return _queue; }
    [[nodiscard]] const FileSystem& files() const override { return _files; }

private:
    ManualMainQueue _queue;
    FileSystem _files;
};

NodePointer tree(const std::string& value)
{
    constexpr int kRows = 1000;
    std::vector<NodePointer> rows;
    for (int i = 0; i < kRows; ++i)
        rows.push_back(std::make_shared<OrvaneModelLeafNode>("Row " + std::to_string(i), value));
    return std::make_shared<OrvaneModelTreeNode>("Orvane", std::move(rows));
}

void reloadPane(benchmark::State& state)
{
    qputenv("QT_QPA_PLATFORM", "offscreen");
    const QtWindowApplication application;
    QtScreen screen{QtScreen::Settings{}};
    const auto scale = static_cast<int>(state.range(0));
    screen.frame().resize(360, 640);
    BenchmarkShell shell;
    const auto pane = std::make_shared<OrvanePaneController>(tree("-95.50 dBm"), "/", shell);
    Window window(screen.bounds());
    window.setRootViewController(std::make_shared<NavigationController>(pane));
    window.makeKeyAndVisible();
    screen.update();

    const NodePointer trees[] = {tree("-95.50 dBm"), tree("-96.25 dBm")};
    QImage picture(screen.frame().size() * scale, QImage::Format_RGB32);
    picture.setDevicePixelRatio(scale);
    std::size_t turn = 0;
    for (auto _ : state) {
        pane->reloadWithNode(trees[++turn % 2]);
        screen.update();
        screen.frame().render(&picture);
    }
}
BENCHMARK(reloadPane)->Arg(1)->Arg(2)->Arg(3)->ArgName("scale")->Unit(benchmark::kMillisecond);

} // namespace

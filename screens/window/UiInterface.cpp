#include "screens/window/UiInterface.h"

#include "platform/services/Services.h"
#include "screens/toolkit/Control.h"
#include "screens/toolkit/TableView.h"
#include "screens/window/FlatButton.h"
#include "screens/window/Fonts.h"
#include "screens/window/TableWidget.h"
#include "screens/window/TextFieldBinding.h"

#include <QBuffer>
#include <QLineEdit>
#include <QUiLoader>

namespace orvane
{

namespace
{

constexpr double kTextSize = 15; // for widgets whose size the file does not set

// Makes the widgets of this layer by the names that interface files use.
class Loader final : public QUiLoader
{
public:
    QWidget* createWidget(const QString& className, QWidget* parent, const QString& name) override
    {
        QWidget* widget = nullptr;
        if (className == QLatin1String("TableWidget"))
            widget = new TableWidget(parent);
        else if (className == QLatin1String("FlatButton"))
            widget = new FlatButton(parent);
        else
            return QUiLoader::createWidget(className, parent, name);
        widget->setObjectName(name);
        return widget;
    }
};

std::unique_ptr<QWidget> readFile(const std::string& name)
{
    const auto content = Services::current().resources().load(name, "ui");
    if (!content) {
        logError("There is no interface file \"%s.ui\"\n", name.c_str());
        return nullptr;
    }
    QBuffer file;
    file.setData(reinterpret_cast<const char*>(content->data()), static_cast<int>(content->size()));
    file.open(QIODevice::ReadOnly);
    Loader loader;
    std::unique_ptr<QWidget> widget(loader.load(&file));
    if (!widget)
        logError("The interface file \"%s.ui\" cannot be used: %s\n", name.c_str(),
                 qPrintable(loader.errorString().simplified()));
    else
        widget->setFont(fontFor(Font::system(kTextSize)));
    return widget;
}

} // namespace

std::unique_ptr<UiInterface> UiInterface::load(const std::string& name)
{
    auto widget = readFile(name);
    if (!widget)
        return nullptr;
    std::unique_ptr<UiInterface> made(new UiInterface);
    made->_widget = std::move(widget);
    made->_root = std::make_shared<Control>();
    made->_view = made->_root;
    for (QWidget* child : made->_widget->findChildren<QWidget*>())
        made->bind(*child);
    return made;
}

UiInterface::~UiInterface() = default;

std::unique_ptr<Interface> UiInterface::takeInterface()
{
    auto interface = std::make_unique<Interface>(std::exchange(_root, nullptr));
    interface->setOutlet(_widget->objectName().toStdString(), interface->view());
    for (const auto& [name, view] : std::exchange(_outlets, {}))
        interface->setOutlet(name, view);
    return interface;
}

void UiInterface::bind(QWidget& widget)
{
    std::shared_ptr<View> view;
    if (auto* table = dynamic_cast<TableWidget*>(&widget)) {
        const auto outlet = std::make_shared<TableView>();
        table->setTable(outlet);
        _syncs.emplace_back([table] { table->sync(); });
        view = outlet;
    } else if (auto* line = qobject_cast<QLineEdit*>(&widget)) {
        const auto outlet = std::make_shared<TextField>();
        const auto binding = std::make_shared<TextFieldBinding>(*line, outlet);
        _syncs.emplace_back([binding] { binding->sync(); });
        view = outlet;
    } else if (auto* button = qobject_cast<QAbstractButton*>(&widget)) {
        const auto outlet = std::make_shared<Button>(button->text().toStdString());
        QObject::connect(button, &QAbstractButton::clicked, button, [weak = std::weak_ptr(outlet)] {
            if (const auto pressed = weak.lock())
                pressed->press();
        });
        view = outlet;
    }
    if (!view)
        return;
    _root->addSubview(view);
    _outlets[widget.objectName().toStdString()] = view;
}

void UiInterface::sync()
{
    for (const auto& sync : _syncs)
        sync();
}

void UiInterface::pressBackground() const
{
    if (const auto view = _view.lock())
        view->press();
}

void UiInterface::pressButton(const char* name) const
{
    if (auto* button = _widget->findChild<QAbstractButton*>(QLatin1String(name)))
        button->click();
}

} // namespace orvane

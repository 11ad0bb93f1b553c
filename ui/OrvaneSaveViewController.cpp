#include "ui/OrvaneSaveViewController.h"

#include "platform/services/Services.h"
#include "screens/toolkit/Control.h"
#include "screens/toolkit/Screen.h"
#include "ui/SnapshotFile.h"

namespace orvane
{

namespace
{

constexpr const char* kCellIdentifier = "SaveHistoryContentCell";
constexpr const char* kDescriptionKey = "Description";

PropertyValue copyOf(const PropertyValue& array)
{
    PropertyValue copy = PropertyValue::newArray();
    if (const PropertyArray* elements = array.asArray())
        for (const PropertyValue& element : *elements)
            copy.asArray()->append(element);
    return copy;
}

std::string descriptionOf(const PropertyValue& entry)
{
    const PropertyDictionary* dictionary = entry.asDictionary();
    const PropertyValue description = dictionary ? (*dictionary)[kDescriptionKey] : PropertyValue();
    const std::string* text = description.asString();
    return text ? *text : "";
}

} // namespace

std::shared_ptr<OrvaneSaveViewController>
OrvaneSaveViewController::withSaveHistory(const PropertyValue& saveHistory, Shell& shell)
{
    std::shared_ptr<OrvaneSaveViewController> controller(new OrvaneSaveViewController(shell));
    controller->_interface = Screen::main().loadInterface(kInterfaceName);
    controller->_timeStamp = Services::current().clock().secondsSince1970();
    controller->_saveHistory = copyOf(saveHistory);
    return controller;
}

OrvaneSaveViewController::~OrvaneSaveViewController()
{
    // The front end may outlive this screen and still have these.
    if (_saveContentTable) {
        _saveContentTable->setDataSource(nullptr);
        _saveContentTable->setDelegate(nullptr);
    }
    if (_saveDescription)
        _saveDescription->setDelegate(nullptr);
    for (const char* name : {"saveButton", "cancelButton", "background"})
        if (const auto control = _interface ? _interface->outlet<Control>(name) : nullptr)
            control->setAction(nullptr);
}

std::shared_ptr<View> OrvaneSaveViewController::loadView()
{
    if (!_interface)
        return nullptr;
    _saveContentTable = _interface->outlet<TableView>("saveContentTable");
    _saveDescription = _interface->outlet<TextField>("saveDescription");
    const auto connect = [this](const char* name, void (OrvaneSaveViewController::*action)()) {
        if (const auto control = _interface->outlet<Control>(name))
            control->setAction([this, action] { (this->*action)(); });
    };
    connect("saveButton", &OrvaneSaveViewController::savePressed);
    connect("cancelButton", &OrvaneSaveViewController::cancelPressed);
    connect("background", &OrvaneSaveViewController::backgroundTouched);
    if (_saveContentTable) {
        _saveContentTable->setDataSource(this);
        _saveContentTable->setDelegate(this);
        _saveContentTable->reloadData();
    }
    return _interface->view();
}

void OrvaneSaveViewController::viewDidLoad()
{
    if (_saveDescription) {
        _saveDescription->setDelegate(this);
        _saveDescription->setText(_shell.unsavedDescription());
    }
    ViewController::viewDidLoad();
    if (_saveContentTable)
        _saveContentTable->sizeToFit();
}

void OrvaneSaveViewController::viewWillAppear(bool)
{
    if (view())
        view()->setFrame(Screen::main().applicationFrame());
}

void OrvaneSaveViewController::didReceiveMemoryWarning()
{
    ViewController::didReceiveMemoryWarning();
}

void OrvaneSaveViewController::viewDidUnload() { ViewController::viewDidUnload(); }

void OrvaneSaveViewController::savePressed()
{
    const std::string description = _saveDescription ? _saveDescription->text() : "";
    const SnapshotResult result =
        writeSnapshotFile(_shell.files(), _saveHistory, _timeStamp, description);
    _shell.setUnsavedDescription(result.isWritten ? "" : description);
    Screen::main().showAlert(
        result.isWritten
            ? std::make_unique<AlertView>(kSavedTitle, result.path, "Close")
            : std::make_unique<AlertView>(kFileErrorTitle, kFileErrorMessage, "Close"));
    closeSoon();
}

void OrvaneSaveViewController::cancelPressed()
{
    _shell.setUnsavedDescription("");
    closeSoon();
}

// Closes later: the action of the button, which runs now, still uses this object.
void OrvaneSaveViewController::closeSoon()
{
    _shell.mainQueue().async([&shell = _shell] { shell.closeSaveView(); });
}

bool OrvaneSaveViewController::textFieldShouldReturn(TextField& field)
{
    field.resignFirstResponder();
    return true;
}

bool OrvaneSaveViewController::resignFirstResponder()
{
    return !_saveDescription || _saveDescription->resignFirstResponder();
}

std::size_t OrvaneSaveViewController::numberOfSectionsInTableView(TableView&) { return 1; }

std::size_t OrvaneSaveViewController::numberOfRowsInSection(TableView&, std::size_t)
{
    return _saveHistory.asArray()->size();
}

std::shared_ptr<TableViewCell>
OrvaneSaveViewController::cellForRowAtIndexPath(TableView& table, const IndexPath& indexPath)
{
    const PropertyArray& entries = *_saveHistory.asArray();
    if (indexPath.row >= entries.size())
        return nullptr;
    auto cell = table.dequeueReusableCell(kCellIdentifier);
    if (!cell)
        cell = std::make_shared<TableViewCell>(CellStyle::Default, kCellIdentifier);
    cell->textLabel().setText(descriptionOf(entries[indexPath.row]));
    cell->textLabel().setFont({"Helvetica", 13.0, false});
    cell->setAccessory(CellAccessory::Checkmark);
    cell->layoutSubviews();
    return cell;
}

void OrvaneSaveViewController::didSelectRowAtIndexPath(TableView&, const std::optional<IndexPath>&)
{
    resignFirstResponder();
}

} // namespace orvane

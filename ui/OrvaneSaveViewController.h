#pragma once

#include "platform/base/PropertyValue.h"
#include "screens/toolkit/Interface.h"
#include "screens/toolkit/TableView.h"
#include "screens/toolkit/TextField.h"
#include "screens/toolkit/ViewController.h"
#include "ui/Shell.h"

#include <memory>

namespace orvane
{

// The modal screen on which the user saves a snapshot. It lists what will be saved, takes a
// description and writes the file.
//
// Its view comes from the interface file of the same name, with the parts "saveContentTable"
// (TableView), "saveDescription" (TextField), "saveButton", "cancelButton" (Button) and
// "background" (Control: receives presses outside of the other parts).
class OrvaneSaveViewController final : public ViewController,
                                       public TableViewDataSource,
                                       public TableViewDelegate,
                                       public TextFieldDelegate
{
public:
    static constexpr const char* kInterfaceName = "OrvaneSaveViewController";

    // Saves a copy of `saveHistory`, an array of dictionaries. The shell must outlive the screen.
    static std::shared_ptr<OrvaneSaveViewController>
    withSaveHistory(const PropertyValue& saveHistory, Shell& shell);
    ~OrvaneSaveViewController() override;

    // Null if the interface file lacks them.
    [[nodiscard]] TableView* saveContentTable() const { return _saveContentTable.get(); }
    [[nodiscard]] TextField* saveDescription() const { return _saveDescription.get(); }

    void savePressed();
    void cancelPressed();
    void backgroundTouched() { resignFirstResponder(); }
    bool textFieldShouldReturn(TextField& field) override;

    void viewDidLoad() override;
    void viewWillAppear(bool animated) override;
    void didReceiveMemoryWarning() override;
    void viewDidUnload() override;
    bool resignFirstResponder() override;

    std::size_t numberOfSectionsInTableView(TableView& table) override;
    std::size_t numberOfRowsInSection(TableView& table, std::size_t section) override;
    std::shared_ptr<TableViewCell> cellForRowAtIndexPath(TableView& table,
                                                         const IndexPath& indexPath) override;
    void didSelectRowAtIndexPath(TableView& table,
                                 const std::optional<IndexPath>& indexPath) override;

protected:
    [[nodiscard]] std::shared_ptr<View> loadView() override;

private:
    explicit OrvaneSaveViewController(Shell& shell) : _shell(shell) {}
    void closeSoon();

    Shell& _shell;
    double _timeStamp = 0; // seconds since 1970
    PropertyValue _saveHistory;
    std::unique_ptr<Interface> _interface;
    std::shared_ptr<TableView> _saveContentTable;
    std::shared_ptr<TextField> _saveDescription;
};

} // namespace orvane

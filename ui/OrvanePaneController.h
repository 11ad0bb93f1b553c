#pragma once

#include "screens/toolkit/TableViewController.h"
#include "ui/Shell.h"
#include "ui/tree/OrvaneModelNode.h"

#include <optional>
#include <string>

namespace orvane
{

// Shows one node of the display tree as a table with a row for each child. A group opens another
// pane; a value shows its key and value. The toolbar has the status with a busy indicator and, if
// saving is offered, a Save button.
class OrvanePaneController : public TableViewController
{
public:
    // Starts busy, with an empty status. The node may be null. The shell must outlive the pane.
    OrvanePaneController(NodePointer node, std::string path, Shell& shell);

    // The path of the node in the display tree; "/" for the root.
    [[nodiscard]] const std::string& path() const { return _keyPath; }
    // Shows another node; null for none.
    virtual void reloadWithNode(NodePointer node);
    // nullopt sets an empty status.
    virtual void setStatus(std::optional<std::string> text, bool isBusy);
    [[nodiscard]] const std::string& statusText() const { return status; }
    [[nodiscard]] bool isBusy() const { return isLoading; }

    // Builds the toolbar again.
    void createToolbarItems();

    void viewWillAppear(bool animated) override;
    void viewWillDisappear(bool animated) override;

    std::size_t numberOfRowsInSection(TableView& table, std::size_t section) override;
    std::shared_ptr<TableViewCell> cellForRowAtIndexPath(TableView& table,
                                                         const IndexPath& indexPath) override;
    void didSelectRowAtIndexPath(TableView& table,
                                 const std::optional<IndexPath>& indexPath) override;

private:
    [[nodiscard]] const OrvaneModelNode* nodeAt(const IndexPath& indexPath) const;
    [[nodiscard]] NodePointer sharedNodeAt(const IndexPath& indexPath) const;
    void showTitle();

    NodePointer _nodes;
    std::string _keyPath;
    std::string status;
    bool isLoading = true;
    Shell& _shell;
};

} // namespace orvane

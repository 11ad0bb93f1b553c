#pragma once

#include "screens/terminal/Page.h"
#include "screens/terminal/TableRows.h"
#include "screens/terminal/TextEditor.h"
#include "screens/toolkit/Control.h"
#include "screens/toolkit/Interface.h"
#include "screens/toolkit/TableView.h"
#include "screens/toolkit/TextField.h"

#include <memory>
#include <vector>

namespace orvane
{

// The save screen: a field for the description, the list of what will be saved, Save and Cancel.
class SaveForm final : public Page
{
public:
    static constexpr const char* kInterfaceName = "OrvaneSaveViewController";

    SaveForm();
    // With the outlets "saveContentTable", "saveDescription", "saveButton", "cancelButton" and
    // "background".
    [[nodiscard]] std::unique_ptr<Interface> interface() const;
    [[nodiscard]] const View* view() const { return _view.get(); }

    void draw(Canvas& canvas, Lines area) override;
    bool take(const Key& key) override;
    [[nodiscard]] std::vector<Hint> hints(const Marks& marks) const override;

private:
    enum class Focus { Description, Save, Cancel };

    void drawDescription(Canvas& canvas, int line);
    void drawContents(Canvas& canvas, Lines area);
    void drawButton(Canvas& canvas, int line, int column, const Button& button, Focus place);
    [[nodiscard]] bool isTyping() const { return _focus == Focus::Description; }
    void moveFocus(bool isForward);
    void setFocus(Focus focus);
    bool takeInDescription(const Key& key);

    std::shared_ptr<View> _view;
    std::shared_ptr<Control> _background;
    std::shared_ptr<TableView> _contents;
    std::shared_ptr<TextField> _description;
    std::shared_ptr<Button> _save;
    std::shared_ptr<Button> _cancel;
    TextEditor _editor;
    TableRows _rows;
    Focus _focus = Focus::Description;
};

} // namespace orvane

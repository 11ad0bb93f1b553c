#pragma once

#include "screens/toolkit/ScrollView.h"
#include "screens/toolkit/TableViewCell.h"

#include <memory>
#include <string>
#include <utility>

namespace orvane
{

// A row of a pane: a bold key at the left and, in value rows, the value at the right edge. If the
// row is too narrow for both, the value follows the key in a strip that scrolls sideways.
class OrvaneCell final : public TableViewCell
{
public:
    // A cell for a key alone. It has no value label and no strip.
    static std::shared_ptr<OrvaneCell> withStyleKey(CellStyle style, std::string reuseIdentifier);
    // A cell for a key and a value, both in the strip.
    static std::shared_ptr<OrvaneCell> withStyle(CellStyle style, std::string reuseIdentifier);

    [[nodiscard]] const std::shared_ptr<Label>& key() const { return _key; }
    void setKey(std::shared_ptr<Label> key) { _key = std::move(key); }
    // Null in a cell for a key alone.
    [[nodiscard]] const std::shared_ptr<Label>& value() const { return _value; }
    void setValue(std::shared_ptr<Label> value) { _value = std::move(value); }
    [[nodiscard]] const std::shared_ptr<ScrollView>& strip() const { return view; }

    // Sets the texts of those labels that the cell has.
    void setTexts(const std::string& keyText, const std::string& valueText);

    // Place the labels: setLayoutKey() for a key alone, setLayout() for key and value.
    void setLayoutKey();
    void setLayout();

private:
    OrvaneCell(CellStyle style, std::string reuseIdentifier)
        : TableViewCell(style, std::move(reuseIdentifier))
    {
    }

    std::shared_ptr<Label> _key;
    std::shared_ptr<Label> _value;
    std::shared_ptr<ScrollView> view;
};

} // namespace orvane

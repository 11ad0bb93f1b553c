#pragma once

#include "screens/toolkit/ScrollView.h"
#include "screens/toolkit/TableViewCell.h"

#include <memory>
#include <string>
#include <utility>

namespace orvane
{

// A row of a pane: a bold key at the left and, for value rows, the value at the right edge or,
// where the row is too narrow for that, after the key in a strip that scrolls sideways.
class OrvaneCell final : public TableViewCell
{
public:
    // A cell for a key alone: without a value label and without a strip.
    static std::shared_ptr<OrvaneCell> withStyleKey(CellStyle style, std::string reuseIdentifier);
    // A cell for a key and a value, both in the strip.
    static std::shared_ptr<OrvaneCell> withStyle(CellStyle style, std::string reuseIdentifier);

    [[nodiscard]] const std::shared_ptr<Label>& key() const { return _key; }
    void setKey(std::shared_ptr<Label> key) { _key = std::move(key); }
    // Null in a cell for a key alone.
    [[nodiscard]] const std::shared_ptr<Label>& value() const { return _value; }
    void setValue(std::shared_ptr<Label> value) { _value = std::move(value); }
    [[nodiscard]] const std::shared_ptr<ScrollView>& strip() const { return view; }

    // The texts of the labels that there are.
    void setTexts(const std::string& keyText, const std::string& valueText);

    // Put the labels where they belong, as a row of a key alone and as one of key and value.
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

#pragma once

#include "screens/toolkit/Label.h"

#include <memory>
#include <string>

namespace orvane
{

enum class CellStyle { Default = 0, Value = 1 };
enum class CellAccessory { None, DisclosureIndicator, Checkmark };

// A row of a table: a content view, and an accessory at its right.
class TableViewCell : public View
{
public:
    static constexpr double kDefaultHeight = 44;
    // The width kept free at the right of the content: a margin, or room for the accessory.
    static constexpr double kMargin = 10;
    static constexpr double kAccessoryWidth = 33;

    // As wide as the screen. A table gives it the table's width later.
    TableViewCell(CellStyle style, std::string reuseIdentifier);

    [[nodiscard]] CellStyle style() const { return _style; }
    [[nodiscard]] const std::string& reuseIdentifier() const { return _reuseIdentifier; }
    [[nodiscard]] CellAccessory accessory() const { return _accessory; }
    void setAccessory(CellAccessory accessory);
    [[nodiscard]] View& contentView() const { return *_contentView; }

    // The plain text of a default cell. Made and added to the content view at the first call.
    [[nodiscard]] Label& textLabel();
    [[nodiscard]] const Label* plainText() const { return _textLabel.get(); }

    // Places the content view beside the accessory, and the plain text in it.
    void layoutSubviews() override;

private:
    CellStyle _style;
    std::string _reuseIdentifier;
    CellAccessory _accessory = CellAccessory::None;
    std::shared_ptr<View> _contentView;
    std::shared_ptr<Label> _textLabel;
};

} // namespace orvane

#include "screens/toolkit/TableViewCell.h"

#include "screens/toolkit/Screen.h"

#include <utility>

namespace orvane
{

TableViewCell::TableViewCell(CellStyle style, std::string reuseIdentifier)
    : _style(style), _reuseIdentifier(std::move(reuseIdentifier)),
      _contentView(std::make_shared<View>())
{
    addSubview(_contentView);
    setFrame({0, 0, Screen::main().bounds().width, kDefaultHeight});
    TableViewCell::layoutSubviews();
}

void TableViewCell::setAccessory(CellAccessory accessory)
{
    if (_accessory == accessory)
        return;
    _accessory = accessory;
    changed();
}

Label& TableViewCell::textLabel()
{
    if (!_textLabel) {
        _textLabel = std::make_shared<Label>();
        _contentView->addSubview(_textLabel);
    }
    return *_textLabel;
}

void TableViewCell::layoutSubviews()
{
    const double kept = _accessory == CellAccessory::None ? kMargin : kAccessoryWidth;
    const double width = frame().width > kept ? frame().width - kept : 0;
    _contentView->setFrame({0, 0, width, frame().height});
    if (_textLabel)
        _textLabel->setFrame({kMargin, 0, width > kMargin ? width - kMargin : 0, frame().height});
}

} // namespace orvane

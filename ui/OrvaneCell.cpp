#include "ui/OrvaneCell.h"

#include "screens/toolkit/Screen.h"

namespace orvane
{

namespace
{

constexpr double kFontSize = 15.0;
constexpr double kLeftMargin = 10;
constexpr double kGap = 50;
// Deliberate: the strip has this height whatever the height of the row.
constexpr double kStripHeight = 50;

std::shared_ptr<Label> makeLabel(const Font& font)
{
    auto label = std::make_shared<Label>();
    label->setAlignment(TextAlignment::Left);
    label->setFont(font);
    return label;
}

// Deliberate: values are measured in the bold font too, although they are drawn in the regular one.
Size measured(const std::shared_ptr<Label>& label)
{
    return Screen::main().sizeWithFont(label ? label->text() : "", Font::boldSystem(kFontSize));
}

void place(const std::shared_ptr<Label>& label, double x, const Rect& bounds, const Size& size)
{
    if (label)
        label->setFrame({x, (bounds.height - size.height) * 0.5, size.width, size.height});
}

} // namespace

std::shared_ptr<OrvaneCell> OrvaneCell::withStyleKey(CellStyle style, std::string reuseIdentifier)
{
    const std::shared_ptr<OrvaneCell> cell(new OrvaneCell(style, std::move(reuseIdentifier)));
    cell->_key = makeLabel(Font::boldSystem(kFontSize));
    cell->contentView().addSubview(cell->_key);
    return cell;
}

std::shared_ptr<OrvaneCell> OrvaneCell::withStyle(CellStyle style, std::string reuseIdentifier)
{
    const std::shared_ptr<OrvaneCell> cell(new OrvaneCell(style, std::move(reuseIdentifier)));
    cell->_key = makeLabel(Font::boldSystem(kFontSize));
    cell->_value = makeLabel(Font::system(kFontSize));
    cell->view = std::make_shared<ScrollView>();
    cell->view->addSubview(cell->_key);
    cell->view->addSubview(cell->_value);
    cell->contentView().addSubview(cell->view);
    return cell;
}

void OrvaneCell::setTexts(const std::string& keyText, const std::string& valueText)
{
    if (_key)
        _key->setText(keyText);
    if (_value)
        _value->setText(valueText);
}

void OrvaneCell::setLayoutKey()
{
    layoutSubviews();
    const Rect bounds = contentView().bounds();
    place(_key, bounds.x + kLeftMargin, bounds, measured(_key));
}

void OrvaneCell::setLayout()
{
    setLayoutKey();
    const Rect bounds = contentView().bounds();
    const double keyWidth = measured(_key).width;
    const Size value = measured(_value);
    const double needed = keyWidth + kLeftMargin + kGap + value.width;
    // Deliberate: a value that fits exactly also stands after the key.
    const double x = needed < bounds.width ? bounds.width - value.width
                                           : bounds.x + kLeftMargin + keyWidth + kGap;
    place(_value, x, bounds, value);
    if (!view)
        return;
    const double contentWidth =
        needed > bounds.width ? bounds.width + keyWidth + value.width : bounds.width;
    view->setContentSize({contentWidth, kStripHeight});
    view->setFrame({bounds.x, bounds.y, bounds.width, kStripHeight});
}

} // namespace orvane

#include "screens/window/DrawnRow.h"

#include "screens/toolkit/ScrollView.h"
#include "screens/window/Fonts.h"
#include "screens/window/PlainText.h"

#include <QFontMetricsF>
#include <QStringList>

#include <algorithm>
#include <cmath>

namespace orvane
{

namespace
{

Qt::Alignment alignmentOf(const Label& label)
{
    switch (label.alignment()) {
    case TextAlignment::Left:
        break;
    case TextAlignment::Centre:
        return Qt::AlignHCenter;
    case TextAlignment::Right:
        return Qt::AlignRight;
    }
    return Qt::AlignLeft;
}

// Values at the right edge are measured a little too wide. Their digits line up only if they are
// drawn flush with that edge.
bool hangsAtRightEdge(const DrawnLabel& label, const DrawnStrip& strip)
{
    constexpr double kSamePlace = 0.01;
    return std::abs(strip.frame.width() - label.frame.right()) < kSamePlace;
}

QRectF frameAt(const View& view, const QPointF& origin)
{
    const Rect& frame = view.frame();
    return {origin.x() + frame.x, origin.y() + frame.y, frame.width, frame.height};
}

DrawnLabel labelOf(const Label& label, const QPointF& origin)
{
    return {frameAt(label, origin), lineOf(label.text()), fontFor(label.font()),
            alignmentOf(label) | Qt::AlignVCenter};
}

void collectLabels(const View& view, const QPointF& origin, std::vector<DrawnLabel>& labels)
{
    for (const auto& subview : view.subviews())
        if (const auto* label = dynamic_cast<const Label*>(subview.get()))
            labels.push_back(labelOf(*label, origin));
}

DrawnStrip stripOf(const ScrollView& view, const QPointF& origin)
{
    DrawnStrip strip{frameAt(view, origin), view.contentSize().width, {}};
    collectLabels(view, {}, strip.labels);
    for (DrawnLabel& label : strip.labels)
        if (hangsAtRightEdge(label, strip))
            label.alignment = Qt::AlignRight | Qt::AlignVCenter;
    return strip;
}

// Makes the letters smaller, then uses two lines, before the text is cut.
void fit(DrawnLabel& label)
{
    constexpr int kSmallest = 12;
    while (label.isCut() && label.font.pixelSize() > kSmallest)
        label.font.setPixelSize(label.font.pixelSize() - 1);
    if (!label.isCut())
        return;
    constexpr double kTwoLines = 36; // of the smallest letters, in a row
    const double middle = label.frame.center().y();
    const QRectF room(label.frame.left(), middle - kTwoLines / 2, label.frame.width(), kTwoLines);
    label.isWrapped =
        room.contains(QFontMetricsF(label.font)
                          .boundingRect(room, Qt::AlignVCenter | Qt::TextWordWrap, label.text));
    if (label.isWrapped)
        label.frame = room;
}

} // namespace

bool DrawnLabel::isCut() const
{
    constexpr double kSlack = 0.5; // measured as whole texts and drawn as lines
    return !isWrapped && sizeOfLine(text, font).width() > frame.width() + kSlack;
}

DrawnRow DrawnRow::of(TableViewCell& cell)
{
    cell.layoutSubviews();
    DrawnRow content;
    content.accessory = cell.accessory();
    const View& view = cell.contentView();
    const QPointF origin(view.frame().x, view.frame().y);
    collectLabels(view, origin, content.labels);
    // A text that is too long ends before the accessory.
    for (DrawnLabel& label : content.labels) {
        label.frame.setRight(std::min(label.frame.right(), origin.x() + view.frame().width));
        fit(label);
    }
    for (const auto& subview : view.subviews())
        if (const auto* strip = dynamic_cast<const ScrollView*>(subview.get()))
            content.strips.push_back(stripOf(*strip, origin));
    return content;
}

QString DrawnRow::key() const
{
    if (!labels.empty())
        return labels.front().text;
    return strips.empty() || strips.front().labels.empty() ? QString()
                                                           : strips.front().labels.front().text;
}

QString DrawnRow::spokenText() const
{
    QStringList texts;
    const auto add = [&texts](const std::vector<DrawnLabel>& spoken) {
        for (const DrawnLabel& label : spoken)
            if (!label.text.isEmpty())
                texts += label.text;
    };
    add(labels);
    for (const DrawnStrip& strip : strips)
        add(strip.labels);
    return texts.join(QLatin1String(", "));
}

QString DrawnRow::cutText() const
{
    const auto cut = std::find_if(labels.begin(), labels.end(),
                                  [](const DrawnLabel& label) { return label.isCut(); });
    return cut == labels.end() ? QString() : cut->text;
}

double DrawnRow::sidewaysRange() const
{
    double range = 0;
    for (const DrawnStrip& strip : strips)
        range = std::max(range, strip.contentWidth - strip.frame.width());
    return range;
}

} // namespace orvane

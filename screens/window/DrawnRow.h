#pragma once

#include "screens/toolkit/TableViewCell.h"

#include <QFont>
#include <QRectF>
#include <QString>

#include <vector>

namespace orvane
{

// A label as a row draws it, in the row's coordinates or in those of the strip that it is in.
struct DrawnLabel {
    QRectF frame;
    QString text;
    QFont font;
    Qt::Alignment alignment;
    bool isWrapped = false;           // between its words, into two lines
    [[nodiscard]] bool isCut() const; // for want of room
    friend bool operator==(const DrawnLabel&, const DrawnLabel&) = default;
};

// A part of a row that scrolls sideways.
struct DrawnStrip {
    QRectF frame;
    double contentWidth = 0;
    std::vector<DrawnLabel> labels;
    friend bool operator==(const DrawnStrip&, const DrawnStrip&) = default;
};

// What a row shows: a copy of its cell, so that the next one can be compared with it.
struct DrawnRow {
    std::vector<DrawnLabel> labels;
    std::vector<DrawnStrip> strips;
    CellAccessory accessory = CellAccessory::None;
    friend bool operator==(const DrawnRow&, const DrawnRow&) = default;

    // Lays the cell out first.
    static DrawnRow of(TableViewCell& cell);

    // The first text: what tells one row from another.
    [[nodiscard]] QString key() const;
    // All texts, as a screen reader speaks them: "KEY, VALUE".
    [[nodiscard]] QString spokenText() const;
    // What is not to be read in full, whatever is scrolled; empty for nothing.
    [[nodiscard]] QString cutText() const;
    // How far the row can be scrolled sideways.
    [[nodiscard]] double sidewaysRange() const;
};

} // namespace orvane

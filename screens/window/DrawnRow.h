#pragma once

#include "screens/toolkit/TableViewCell.h"

#include <QFont>
#include <QRectF>
#include <QString>

#include <vector>

namespace orvane
{

// A label as a row draws it, in the coordinates of the row or of the strip that holds it.
struct DrawnLabel {
    QRectF frame;
    QString text;
    QFont font;
    Qt::Alignment alignment;
    bool isWrapped = false;           // between its words, into two lines
    [[nodiscard]] bool isCut() const; // whether it is too long for its frame
    friend bool operator==(const DrawnLabel&, const DrawnLabel&) = default;
};

// A part of a row that scrolls sideways.
struct DrawnStrip {
    QRectF frame;
    double contentWidth = 0;
    std::vector<DrawnLabel> labels;
    friend bool operator==(const DrawnStrip&, const DrawnStrip&) = default;
};

// The contents of a row: a copy of its cell, to be compared with the next one.
struct DrawnRow {
    std::vector<DrawnLabel> labels;
    std::vector<DrawnStrip> strips;
    CellAccessory accessory = CellAccessory::None;
    friend bool operator==(const DrawnRow&, const DrawnRow&) = default;

    // Lays the cell out first.
    static DrawnRow of(TableViewCell& cell);

    // The first text, which identifies the row.
    [[nodiscard]] QString key() const;
    // All texts, as a screen reader speaks them: "KEY, VALUE".
    [[nodiscard]] QString spokenText() const;
    // The first label that is cut; empty if none is. Labels in strips can be scrolled and do not
    // count.
    [[nodiscard]] QString cutText() const;
    // How far the row can be scrolled sideways.
    [[nodiscard]] double sidewaysRange() const;
};

} // namespace orvane

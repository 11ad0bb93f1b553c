#pragma once

#include "screens/window/DrawnRow.h"

#include <QWidget>

#include <cstddef>

namespace orvane
{

// One visible row of a table. It only draws: the table handles presses, keys and scrolling. Setting
// a value that it has already does nothing.
class RowWidget final : public QWidget
{
public:
    explicit RowWidget(QWidget* table);

    [[nodiscard]] std::size_t row() const { return _row; }
    void setRow(std::size_t row) { _row = row; }

    [[nodiscard]] const DrawnRow& content() const { return _content; }
    void setContent(DrawnRow content);
    // How far its strips are scrolled, in points.
    [[nodiscard]] double sideways() const { return _sideways; }
    void setSideways(double offset);

    [[nodiscard]] bool isPressed() const { return _isPressed; }
    void setPressed(bool isPressed);
    [[nodiscard]] bool hasRing() const { return _hasRing; }
    void setRing(bool hasRing);

protected:
    void paintEvent(QPaintEvent* event) override;

private:
    void drawStrip(QPainter& painter, const DrawnStrip& strip, const QColor& background) const;

    std::size_t _row = 0;
    DrawnRow _content;
    double _sideways = 0;
    bool _isPressed = false;
    bool _hasRing = false;
};

} // namespace orvane

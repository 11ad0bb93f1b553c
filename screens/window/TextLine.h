#pragma once

#include <QWidget>

namespace orvane
{

// One line of plain text, cut with an ellipsis if there is not enough room. Setting the text that
// it shows already does nothing.
class TextLine final : public QWidget
{
public:
    explicit TextLine(QWidget* parent);

    [[nodiscard]] const QString& text() const { return _text; }
    void setText(const QString& text);
    void setLineFont(const QFont& font);
    void setAlignment(Qt::Alignment alignment) { _alignment = alignment; }
    // Uses the theme's colour for less important texts.
    void setQuiet(bool isQuiet) { _isQuiet = isQuiet; }

    [[nodiscard]] QSize sizeHint() const override;
    [[nodiscard]] QSize minimumSizeHint() const override;

protected:
    void paintEvent(QPaintEvent* event) override;

private:
    QString _text;
    Qt::Alignment _alignment = Qt::AlignLeft | Qt::AlignVCenter;
    bool _isQuiet = false;
};

} // namespace orvane

#pragma once

#include <QWidget>

namespace orvane
{

// One line of text, cut with an ellipsis where there is no room for it. Set to what it shows
// already, it does nothing.
class TextLine final : public QWidget
{
public:
    explicit TextLine(QWidget* parent);

    [[nodiscard]] const QString& text() const { return _text; }
    void setText(const QString& text);
    void setLineFont(const QFont& font);
    void setAlignment(Qt::Alignment alignment) { _alignment = alignment; }
    // In the theme's quieter colour.
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

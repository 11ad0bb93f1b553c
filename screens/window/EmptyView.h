#pragma once

#include <QFont>
#include <QWidget>

#include <vector>

namespace orvane
{

// Shown in place of a pane's rows while there are none: a sign and "No data yet". While the program
// waits for data it also says what it waits for and what the user can do.
class EmptyView final : public QWidget
{
public:
    // `hint` says what the user can do while the program waits; empty for nothing.
    EmptyView(QWidget* parent, const QString& hint);

    void setWaiting(bool isWaiting);
    // The paragraphs that are shown now, a line each.
    [[nodiscard]] QString text() const;

protected:
    void paintEvent(QPaintEvent* event) override;

private:
    struct Paragraph {
        QString text;
        QFont font;
        bool isQuiet = false;
    };

    [[nodiscard]] std::vector<Paragraph> paragraphs() const;

    QString _hint;
    bool _isWaiting = false;
};

} // namespace orvane

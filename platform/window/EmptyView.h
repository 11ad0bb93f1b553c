#pragma once

#include <QWidget>

class QLabel;

namespace orvane
{

// What stands where a pane has no rows: that there is no data yet and, while the program waits for
// some, what for and what the user can do.
class EmptyView final : public QWidget
{
public:
    EmptyView(QWidget* parent, const QString& hint);

    void setWaiting(bool isWaiting);
    [[nodiscard]] QString text() const;

protected:
    void changeEvent(QEvent* event) override;
    void paintEvent(QPaintEvent* event) override;

private:
    void applyTheme();

    QLabel* _title; // children
    QLabel* _reason;
    QLabel* _hint;
};

} // namespace orvane

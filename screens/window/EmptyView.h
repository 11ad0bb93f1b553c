#pragma once

#include <QWidget>

namespace orvane
{

class WrappedText;

// What stands where a pane has no rows: that there is no data yet and, while the program waits for
// some, what for and what the user can do.
class EmptyView final : public QWidget
{
public:
    EmptyView(QWidget* parent, const QString& hint);

    void setWaiting(bool isWaiting);
    [[nodiscard]] QString text() const;

protected:
    void paintEvent(QPaintEvent* event) override;

private:
    WrappedText* _title; // children
    WrappedText* _reason;
    WrappedText* _hint;
};

} // namespace orvane

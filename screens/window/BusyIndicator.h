#pragma once

#include <QTimer>
#include <QWidget>

namespace orvane
{

// An arc that turns while the program is busy.
class BusyIndicator final : public QWidget
{
public:
    explicit BusyIndicator(QWidget* parent);

    [[nodiscard]] bool isTurning() const { return _timer.isActive(); }
    void setTurning(bool isTurning);

    [[nodiscard]] QSize sizeHint() const override { return {20, 20}; }

protected:
    void paintEvent(QPaintEvent* event) override;

private:
    QTimer _timer;
};

} // namespace orvane

#pragma once

#include <QWidget>

#include <functional>

namespace orvane
{

class FlatButton;
class TextLine;

// The bar above a pane: its title, a button that goes back and, for simulated data, a mark under
// the title.
class TitleBar final : public QWidget
{
public:
    TitleBar(QWidget* parent, const QString& mark, std::function<void()> goBack);

    // At the root, `backTitle` is empty and `canGoBack` false.
    void show(const QString& title, bool canGoBack, const QString& backTitle);

    [[nodiscard]] FlatButton& backButton() const { return *_back; }
    [[nodiscard]] const QString& title() const;

protected:
    void resizeEvent(QResizeEvent* event) override;
    void paintEvent(QPaintEvent* event) override;

private:
    void placeParts();

    FlatButton* _back; // children
    TextLine* _title;
    QString _mark;
};

} // namespace orvane

#pragma once

#include "screens/terminal/Page.h"

#include <functional>
#include <string>
#include <vector>

namespace orvane
{

// An alert in the middle of the screen, over the other pages.
class AlertPage final : public Page
{
public:
    AlertPage(std::string title, std::string message, std::string button,
              std::function<void()> dismiss);

    void draw(Canvas& canvas, Lines area) override;
    bool take(const Key& key) override;
    [[nodiscard]] std::vector<Hint> hints(const Marks& marks) const override;

private:
    std::string _title;
    std::string _message;
    std::string _button;
    std::function<void()> _dismiss;
};

// A list of keys, which scrolls if it is longer than the screen.
class HelpPage final : public Page
{
public:
    HelpPage(std::vector<KeyHelp> keys, std::function<void()> close);

    void draw(Canvas& canvas, Lines area) override;
    bool take(const Key& key) override;
    [[nodiscard]] std::vector<Hint> hints(const Marks& marks) const override;

private:
    std::vector<KeyHelp> _keys;
    std::function<void()> _close;
    int _first = 0;
    int _most = 0; // the largest value of _first
};

} // namespace orvane

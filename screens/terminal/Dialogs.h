#pragma once

#include "screens/terminal/Page.h"

#include <functional>
#include <string>
#include <vector>

namespace orvane
{

// An alert in the middle of the screen, over what was there.
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

// The list of all keys, scrolled where it is longer than the screen.
class HelpPage final : public Page
{
public:
    HelpPage(bool hasPlayback, std::function<void()> close);

    void draw(Canvas& canvas, Lines area) override;
    bool take(const Key& key) override;
    [[nodiscard]] std::vector<Hint> hints(const Marks& marks) const override;

private:
    bool _hasPlayback;
    std::function<void()> _close;
    int _first = 0;
    int _most = 0; // that _first can be
};

} // namespace orvane

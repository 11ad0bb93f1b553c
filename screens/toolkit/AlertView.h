#pragma once

#include <string>
#include <utility>

namespace orvane
{

// A message in front of everything else. It stays until its one button is pressed, whatever happens
// behind it.
class AlertView
{
public:
    AlertView(std::string title, std::string message, std::string buttonTitle)
        : _title(std::move(title)), _message(std::move(message)),
          _buttonTitle(std::move(buttonTitle))
    {
    }

    [[nodiscard]] const std::string& title() const { return _title; }
    [[nodiscard]] const std::string& message() const { return _message; }
    [[nodiscard]] const std::string& buttonTitle() const { return _buttonTitle; }

private:
    std::string _title;
    std::string _message;
    std::string _buttonTitle;
};

} // namespace orvane

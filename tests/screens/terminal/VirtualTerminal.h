#pragma once

#include <chrono>
#include <functional>
#include <memory>
#include <optional>
#include <string>
#include <sys/types.h>
#include <vector>

namespace orvane
{

// Runs a program in a pseudo-terminal and shows its screen. The destructor kills the program.
class VirtualTerminal
{
public:
    static constexpr std::chrono::seconds kPatience{30};

    // arguments[0] is the program's path or a name on PATH. In `environment`, "NAME=VALUE" sets a
    // variable and "NAME" removes one.
    VirtualTerminal(const std::vector<std::string>& arguments,
                    const std::vector<std::string>& environment, int lines = 24, int columns = 80);
    ~VirtualTerminal();
    VirtualTerminal(const VirtualTerminal&) = delete;
    VirtualTerminal& operator=(const VirtualTerminal&) = delete;

    void send(const std::string& keys) const;
    void resize(int lines, int columns);
    void sendSignal(int signal) const;

    // Shows the output until that is true; false after the time-out or when the program ends.
    bool waitUntil(const std::function<bool()>& isTrue,
                   std::chrono::milliseconds timeout = kPatience);
    bool waitFor(const std::string& text)
    {
        return waitUntil([&] { return shows(text); });
    }
    bool waitForNo(const std::string& text)
    {
        return waitUntil([&] { return !shows(text); });
    }
    // The exit status, or minus the signal that ended it; nullopt after the time-out.
    std::optional<int> waitForEnd(std::chrono::milliseconds timeout = kPatience);

    [[nodiscard]] std::string line(int number) const;
    // All lines without trailing blanks.
    [[nodiscard]] std::string screen() const;
    [[nodiscard]] bool shows(const std::string& text) const;
    // The look of the first character of the text, where the text is first on the screen.
    [[nodiscard]] bool isBold(const std::string& text) const;
    [[nodiscard]] bool isReversed(const std::string& text) const;
    [[nodiscard]] bool isColoured(const std::string& text) const;

    // The terminal's state.
    [[nodiscard]] bool isOnOtherScreen() const;
    [[nodiscard]] bool isCursorVisible() const;
    [[nodiscard]] bool tellsOfMouse() const;
    // Whether the terminal echoes and edits lines, as a shell expects it.
    [[nodiscard]] bool isInLineMode() const;

    // All bytes that the program sent.
    [[nodiscard]] const std::string& received() const;

private:
    struct State;
    bool readSome(std::chrono::milliseconds timeout);

    std::unique_ptr<State> _state;
};

} // namespace orvane

#pragma once

#include "screens/terminal/TerminalDevice.h"

#include <memory>
#include <optional>

namespace orvane
{

// The terminal at standard input and output, drawn with ncurses for the kind that TERM names. Uses
// colours unless NO_COLOR is set. While it exists, lines to standard error on the same terminal are
// held back (HeldErrors), and every end of the process restores the terminal (RestoreGuard). One
// object at a time.
class CursesDevice final : public TerminalDevice
{
public:
    // Throws std::runtime_error if there is a terminalProblem().
    CursesDevice();
    ~CursesDevice() override;

    [[nodiscard]] int lines() const override;
    [[nodiscard]] int columns() const override;
    [[nodiscard]] bool hasMarks() const override;
    void show(const CellGrid& grid, CursorPlace cursor) override;
    std::optional<Key> readKey() override;
    [[nodiscard]] bool isGone() const override;
    void updateSize() override;
    void suspend() override;
    void retake() override;
    // Leaves the terminal as it was found, for good unless there is a retake().
    void giveBack();
    // False in the background, until a retake() in the foreground.
    [[nodiscard]] bool hasTerminal() const;

private:
    struct State;
    std::unique_ptr<State> _state;
};

} // namespace orvane

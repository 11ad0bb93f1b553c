#pragma once

#include "ui/tree/OrvaneModelNode.h"

#include <functional>
#include <optional>
#include <string>
#include <string_view>

namespace orvane
{

// What a front end that prints shows: one output for every change of the status and for every
// reload, a reload and the status that comes with it being one. Answers to commands are printed in
// between. JSON and text differ in the forms only.
class Printer
{
public:
    // Takes one finished output, newline included.
    using Write = std::function<void(std::string_view output)>;

    explicit Printer(Write write) : _write(std::move(write)) {}
    virtual ~Printer() = default;
    Printer(const Printer&) = default;
    Printer& operator=(const Printer&) = delete;

    // Another tree, or none: printed with the status that comes next.
    void reloadWithNode(NodePointer node);
    void setStatus(std::optional<std::string> status, bool isLoading);
    // Of recordings: the time of what is printed from now on, nothing where it has none.
    void setTime(std::optional<std::string> time);

    // What is said about the whole of what is printed, for people only.
    void showNote(const std::string& text);
    // A snapshot was saved to this path.
    void showSaved(const std::string& path);
    void showAlert(const std::string& title, const std::string& message);
    void showError(const std::string& text);

protected:
    [[nodiscard]] virtual std::string statusOutput(const std::string& status, bool isLoading,
                                                   const OrvaneModelNode* tree) const = 0;
    [[nodiscard]] virtual std::string savedOutput(const std::string& path) const = 0;
    [[nodiscard]] virtual std::string alertOutput(const std::string& title,
                                                  const std::string& message) const = 0;
    [[nodiscard]] virtual std::string errorOutput(const std::string& text) const = 0;
    [[nodiscard]] virtual std::string noteOutput(const std::string&) const { return ""; }

    [[nodiscard]] const std::optional<std::string>& time() const { return _time; }

private:
    Write _write;
    NodePointer _node;
    std::optional<std::string> _status;
    std::optional<std::string> _time;
    bool _isLoading = true;
    bool _isReloaded = false;
};

} // namespace orvane

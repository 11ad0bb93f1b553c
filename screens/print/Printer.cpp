#include "screens/print/Printer.h"

#include <utility>

namespace orvane
{

void Printer::reloadWithNode(NodePointer node)
{
    _node = std::move(node);
    // Printed with the status that comes next.
    _isReloaded = true;
}

void Printer::setStatus(std::optional<std::string> status, bool isLoading)
{
    std::string text = std::move(status).value_or("");
    if (!_isReloaded && _status == text && _isLoading == isLoading)
        return;
    _isReloaded = false;
    _isLoading = isLoading;
    _status = std::move(text);
    _write(statusOutput(*_status, _isLoading, _node.get()));
}

void Printer::setTime(std::optional<std::string> time) { _time = std::move(time); }

void Printer::showNote(const std::string& text)
{
    if (const std::string output = noteOutput(text); !output.empty())
        _write(output);
}

void Printer::showSaved(const std::string& path) { _write(savedOutput(path)); }

void Printer::showAlert(const std::string& title, const std::string& message)
{
    _write(alertOutput(title, message));
}

void Printer::showError(const std::string& text) { _write(errorOutput(text)); }

} // namespace orvane

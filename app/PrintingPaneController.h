#pragma once

#include "screens/print/OutputPane.h"
#include "ui/OrvanePaneController.h"

#include <utility>

namespace orvane
{

// The root pane of a front end that prints: shows everything on an output too, in the order in
// which it happens.
class PrintingPaneController final : public OrvanePaneController
{
public:
    // Both are referred to and must outlive the pane.
    PrintingPaneController(Shell& shell, OutputPane& output)
        : OrvanePaneController(nullptr, "/", shell), _output(output)
    {
    }

    void reloadWithNode(NodePointer node) override
    {
        OrvanePaneController::reloadWithNode(node);
        _output.reloadWithNode(std::move(node));
    }
    void setStatus(std::optional<std::string> text, bool isBusy) override
    {
        OrvanePaneController::setStatus(text, isBusy);
        _output.setStatus(std::move(text), isBusy);
    }

private:
    OutputPane& _output;
};

} // namespace orvane

#pragma once

#include "app/LiveApp.h"
#include "screens/print/Printer.h"

namespace orvane
{

// The live view on a printer: every tree and every status, in the order in which they come.
class PrintingApp final : public LiveApp
{
public:
    // The printer too is referred to and must outlive the application.
    PrintingApp(ModelEnvironment environment, const FileSystem& files,
                PreferencesStore& preferences, Printer& printer)
        : LiveApp(std::move(environment), files, preferences), _printer(printer)
    {
    }

private:
    void beginShowing(const Status& first) override
    {
        show(first);
        showStatus();
    }
    void endShowing() override {}
    void showTree() override { _printer.reloadWithNode(model()->topLevelNodes()); }
    void showStatus() override { show(status()); }
    [[nodiscard]] std::optional<bool> showsBusy() const override { return _isBusy; }

    void show(const Status& status)
    {
        _isBusy = status.isBusy;
        _printer.setStatus(status.text, status.isBusy);
    }

    Printer& _printer;
    std::optional<bool> _isBusy; // as printed last
};

} // namespace orvane

#pragma once

#include "app/LiveApp.h"
#include "screens/print/Printer.h"

#include <functional>

namespace orvane
{

// The live view on a printer: every tree and every status, in the order in which they come. Or
// once: only the first tree that has a row, with its status.
class PrintingApp final : public LiveApp
{
public:
    // The printer must outlive the application, too. With `printedOnce`, prints once and then calls
    // it.
    PrintingApp(ModelEnvironment environment, const FileSystem& files,
                PreferencesStore& preferences, Printer& printer,
                std::function<void()> printedOnce = nullptr)
        : LiveApp(std::move(environment), files, preferences), _printer(printer),
          _printedOnce(std::move(printedOnce)), _isOnce(_printedOnce != nullptr)
    {
    }

private:
    void beginShowing(const Status& first) override
    {
        show(first);
        showStatus();
    }
    void endShowing() override {}
    void showTree() override;
    void showStatus() override { show(status()); }
    [[nodiscard]] std::optional<bool> showsBusy() const override { return _isBusy; }

    void show(const Status& status);

    Printer& _printer;
    std::function<void()> _printedOnce; // null once it was called
    const bool _isOnce;
    bool _hasRows = false;       // in the tree that is shown
    std::optional<bool> _isBusy; // as printed last
};

} // namespace orvane

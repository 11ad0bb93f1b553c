#pragma once

#include "platform/services/FileSystem.h"
#include "platform/services/MainQueue.h"

#include <string>
#include <utility>

namespace orvane
{

// The parts of the application that panes and the save screen use.
class Shell
{
public:
    virtual ~Shell() = default;
    // Whether saving is offered.
    [[nodiscard]] virtual bool allowSaveButton() const = 0;
    // Open and close the save screen. Do nothing if it is open, or closed, already.
    virtual void showSaveView() = 0;
    virtual void closeSaveView() = 0;

    [[nodiscard]] virtual MainQueue& mainQueue() = 0;
    [[nodiscard]] virtual const FileSystem& files() const = 0;

    // What the user typed for a save that failed: the save screen begins with it the next time.
    [[nodiscard]] const std::string& unsavedDescription() const { return _unsavedDescription; }
    void setUnsavedDescription(std::string text) { _unsavedDescription = std::move(text); }

private:
    std::string _unsavedDescription;
};

} // namespace orvane

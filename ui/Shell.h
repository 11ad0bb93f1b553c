#pragma once

#include "platform/services/FileSystem.h"
#include "platform/services/MainQueue.h"

#include <string>
#include <utility>

namespace orvane
{

// What panes and the save screen ask of the application that they are part of.
class Shell
{
public:
    virtual ~Shell() = default;
    // Whether saving is offered.
    [[nodiscard]] virtual bool allowSaveButton() const = 0;
    // Opens the save screen: nothing while it is open. Closes it: nothing while it is not.
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

#pragma once

#include "doubles/ManualMainQueue.h"
#include "ui/Shell.h"

#include <string>
#include <vector>

namespace orvane
{

// A shell that records what it is asked for.
class FakeShell final : public Shell
{
public:
    explicit FakeShell(std::string root = "/") : _files(std::move(root)) {}

    [[nodiscard]] bool allowSaveButton() const override { return isSavingOffered; }
    void showSaveView() override { notes.push_back("show"); }
    void closeSaveView() override { notes.push_back("close"); }
    [[nodiscard]] MainQueue& mainQueue() override { return queue; }
    [[nodiscard]] const FileSystem& files() const override { return _files; }

    bool isSavingOffered = true;
    std::vector<std::string> notes;
    ManualMainQueue queue;

private:
    FileSystem _files;
};

} // namespace orvane

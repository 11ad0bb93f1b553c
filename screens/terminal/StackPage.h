#pragma once

#include "screens/terminal/Chrome.h"
#include "screens/terminal/Page.h"
#include "screens/terminal/PlaybackLine.h"
#include "screens/terminal/TableRows.h"
#include "screens/toolkit/NavigationController.h"

#include <functional>
#include <map>
#include <memory>
#include <optional>
#include <string>
#include <vector>

namespace orvane
{

class Playback;
class TableViewController;

// The navigation stack: the rows of its top controller's table, the controls of a recording, and
// the toolbar as a status line.
class StackPage final : public Page
{
public:
    // What to do while a table is empty and something is being waited for.
    explicit StackPage(std::string waitingHint) : _waitingHint(std::move(waitingHint)) {}

    // What is shown from now on; neither is owned, both may be null.
    void show(NavigationController* stack, Playback* playback);

    void draw(Canvas& canvas, Lines area) override;
    bool take(const Key& key) override;
    [[nodiscard]] std::vector<Hint> hints(const Marks& marks) const override;
    bool drawPrompt(Canvas& canvas, int line) override;

    // The keys that do something in the pane in front as it is now.
    [[nodiscard]] std::vector<KeyHelp> keys() const;
    [[nodiscard]] std::vector<Crumb> crumbs() const;
    // The columns that rows take: not more than is easy to read, unless a value needs them.
    [[nodiscard]] int rowColumns(int columns) const;
    // Whether a busy indicator turns in what was drawn last.
    [[nodiscard]] bool isBusy() const { return _isBusy; }
    // How often refreshes have changed values that are marked since, until they are forgotten.
    [[nodiscard]] std::size_t changeCount() const;
    void forgetChanges();

private:
    using TableKey = std::weak_ptr<ViewController>;

    void updateTables(int columns, int lines);
    void drawRows(Canvas& canvas, Lines area);
    void drawStatus(Canvas& canvas, int line);
    [[nodiscard]] std::vector<std::string> emptyText() const;
    [[nodiscard]] TableViewController* top() const;
    [[nodiscard]] TableRows* rows();
    [[nodiscard]] const TableRows* rows() const;

    bool takeCharacter(char32_t character);
    void takeInFilter(const Key& key);
    void openFilter();
    bool openSelected();
    void clickPlace(std::size_t place);
    [[nodiscard]] bool canGoBack() const;
    bool goBack();
    bool leave();
    bool save() const;

    std::string _waitingHint;
    NavigationController* _stack = nullptr;
    Playback* _playback = nullptr;
    PlaybackLine _playbackLine;
    std::map<TableKey, TableRows, std::owner_less<TableKey>> _rows;
    TableKey _lastTop;
    std::optional<TextEditor> _filterEditor; // while one types
    bool _isBusy = false;
};

} // namespace orvane

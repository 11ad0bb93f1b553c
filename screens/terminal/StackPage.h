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

// The navigation stack: the rows of the top controller's table, the controls of a recording, and
// the toolbar as a status line.
class StackPage final : public Page
{
public:
    // `waitingHint` says what the user can do while the program waits for data.
    explicit StackPage(std::string waitingHint) : _waitingHint(std::move(waitingHint)) {}

    // Shows these from now on. Neither is owned; both may be null.
    void show(NavigationController* stack, Playback* playback);

    void draw(Canvas& canvas, Lines area) override;
    bool take(const Key& key) override;
    [[nodiscard]] std::vector<Hint> hints(const Marks& marks) const override;
    bool drawPrompt(Canvas& canvas, int line) override;

    // The keys that do something in the pane in front as it is now.
    [[nodiscard]] std::vector<KeyHelp> keys() const;
    [[nodiscard]] std::vector<Crumb> crumbs() const;
    // The width of the rows: at most TableRows::kReadableColumns unless a value needs more.
    [[nodiscard]] int rowColumns(int columns) const;
    // Whether a busy indicator was drawn last.
    [[nodiscard]] bool isBusy() const { return _isBusy; }
    // The number of refreshes that changed values. These stay marked until forgetChanges().
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
    std::optional<TextEditor> _filterEditor; // while the filter is typed
    bool _isBusy = false;
};

} // namespace orvane

#pragma once

#include "screens/terminal/Canvas.h"
#include "screens/terminal/Page.h"
#include "screens/terminal/TextEditor.h"

#include <optional>
#include <string>
#include <vector>

namespace orvane
{

class Playback;

// The controls of a recording: a line with its position, a second one for remarks about the file,
// and keys.
class PlaybackLine
{
public:
    // All operations do nothing where there is no recording.
    [[nodiscard]] static int linesNeeded(const Playback* playback);
    static void draw(Canvas& canvas, Lines area, Playback* playback);
    // The keys that work now.
    static void addKeys(std::vector<KeyHelp>& keys, const Playback* playback);
    static void addHints(std::vector<Hint>& hints, const Playback* playback);
    bool take(const Key& key, Playback* playback);

    // The time to jump to is being typed.
    [[nodiscard]] bool hasPrompt() const { return _prompt.has_value(); }
    void drawPrompt(Canvas& canvas, int line);

private:
    void takeInPrompt(const Key& key, Playback& playback);

    std::optional<TextEditor> _prompt;
    bool _isRefused = false; // the typed text is not a time
};

} // namespace orvane

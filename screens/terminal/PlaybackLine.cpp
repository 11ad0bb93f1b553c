#include "screens/terminal/PlaybackLine.h"

#include "screens/terminal/LineWidth.h"
#include "screens/toolkit/Playback.h"

#include <algorithm>
#include <cmath>
#include <cstdio>
#include <iterator>

namespace orvane
{

namespace
{

constexpr int kNarrowestBar = 10;

std::string durationText(double seconds)
{
    const auto whole = static_cast<long>(std::floor(std::max(seconds, 0.0)));
    char text[32];
    if (whole >= 3600)
        std::snprintf(text, sizeof text, "%ld:%02ld:%02ld", whole / 3600, whole / 60 % 60,
                      whole % 60);
    else
        std::snprintf(text, sizeof text, "%ld:%02ld", whole / 60, whole % 60);
    return text;
}

bool isReading(const Playback& playback) { return playback.progress() < 1; }

void drawBar(Canvas& canvas, int line, CellGrid::Span span, double fraction)
{
    const int width = span.end - span.first;
    const int done = static_cast<int>(std::lround(std::clamp(fraction, 0.0, 1.0) * width));
    for (int i = 0; i < width; ++i)
        canvas.grid.put(line, span.first + i,
                        i < done ? canvas.marks.barDone : canvas.marks.barLeft,
                        {i < done ? Ink::Mark : Ink::Quiet, false});
}

void drawReading(Canvas& canvas, int line, const Playback& playback)
{
    const int percent = static_cast<int>(std::clamp(playback.progress(), 0.0, 1.0) * 100);
    const std::string share = std::to_string(percent) + " %";
    const int start = canvas.grid.put(line, 1, "Reading the file ", {Ink::Status, false}) + 1;
    const int end = canvas.columns() - 2 - columnsOf(share);
    drawBar(canvas, line, {start, std::max(start, end - 1)}, playback.progress());
    canvas.grid.put(line, end, share, {Ink::Status, false});
}

void drawPosition(Canvas& canvas, int line, Playback& playback)
{
    const Style plain{Ink::Status, false};
    const std::string& mark = playback.isPlaying() ? canvas.marks.play : canvas.marks.pause;
    int start = canvas.grid.put(line, 1, mark, {Ink::Mark, false});
    start = canvas.grid.put(line, start,
                            (playback.isPlaying() ? " playing " : " paused ") +
                                std::to_string(std::lround(playback.speed())) + "x",
                            plain);
    start += 2;
    std::string times = durationText(playback.position()) + " / " +
                        durationText(playback.duration()) + "  " + playback.positionText();
    int end = canvas.columns() - 1 - columnsOf(times);
    if (end < start) {
        times = playback.positionText();
        end = canvas.columns() - 1 - columnsOf(times);
    }
    canvas.grid.put(line, std::max(start, end), times, plain);
    end -= 2;
    const double duration = playback.duration();
    if (end - start < kNarrowestBar || duration <= 0)
        return;
    drawBar(canvas, line, {start, end}, playback.position() / duration);
    canvas.onClick({line, 1}, {start, end}, [&playback, duration, width = end - start](int column) {
        playback.jumpTo(duration * column / std::max(width - 1, 1));
    });
}

bool takeWhilePlayable(char32_t character, Playback& playback)
{
    switch (character) {
    case ' ':
        if (playback.isPlaying())
            playback.pause();
        else
            playback.play();
        return true;
    case '.':
        playback.step();
        return true;
    case ',':
        playback.stepBack();
        return true;
    case '+':
    case '=':
        playback.faster();
        return true;
    case '-':
        playback.slower();
        return true;
    case '0':
        playback.jumpTo(0);
        return true;
    case 'G':
        playback.jumpToEnd();
        return true;
    case 'n':
        playback.jumpToNextServingCell();
        return true;
    default:
        return false;
    }
}

} // namespace

int PlaybackLine::linesNeeded(const Playback* playback)
{
    if (!playback)
        return 0;
    return playback->remark().empty() ? 1 : 2;
}

void PlaybackLine::draw(Canvas& canvas, Lines area, Playback* playback)
{
    if (!playback || area.count < 1)
        return;
    if (isReading(*playback))
        drawReading(canvas, area.first, *playback);
    else
        drawPosition(canvas, area.first, *playback);
    if (area.count > 1)
        canvas.grid.put(area.first + 1, 1,
                        shortened(playback->remark(), canvas.columns() - 2, canvas.marks.cut),
                        {Ink::Warning, false});
}

void PlaybackLine::addKeys(std::vector<KeyHelp>& keys, const Playback* playback)
{
    if (!playback)
        return;
    if (isReading(*playback)) {
        keys.push_back({"x", "stop reading the file"});
        return;
    }
    const KeyHelp all[] = {
        {"Space", "play, pause"      },
        {". ,",   "a step on, back"  },
        {"+ -",   "faster, slower"   },
        {"g",     "go to a time"     },
        {"n",     "next serving cell"},
        {"0 G",   "start, end"       },
    };
    keys.insert(keys.end(), std::begin(all), std::end(all));
}

void PlaybackLine::addHints(std::vector<Hint>& hints, const Playback* playback)
{
    if (!playback)
        return;
    if (isReading(*playback)) {
        hints.push_back({"x", "stop reading", keyOfCharacter('x')});
        return;
    }
    hints.push_back({"Space", playback->isPlaying() ? "pause" : "play", keyOfCharacter(' ')});
    hints.push_back({"g", "go to time", keyOfCharacter('g')});
    hints.push_back({"n", "next cell", keyOfCharacter('n')});
    hints.push_back({".", "step", keyOfCharacter('.')});
    hints.push_back({"+", "faster", keyOfCharacter('+')});
}

bool PlaybackLine::take(const Key& key, Playback* playback)
{
    if (!playback)
        return false;
    if (_prompt) {
        takeInPrompt(key, *playback);
        return true;
    }
    if (key.kind != Key::Kind::Character)
        return false;
    if (isReading(*playback)) {
        if (key.character == 'x')
            playback->stopReading();
        return key.character == 'x';
    }
    if (key.character == 'g') {
        _prompt.emplace();
        _isRefused = false;
        return true;
    }
    return takeWhilePlayable(key.character, *playback);
}

void PlaybackLine::takeInPrompt(const Key& key, Playback& playback)
{
    if (key.kind == Key::Kind::Enter) {
        _isRefused = !_prompt->text().empty() && !playback.jumpToText(_prompt->text());
        if (!_isRefused)
            _prompt.reset();
    } else if (key.kind == Key::Kind::Escape ||
               (key.kind == Key::Kind::Backspace && _prompt->text().empty())) {
        _prompt.reset();
    } else if (_prompt->take(key)) {
        _isRefused = false;
    }
}

void PlaybackLine::drawPrompt(Canvas& canvas, int line)
{
    const std::string advice =
        _isRefused ? "not a time: 10:04:30 or +90" : "10:04:30, or +90 seconds";
    const int start = canvas.grid.put(line, 1, "Go to time: ", {Ink::StatusKey, false});
    int end = canvas.columns() - 1;
    if (end - start > columnsOf(advice) + 12) {
        end -= columnsOf(advice);
        canvas.grid.put(line, end, advice, {_isRefused ? Ink::Warning : Ink::Quiet, false});
        end -= 2;
    }
    _prompt->draw(canvas, line, {start, end}, {Ink::Status, false});
}

} // namespace orvane

#include "platform/services/ProgressLine.h"

#include "platform/base/Utf8.h"

#include <algorithm>
#include <utility>

namespace orvane
{

ProgressLine::ProgressLine(std::string_view task, Write write)
    : _task(printableText(task)), _write(std::move(write))
{
}

ProgressLine::~ProgressLine() { show(1); }

void ProgressLine::show(double done)
{
    std::string text;
    if (done < 1)
        text = _task + ": " + std::to_string(static_cast<int>(std::max(done, 0.0) * 100)) + " %";
    if (text == _shown)
        return;
    // Blanks over it: not every terminal can erase.
    _write("\r" + (text.empty() ? std::string(_shown.size(), ' ') + "\r" : text));
    _shown = std::move(text);
}

} // namespace orvane

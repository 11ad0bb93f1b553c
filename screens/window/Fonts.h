#pragma once

#include "screens/toolkit/Font.h"

#include <QFont>
#include <QSizeF>
#include <QString>

#include <string_view>

namespace orvane
{

// The toolkit's fonts as the window draws them: sizes in points that are pixels at 1x. The system's
// font is the desktop's, unless its figures differ in width; then one whose figures line up.
QFont fontFor(const Font& font);

// A text as one line, as it is drawn and measured: line ends are spaces, and what no screen could
// show of a very long text is cut off.
QString lineOf(std::string_view text);

// How large the text is as one line.
QSizeF sizeOfLine(const QString& line, const QFont& font);

} // namespace orvane

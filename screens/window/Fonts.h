#pragma once

#include "screens/toolkit/Font.h"

#include <QFont>
#include <QSizeF>
#include <QString>

namespace orvane
{

// The toolkit's font as the window draws it; a point is a pixel at scale 1. The system font is the
// desktop's if all its digits are equally wide, else a font whose digits are.
QFont fontFor(const Font& font);

// The size of the text on one line.
QSizeF sizeOfLine(const QString& line, const QFont& font);

} // namespace orvane

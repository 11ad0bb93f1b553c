#pragma once

#include "screens/toolkit/Geometry.h"

#include <cmath>

namespace orvane
{

// The toolkit's points on a terminal: a column is 10 of them, a line of text 20, and a table's row
// one line.
inline constexpr double kPointsOfColumn = 10;
inline constexpr double kPointsOfText = 20;
inline constexpr double kPointsOfRow = 44;

inline int columnsOfPoints(double points)
{
    return static_cast<int>(std::floor(points / kPointsOfColumn));
}
inline double pointsOfColumns(int columns) { return kPointsOfColumn * columns; }
inline Rect rectOfCells(int columns, int lines)
{
    return {0, 0, pointsOfColumns(columns), kPointsOfRow * lines};
}

} // namespace orvane

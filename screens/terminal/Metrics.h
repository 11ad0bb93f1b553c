#pragma once

#include "screens/toolkit/Geometry.h"

#include <cmath>

namespace orvane
{

// Points of the toolkit on a terminal: a column is 10 points wide, a text 20 points high, and a row
// of a table, which takes one line, 44 points high.
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

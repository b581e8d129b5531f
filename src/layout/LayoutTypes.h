// The small shared types of the layout engine: integer points and rectangles, and the tab data a
// frame reports about its panels.
#pragma once

#include "host/core/Geometry.h"

#include <string>
#include <utility>
#include <vector>

namespace orvworkspace::workspace {

using PointT = orvcore::geom::Point;
using RectT = orvcore::geom::Rect;
using PointF = orvcore::geom::PointF;
using RectF = orvcore::geom::RectF;

// Pairs of UTF-8 strings describing a frame's tabs; the first string of each pair is a tab type.
using TabDataList = std::vector<std::pair<std::string, std::string>>;

} // namespace orvworkspace::workspace

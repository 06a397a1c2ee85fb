#pragma once

#include <QString>

namespace gridbay::shell {

class MapCanvas;

// Writes the part of a map that is shown: to a picture (png) of twice the screen's resolution, a drawing
// (svg) or a page (pdf), by the file's ending. What is wrong, or empty.
QString exportMap(const MapCanvas& canvas, const QString& path);

}  // namespace gridbay::shell

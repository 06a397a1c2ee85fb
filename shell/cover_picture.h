#pragma once

#include <QPainter>
#include <QString>

namespace gridbay::shell {

// Draws the picture of a cover page to fill a rectangle: "nested-grids" or "wetland". A name that is not
// known is drawn as the first.
void drawCoverPicture(QPainter& painter, const QRectF& rect, const QString& name, bool dark);

}  // namespace gridbay::shell

#include "shell/map/map_export.h"

#include <QCoreApplication>
#include <QFile>
#include <QFileInfo>
#include <QPdfWriter>
#include <QSaveFile>
#include <QSvgGenerator>

#include "shell/map/map_canvas.h"

namespace gridbay::shell {
namespace {

constexpr int kFiner = 2;  // pixels of the export for one of the screen

QString tr(const char* text) {
  return QCoreApplication::translate("MapExport", text);
}

// In the pixels of the screen, whatever the painter's device.
void draw(QPainter& painter, const MapCanvas& canvas) {
  const MapFrame& frame = canvas.frame();
  painter.setClipRect(QRectF({0, 0}, frame.size));
  canvas.backgrounds().paint(painter, frame, false);
  if (canvas.drawing().layers.test(placeOf(MapLayer::terrain)) && !canvas.terrain().empty()) {
    TerrainRequest request{canvas.terrain(), frame, canvas.terrainStyle()};
    request.frame.size *= kFiner;
    request.frame.metresPerPixel /= kFiner;
    request.style.scale = canvas.scale();
    for (const TerrainArea& area : request.areas) area.values->open({});
    if (const auto picture = paintTerrain(request, 1, [] { return false; }))
      painter.drawImage(picture->frame.in(frame), picture->image);
  }
  canvas.backgrounds().paint(painter, frame, true);
  canvas.drawing().paint(painter, frame);
  canvas.drawing().paintLegend(painter, frame, canvas.terrainStyle(),
                               canvas.terrain().empty() ? std::nullopt : canvas.scale());
}

bool writePicture(const MapCanvas& canvas, QIODevice& file) {
  QImage image((canvas.frame().size * kFiner).toSize(), QImage::Format_RGB32);
  image.fill(Qt::white);
  image.setDevicePixelRatio(kFiner);
  QPainter painter(&image);
  draw(painter, canvas);
  return painter.end() && image.save(&file, "PNG");
}

bool writeDrawing(const MapCanvas& canvas, QIODevice& file) {
  QSvgGenerator drawing;
  drawing.setOutputDevice(&file);
  drawing.setSize(canvas.frame().size.toSize());
  drawing.setViewBox(QRectF({0, 0}, canvas.frame().size));
  drawing.setTitle(tr("Map"));
  QPainter painter;
  if (!painter.begin(&drawing)) return false;
  draw(painter, canvas);
  return painter.end();
}

bool writePage(const MapCanvas& canvas, QIODevice& file) {
  QPdfWriter page(&file);
  const QSizeF size = canvas.frame().size;
  page.setPageSize(QPageSize(QPageSize::A4));
  page.setPageOrientation(size.width() > size.height() ? QPageLayout::Landscape : QPageLayout::Portrait);
  page.setTitle(tr("Map"));
  QPainter painter;
  if (!painter.begin(&page)) return false;
  const QRect room = painter.viewport();
  const double scale = std::min(room.width() / size.width(), room.height() / size.height());
  painter.scale(scale, scale);
  // As large as on the screen, though the device counts in finer dots.
  QFont font = painter.font();
  font.setPixelSize(12);
  painter.setFont(font);
  draw(painter, canvas);
  return painter.end();
}

}  // namespace

QString exportMap(const MapCanvas& canvas, const QString& path) {
  const QString ending = QFileInfo(path).suffix().toLower();
  bool (*write)(const MapCanvas&, QIODevice&) = ending == "png"   ? writePicture
                                                : ending == "svg" ? writeDrawing
                                                : ending == "pdf" ? writePage
                                                                  : nullptr;
  if (write == nullptr) return tr("A map is exported to a file that ends in .png, .svg or .pdf.");
  QSaveFile file(path);
  if (!file.open(QIODevice::WriteOnly)) return tr("cannot write \"%1\": %2").arg(path, file.errorString());
  if (!write(canvas, file) || !file.commit())
    return tr("cannot write \"%1\": %2").arg(path, file.errorString());
  return {};
}

}  // namespace gridbay::shell

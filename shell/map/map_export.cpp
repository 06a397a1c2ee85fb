#include "shell/map/map_export.h"

#include <QCoreApplication>
#include <QFile>
#include <QFileInfo>
#include <QPdfWriter>
#include <QSaveFile>
#include <QSvgGenerator>

namespace gridbay::shell {
namespace {

constexpr int kFiner = 2;  // pixels of the export for one of the screen

QString tr(const char* text) {
  return QCoreApplication::translate("MapExport", text);
}

// What is written: what is drawn of which part of the map, and the terrain there, if any.
struct Shown {
  const MapDrawing& drawing;
  const TerrainStyle& style;
  MapFrame frame;
  std::span<const MapBackground> below;
  std::span<const MapBackground> above;
  const std::optional<TerrainPicture>& terrain;
};

// In the pixels of the screen, whatever the painter's device.
void draw(QPainter& painter, const Shown& shown) {
  const auto& [drawing, style, frame, below, above, terrain] = shown;
  painter.setClipRect(QRectF({0, 0}, frame.size));
  paintBackgrounds(painter, frame, below);
  if (terrain) painter.drawImage(terrain->frame.in(frame), terrain->image);
  paintBackgrounds(painter, frame, above);
  drawing.paint(painter, frame);
  drawing.paintLegend(painter, frame, style, terrain ? std::optional(terrain->scale) : std::nullopt);
}

bool writePicture(const Shown& shown, QIODevice& file) {
  QImage image((shown.frame.size * kFiner).toSize(), QImage::Format_RGB32);
  image.fill(Qt::white);
  image.setDevicePixelRatio(kFiner);
  QPainter painter(&image);
  draw(painter, shown);
  return painter.end() && image.save(&file, "PNG");
}

bool writeDrawing(const Shown& shown, QIODevice& file) {
  QSvgGenerator drawing;
  drawing.setOutputDevice(&file);
  drawing.setSize(shown.frame.size.toSize());
  drawing.setViewBox(QRectF({0, 0}, shown.frame.size));
  drawing.setTitle(tr("Map"));
  QPainter painter;
  if (!painter.begin(&drawing)) return false;
  draw(painter, shown);
  return painter.end();
}

bool writePage(const Shown& shown, QIODevice& file) {
  QPdfWriter page(&file);
  const QSizeF size = shown.frame.size;
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
  draw(painter, shown);
  return painter.end();
}

using Write = bool (*)(const Shown&, QIODevice&);

// Null for another ending.
Write writerOf(const QString& path) {
  const QString ending = QFileInfo(path).suffix().toLower();
  return ending == "png"   ? writePicture
         : ending == "svg" ? writeDrawing
         : ending == "pdf" ? writePage
                           : nullptr;
}

}  // namespace

MapExport::MapExport(MapCanvas& canvas) : QObject(&canvas), canvas_(canvas) {
  constexpr int kMoment = 20;  // milliseconds
  timer_.setInterval(kMoment);
  connect(&timer_, &QTimer::timeout, this, &MapExport::look);
}

void MapExport::begin(const QString& path) {
  cancel();
  path_ = path;
  if (writerOf(path) == nullptr)
    return end(tr("A map is exported to a file that ends in .png, .svg or .pdf."));
  frame_ = canvas_.frame();
  style_ = canvas_.terrainStyle();
  drawing_.layers = canvas_.drawing().layers;
  drawing_.selection = canvas_.drawing().selection;
  drawing_.marks = canvas_.drawing().marks;
  drawing_.setScene(canvas_.scene());
  backgrounds_ = canvas_.backgrounds().all();
  below_ = canvas_.backgrounds().below();
  if (drawing_.layers.test(placeOf(MapLayer::terrain))) terrain_ = canvas_.terrain();
  if (!terrain_.empty()) {
    TerrainRequest request{terrain_, frame_, style_};
    request.frame.size *= kFiner;
    request.frame.metresPerPixel /= kFiner;
    if (!request.style.scale) request.style.scale = canvas_.scale();
    worker_ = std::make_unique<TerrainWorker>(nullptr);
    connect(worker_.get(), &TerrainWorker::painted, this, [this](const TerrainPicture& picture) {
      if (picture.isFinal) picture_ = picture;
    });
    worker_->paint(std::move(request));
  }
  timer_.start();
  emit progressed(path_, 0);
}

void MapExport::cancel() {
  timer_.stop();
  worker_.reset();
  picture_.reset();
  terrain_.clear();
  backgrounds_.clear();
  MapBackgrounds& backgrounds = canvas_.backgrounds();
  if (canvas_.editor() != nullptr && !path_.isEmpty() && !(backgrounds.frame() == canvas_.frame()))
    backgrounds.request(canvas_.frame(), canvas_.scene().projectionText);
}

double MapExport::done() const {
  constexpr double kOpening = 0.9;  // of the whole
  double points = 0;
  double opened = 0;
  for (const TerrainArea& area : terrain_) {
    const double all = static_cast<double>(area.values->columns()) * static_cast<double>(area.values->rows());
    points += all;
    opened += all * area.values->progress();
  }
  return points > 0 ? kOpening * opened / points : kOpening;
}

void MapExport::look() {
  MapBackgrounds& backgrounds = canvas_.backgrounds();
  if (terrain_.empty() || picture_) {
    if (!(backgrounds.frame() == frame_)) {  // the map has moved on
      backgrounds.request(frame_, drawing_.scene().projectionText);
    } else if (backgrounds.isSettled()) {
      return end(write());
    }
  }
  emit progressed(path_, done());
}

QString MapExport::write() {
  for (MapBackground& each : backgrounds_) {
    // One that is hidden or shows another raster by now is drawn as it was.
    const MapBackground* now = canvas_.backgrounds().of(each.id);
    const bool isSame =
        now != nullptr && now->isShown && (each.raster.isEmpty() || now->raster == each.raster);
    if (isSame) each.picture = now->picture;
  }
  QSaveFile file(path_);
  if (!file.open(QIODevice::WriteOnly)) return tr("cannot write \"%1\": %2").arg(path_, file.errorString());
  const std::span all(backgrounds_);
  const Shown shown{drawing_, style_, frame_, all.first(below_), all.subspan(below_), picture_};
  if (!writerOf(path_)(shown, file) || !file.commit())
    return tr("cannot write \"%1\": %2").arg(path_, file.errorString());
  return {};
}

void MapExport::end(const QString& fault) {
  cancel();
  emit ended(path_, fault);
}

}  // namespace gridbay::shell

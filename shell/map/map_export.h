#pragma once

#include <QObject>
#include <QTimer>
#include <memory>
#include <optional>

#include "shell/map/map_canvas.h"

namespace gridbay::shell {

// Writes the part of a map that is shown: to a picture (png) of twice the screen's resolution, a drawing
// (svg) or a page (pdf), by the file's ending. The terrain is opened and painted in a thread of its own,
// and backgrounds are waited for. All is as it was shown at the begin, whatever is changed meanwhile.
class MapExport final : public QObject {
  Q_OBJECT
 public:
  explicit MapExport(MapCanvas& canvas);

  void begin(const QString& path);
  // Nothing is written, and nothing told any more.
  void cancel();
  bool isRunning() const { return timer_.isActive(); }

 signals:
  // How much is done, 0 to 1, of what takes more than a moment.
  void progressed(const QString& path, double done);
  // What is wrong, or empty.
  void ended(const QString& path, const QString& fault);

 private:
  void look();
  double done() const;
  void end(const QString& fault);
  QString write();

  MapCanvas& canvas_;
  QTimer timer_;
  QString path_;
  MapFrame frame_;
  MapDrawing drawing_;
  TerrainStyle style_;
  std::vector<MapBackground> backgrounds_;
  std::size_t below_ = 0;             // of the backgrounds, below the terrain
  std::vector<TerrainArea> terrain_;  // that is in the picture
  std::unique_ptr<TerrainWorker> worker_;
  std::optional<TerrainPicture> picture_;
};

}  // namespace gridbay::shell

#pragma once

#include <QObject>
#include <QTimer>
#include <memory>
#include <optional>

#include "shell/map/map_canvas.h"

namespace gridbay::shell {

// Writes the part of a map that is shown: to a picture (png) of twice the screen's resolution, a drawing
// (svg) or a page (pdf), by the file's ending. The terrain is opened and painted in a thread of its own,
// and backgrounds are waited for.
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
  QString write() const;

  MapCanvas& canvas_;
  QTimer timer_;
  QString path_;
  MapFrame frame_;
  std::vector<TerrainArea> terrain_;  // that is in the picture
  std::unique_ptr<TerrainWorker> worker_;
  std::optional<TerrainPicture> picture_;
};

}  // namespace gridbay::shell

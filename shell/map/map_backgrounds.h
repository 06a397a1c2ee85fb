#pragma once

#include <QPainter>
#include <QVariantList>
#include <optional>
#include <span>
#include <vector>

#include "shell/map/background_copies.h"

namespace gridbay::shell {

// A raster or vector file that is drawn with the map.
struct MapBackground {
  int id = 0;
  QString path;
  bool isShown = true;
  double opacity = 1;
  QColor colour;        // of points and lines
  QString raster = {};  // of several in the file, the one that is shown; empty until it is known
  QStringList rasters = {};
  // Lines go above the terrain and pictures below it, unless the user has said otherwise.
  bool hasPlace = false;
  bool needsCopy = false;  // it is read from a copy
  std::optional<BackgroundPicture> picture = {};
};

// Draws their pictures, the later ones on top.
void paintBackgrounds(QPainter& painter, const MapFrame& frame, std::span<const MapBackground> backgrounds);

// The backgrounds of a map, from the bottom to the top, and the pictures of them: the last one is shown in
// its place until a newer one has been painted.
class MapBackgrounds final : public QObject {
  Q_OBJECT
 public:
  explicit MapBackgrounds(QObject* parent);

  const std::vector<MapBackground>& all() const { return all_; }
  // How many of them lie below the terrain.
  std::size_t below() const { return below_; }
  const MapBackground* of(int id) const;
  // What is told of one, as a line for people; empty where nothing is.
  static QString told(const MapBackground& background);
  void add(const QString& path);
  void remove(int id);
  // A place up or down; the terrain counts as one.
  void move(int id, bool isUp);
  void setShown(int id, bool isShown);
  void setOpacity(int id, double opacity);
  void setColour(int id, const QColor& colour);
  // Another one of the rasters in its file, by the name.
  void setRaster(int id, const QString& name);
  // Stops the reading of files that takes long; they are not shown any more.
  void stopReading();

  // All of it as the settings hold it.
  QVariantList saved() const;
  void restore(const QVariantList& saved);

  // Asks for pictures of a frame, in pixels of the screen.
  void request(const MapFrame& frame, const std::string& projection);
  // Those above the terrain, or those below it.
  void paint(QPainter& painter, const MapFrame& frame, bool above) const;
  const MapFrame& frame() const { return frame_; }  // that was asked for last
  bool isSettled() const { return (worker_ == nullptr || worker_->isIdle()) && copies_.isIdle(); }

 signals:
  // The list, or what is told of an entry.
  void changed();
  // There is another picture.
  void painted();
  // Long reading is going on: of what, and how much is done, 0 to 1.
  void reading(const QString& path, double done);
  void readingEnded();

 private:
  void take(BackgroundPicture picture);
  void takeFault(MapBackground& background, BackgroundPicture picture) const;
  // No picture, but why there is none.
  void fail(int id, const QString& why);
  void requestAgain();
  std::size_t placeOf(int id) const;

  std::vector<MapBackground> all_;
  std::size_t below_ = 0;
  int lastId_ = 0;
  BackgroundWorker* worker_ = nullptr;  // once there is something to show
  MapFrame frame_;
  std::string projection_;
  BackgroundCopies copies_;
};

}  // namespace gridbay::shell

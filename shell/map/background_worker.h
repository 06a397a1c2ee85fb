#pragma once

#include <QColor>
#include <QImage>
#include <QObject>
#include <condition_variable>
#include <map>
#include <mutex>
#include <optional>
#include <thread>
#include <vector>

#include "conversion/background.h"
#include "shell/map/map_frame.h"

namespace gridbay::shell {

struct BackgroundSource {
  int id = 0;  // goes to the picture
  QString path;
  QString raster;  // of several in the file, by its name; empty for the first that has a place
  QColor colour;   // of points and lines
  QString copy;    // what is read in its place, where it has one
};

struct BackgroundRequest {
  std::vector<BackgroundSource> sources;
  MapFrame frame;  // its size is that of the pictures
  std::string projection;
};

struct BackgroundPicture {
  int id = 0;
  QImage image;  // clear where there is nothing; none where there is a fault
  MapFrame frame;
  bool isRaster = true;
  QString fault;           // why it can't be shown
  QString notice;          // what is to be told of it
  bool needsCopy = false;  // it can be read from a copy alone, and there is none: no picture
  QStringList rasters;     // in the file, where there are several
  QString raster;          // the one that is shown
  std::string projection;  // of the map
};

// The upper left corner and the pixels of a frame.
BackgroundFrame pixelsOf(const MapFrame& frame);

// Reads backgrounds and paints them in a thread of its own. A newer request takes the place of an older one,
// which ends where it is.
class BackgroundWorker final : public QObject {
  Q_OBJECT
 public:
  explicit BackgroundWorker(QObject* parent);
  ~BackgroundWorker() override;

  void paint(BackgroundRequest request);
  bool isIdle() const;

 signals:
  void painted(const gridbay::shell::BackgroundPicture& picture);

 private:
  struct Opened {
    std::unique_ptr<Background> background;
    QString fault;
    bool needsCopy = false;
  };
  void work(const std::stop_token& stop);
  std::optional<BackgroundRequest> next(const std::stop_token& stop);
  // Nothing when cancelled.
  Opened* openedOf(const BackgroundSource& source, const std::string& projection,
                   const std::function<bool()>& isCancelled);
  void deliver(BackgroundPicture picture);

  mutable std::mutex mutex_;
  std::condition_variable_any wake_;
  std::optional<BackgroundRequest> request_;
  bool atWork_ = false;
  int undelivered_ = 0;
  // Of the thread alone.
  std::map<QString, Opened> opened_;  // by what opens them
  std::string projection_;
  std::jthread thread_;
};

}  // namespace gridbay::shell

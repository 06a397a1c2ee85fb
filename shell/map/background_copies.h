#pragma once

#include <QObject>
#include <QTemporaryDir>
#include <QTimer>
#include <map>
#include <memory>
#include <optional>
#include <vector>

#include "shell/background_work.h"
#include "shell/map/background_worker.h"

namespace gridbay::shell {

// Copies of backgrounds that can't be read beside the window, each made in a copy of the process, two at
// once. They are of the part of the map that was asked for where a file is large, and are gone with this.
class BackgroundCopies final : public QObject {
  Q_OBJECT
 public:
  explicit BackgroundCopies(QObject* parent);

  // The copy of a source that is shown on a frame; empty until there is one. Where that is of another part,
  // or too coarse, a better one follows. One that is being made of another raster is given up.
  QString of(const BackgroundSource& source, const MapFrame& frame, const std::string& projection);
  const RasterNames& rastersOf(int id) const;
  // Why there is no better copy than the one there is; empty where nothing has failed.
  QString faultOf(int id) const;
  void forget(int id);
  void forgetAll();
  // Ends what is going on and what was to follow: of these sources.
  std::vector<int> stop();
  bool isIdle() const;

 signals:
  void made(int id);
  void failed(int id, const QString& why);
  // Each that begins, and how much is done of the one at work, the first of several, 0 to 1.
  void progressed(int id, double done);
  // There is nothing more to do.
  void ended();

 private:
  struct Wanted {
    BackgroundSource source;
    MapFrame frame;
    std::string projection;
  };
  struct Copy {
    std::optional<Wanted> wanted;
    std::optional<Wanted> made;  // what it was made for
    BackgroundCopy is;
    QString before;                // the file that it has replaced, which may be in use still
    std::optional<Wanted> failed;  // for what there is none
    QString why;
    Wanted atWork;
    QString making;                             // the file at work, without its ending; empty for none
    std::unique_ptr<BackgroundWork> work = {};  // goes before the files do
  };
  static bool isOf(const Copy& copy, const Wanted& wanted);
  static bool suits(const Copy& copy, const Wanted& wanted);
  static bool isAtWorkFor(const Copy& copy, const Wanted& wanted);
  static void giveUp(Copy& copy);
  // The first one that is at work; 0 for none.
  int firstAtWork() const;
  void beginNext();
  void begin(int id, Copy& copy);
  void take(int id, const std::optional<std::string>& bytes);
  void fail(int id, Copy& copy, const QString& why);

  std::unique_ptr<QTemporaryDir> folder_;  // goes after the work that writes into it
  QTimer next_;
  std::map<int, Copy> copies_;
  int count_ = 0;
};

}  // namespace gridbay::shell

#pragma once

#include <QObject>
#include <QTemporaryDir>
#include <QTimer>
#include <functional>
#include <map>
#include <memory>
#include <optional>
#include <vector>

#include "shell/background_work.h"
#include "shell/map/background_worker.h"

namespace gridbay::shell {

// Copies of backgrounds that can't be read beside the window, made one after the other in a copy of the
// process. They are of the part of the map that was asked for where a file is large, and are gone with this.
class BackgroundCopies final : public QObject {
  Q_OBJECT
 public:
  // `mayBegin` tells whether no library is at work in a thread, as it must not be when the process is copied.
  BackgroundCopies(std::function<bool()> mayBegin, QObject* parent);

  // The copy of a source that is shown on a frame; empty until there is one. Where that is of another part,
  // or too coarse, a better one follows.
  QString of(const BackgroundSource& source, const MapFrame& frame, const std::string& projection);
  const RasterNames& rastersOf(int id) const;
  void forget(int id);
  void forgetAll();
  // Ends what is going on and what was to follow: of these sources.
  std::vector<int> stop();
  bool isIdle() const { return current_ == 0 && !isWaiting(); }

 signals:
  void made(int id);
  void failed(int id, const QString& why);
  // How much is done of the one that is at work, 0 to 1.
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
  };
  static bool isOf(const Copy& copy, const Wanted& wanted);
  static bool suits(const Copy& copy, const Wanted& wanted);
  bool isWaiting() const;
  void beginNext();
  void take(const std::optional<std::string>& bytes);

  std::function<bool()> mayBegin_;
  std::unique_ptr<QTemporaryDir> folder_;  // goes after the work that writes into it
  BackgroundWork work_;
  QTimer retry_;
  std::map<int, Copy> copies_;
  int current_ = 0;  // the one that is at work; 0 for none
  Wanted atWork_;
  int count_ = 0;
};

}  // namespace gridbay::shell

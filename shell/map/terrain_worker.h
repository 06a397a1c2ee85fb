#pragma once

#include <QObject>
#include <condition_variable>
#include <mutex>
#include <optional>
#include <thread>

#include "shell/map/terrain_picture.h"

namespace gridbay::shell {

// Opens grids and paints terrain in a thread of its own: of each request a coarse picture at once, and then
// the fine one. A newer request takes the place of one that is not begun, and ends the fine one that is at
// work; pictures of the whole map are never left out.
class TerrainWorker final : public QObject {
  Q_OBJECT
 public:
  explicit TerrainWorker(QObject* parent);
  ~TerrainWorker() override;

  void paint(TerrainRequest request);
  bool isIdle() const;

 signals:
  void painted(const gridbay::shell::TerrainPicture& picture);

 private:
  void work(const std::stop_token& stop);
  bool openGrids(const TerrainRequest& request, const std::function<bool()>& isStopped);
  bool isUnwanted(const TerrainGrid& grid) const;
  std::optional<TerrainRequest> next(const std::stop_token& stop);
  void deliver(TerrainPicture picture);

  mutable std::mutex mutex_;
  std::condition_variable_any wake_;
  std::optional<TerrainRequest> view_;
  std::optional<TerrainRequest> base_;
  bool atWork_ = false;
  int undelivered_ = 0;
  std::jthread thread_;
};

}  // namespace gridbay::shell

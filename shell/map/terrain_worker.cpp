#include "shell/map/terrain_worker.h"

#include <QElapsedTimer>
#include <algorithm>
#include <utility>

namespace gridbay::shell {

TerrainWorker::TerrainWorker(QObject* parent)
    : QObject(parent), thread_([this](const std::stop_token& stop) { work(stop); }) {}

TerrainWorker::~TerrainWorker() {
  thread_.request_stop();
  thread_.join();
}

void TerrainWorker::paint(TerrainRequest request) {
  {
    const std::lock_guard lock(mutex_);
    (request.isBase ? base_ : view_) = std::move(request);
  }
  wake_.notify_one();
}

bool TerrainWorker::isIdle() const {
  const std::lock_guard lock(mutex_);
  return !view_ && !base_ && !atWork_ && undelivered_ == 0;
}

std::optional<TerrainRequest> TerrainWorker::next(const std::stop_token& stop) {
  std::unique_lock lock(mutex_);
  atWork_ = false;
  if (!wake_.wait(lock, stop, [this] { return view_ || base_; })) return std::nullopt;
  atWork_ = true;
  return std::exchange(view_ ? view_ : base_, std::nullopt);
}

// Whether the view that is asked for now has other grids alone.
bool TerrainWorker::isUnwanted(const TerrainGrid& grid) const {
  const std::lock_guard lock(mutex_);
  return view_ && std::ranges::none_of(
                      view_->areas, [&grid](const TerrainArea& area) { return area.values.get() == &grid; });
}

void TerrainWorker::deliver(TerrainPicture picture) {
  {
    const std::lock_guard lock(mutex_);
    ++undelivered_;
  }
  QMetaObject::invokeMethod(
      this,
      [this, picture = std::move(picture)] {
        {
          const std::lock_guard lock(mutex_);
          --undelivered_;
        }
        emit painted(picture);
      },
      Qt::QueuedConnection);
}

// The smaller ones first. Where it takes a while, what is open by then is shown. False when stopped.
bool TerrainWorker::openGrids(const TerrainRequest& request, const std::function<bool()>& isStopped) {
  constexpr int kCoarse = 4;
  constexpr qint64 kWhile = 100;  // milliseconds
  std::vector<TerrainGrid*> grids;
  for (const TerrainArea& area : request.areas) {
    if (!area.values->isTried()) grids.push_back(area.values.get());
  }
  std::ranges::sort(grids, {}, [](const TerrainGrid* grid) { return grid->columns() * grid->rows(); });
  QElapsedTimer timer;
  timer.start();
  for (TerrainGrid* grid : grids) {
    if (timer.elapsed() > kWhile && grid != grids.front() && !request.isBase) {
      if (auto picture = paintTerrain(request, kCoarse, isStopped)) deliver(*std::move(picture));
      timer.restart();
    }
    // Another setup's map does not wait for it.
    grid->open([&] { return isStopped() || isUnwanted(*grid); });
    if (isStopped()) return false;
  }
  return true;
}

void TerrainWorker::work(const std::stop_token& stop) {
  constexpr int kCoarse = 4;
  while (std::optional<TerrainRequest> request = next(stop)) {
    const auto isStopped = [&stop] { return stop.stop_requested(); };
    const auto isOutOfDate = [this, &stop] {
      if (stop.stop_requested()) return true;
      const std::lock_guard lock(mutex_);
      return view_.has_value();
    };
    const bool isBase = request->isBase;
    if (!openGrids(*request, isStopped)) return;
    std::optional<TerrainPicture> coarse = paintTerrain(*request, kCoarse, isStopped);
    if (!coarse) return;
    // The fine picture has the colours of the coarse one.
    request->style.scale = coarse->scale;
    deliver(*std::move(coarse));
    if (isBase) continue;
    if (std::optional<TerrainPicture> fine = paintTerrain(*request, 1, isOutOfDate))
      deliver(*std::move(fine));
  }
}

}  // namespace gridbay::shell

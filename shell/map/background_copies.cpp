#include "shell/map/background_copies.h"

#include <QDir>
#include <QFile>
#include <QFileInfo>
#include <algorithm>
#include <utility>

#include "shell/work_results.h"

namespace gridbay::shell {
namespace {

// With all that its library has put beside it.
void removeCopy(const QString& path) {
  if (path.isEmpty()) return;
  const QFileInfo copy(path);
  for (const QFileInfo& each : copy.dir().entryInfoList({copy.baseName() + ".*"}, QDir::Files))
    QFile::remove(each.filePath());
}

}  // namespace

BackgroundCopies::BackgroundCopies(QObject* parent) : QObject(parent) {
  next_.setSingleShot(true);
  next_.setInterval(0);
  connect(&next_, &QTimer::timeout, this, &BackgroundCopies::beginNext);
}

bool BackgroundCopies::isOf(const Copy& copy, const Wanted& wanted) {
  const QString& raster = wanted.source.raster;
  return copy.made && copy.made->projection == wanted.projection &&
         (copy.made->source.raster == raster || copy.is.rasters.shown == raster.toStdString());
}

// A copy reaches as far as its frame on each side of it, and is as fine as that.
bool BackgroundCopies::suits(const Copy& copy, const Wanted& wanted) {
  if (!isOf(copy, wanted)) return false;
  const Wanted& made = *copy.made;
  constexpr double kFiner = 2;
  const bool isFine = copy.is.isFull || made.frame.metresPerPixel <= kFiner * wanted.frame.metresPerPixel;
  const QSizeF size = made.frame.size;
  const QRectF reach(QPointF(-size.width(), -size.height()), 3 * size);
  return isFine && (copy.is.isWhole || reach.contains(wanted.frame.in(made.frame)));
}

// Before the first copy of a file the raster that it shows has no name yet.
bool BackgroundCopies::isAtWorkFor(const Copy& copy, const Wanted& wanted) {
  const auto nameOf = [&copy](const Wanted& each) {
    return each.source.raster.isEmpty() ? QString::fromStdString(copy.is.rasters.shown) : each.source.raster;
  };
  return nameOf(copy.atWork) == nameOf(wanted) && copy.atWork.projection == wanted.projection;
}

QString BackgroundCopies::of(const BackgroundSource& source, const MapFrame& frame,
                             const std::string& projection) {
  Copy& copy = copies_[source.id];
  const Wanted wanted{source, frame, projection};
  const bool isFaulty =
      copy.failed && copy.failed->source.raster == source.raster && copy.failed->projection == projection;
  if (!isFaulty) copy.failed.reset();  // it was of another raster or projection
  if (!copy.making.isEmpty() && !isAtWorkFor(copy, wanted)) giveUp(copy);
  if (suits(copy, wanted)) {
    copy.wanted.reset();
  } else if (!isFaulty) {
    copy.wanted = wanted;
    next_.start();
  }
  return isOf(copy, wanted) ? QString::fromStdString(copy.is.file) : QString();
}

const RasterNames& BackgroundCopies::rastersOf(int id) const {
  return copies_.at(id).is.rasters;
}

QString BackgroundCopies::faultOf(int id) const {
  const auto found = copies_.find(id);
  return found != copies_.end() && found->second.failed ? found->second.why : QString();
}

int BackgroundCopies::firstAtWork() const {
  const auto first =
      std::ranges::find_if(copies_, [](const auto& each) { return !each.second.making.isEmpty(); });
  return first == copies_.end() ? 0 : first->first;
}

bool BackgroundCopies::isIdle() const {
  return firstAtWork() == 0 &&
         std::ranges::none_of(copies_, [](const auto& each) { return each.second.wanted.has_value(); });
}

void BackgroundCopies::beginNext() {
  constexpr std::ptrdiff_t kAtOnce = 2;
  const auto isAtWork = [](const auto& each) { return !each.second.making.isEmpty(); };
  const auto isNext = [&](const auto& each) { return each.second.wanted.has_value() && !isAtWork(each); };
  while (std::ranges::count_if(copies_, isAtWork) < kAtOnce) {
    const auto next = std::ranges::find_if(copies_, isNext);
    if (next == copies_.end()) break;
    begin(next->first, next->second);
  }
  if (isIdle()) emit ended();
}

void BackgroundCopies::begin(int id, Copy& copy) {
  copy.atWork = *std::exchange(copy.wanted, std::nullopt);
  if (folder_ == nullptr) folder_ = std::make_unique<QTemporaryDir>();
  if (!folder_->isValid()) {
    const QString why = folder_->errorString();
    folder_.reset();
    return fail(id, copy, tr("cannot make a temporary folder: %1").arg(why));
  }
  copy.making = folder_->filePath(QString::number(++count_));
  if (copy.work == nullptr) {
    copy.work = std::make_unique<BackgroundWork>(nullptr);
    connect(copy.work.get(), &BackgroundWork::progressed, this, [this, id](double done) {
      if (id == firstAtWork()) emit progressed(id, done);
    });
    connect(copy.work.get(), &BackgroundWork::ended, this,
            [this, id](const std::optional<std::string>& bytes) { take(id, bytes); });
  }
  copy.work->begin(
      [wanted = copy.atWork, made = copy.making.toStdString()](const WorkApart::Progress& progress) {
        return packed(copyBackground(wanted.source.path.toStdString(), wanted.source.raster.toStdString(),
                                     wanted.projection, pixelsOf(wanted.frame), made, progress));
      });
  emit progressed(id, 0);
}

void BackgroundCopies::take(int id, const std::optional<std::string>& bytes) {
  Copy& copy = copies_.at(id);
  Result<BackgroundCopy> made = bytes ? unpackedCopy(*bytes)
                                      : Failure{"cannot show \"" + copy.atWork.source.path.toStdString() +
                                                "\": its reader came to a sudden end"};
  if (made) {
    removeCopy(std::exchange(copy.before, QString::fromStdString(copy.is.file)));
    copy.is = std::move(*made);
    copy.made = copy.atWork;
    copy.making.clear();
    copy.failed.reset();
    if (copy.wanted && suits(copy, *copy.wanted)) copy.wanted.reset();
    emit this->made(id);
  } else {
    giveUp(copy);
    fail(id, copy, QString::fromStdString(made.error()));
  }
  next_.start();
}

void BackgroundCopies::fail(int id, Copy& copy, const QString& why) {
  copy.wanted.reset();
  copy.failed = copy.atWork;
  copy.why = why;
  emit failed(id, why);
}

// Nothing is left of what is half made.
void BackgroundCopies::giveUp(Copy& copy) {
  if (copy.work != nullptr) copy.work->stop();
  removeCopy(std::exchange(copy.making, QString()));
}

void BackgroundCopies::forget(int id) {
  const auto found = copies_.find(id);
  if (found == copies_.end()) return;
  giveUp(found->second);
  removeCopy(found->second.before);
  removeCopy(QString::fromStdString(found->second.is.file));
  copies_.erase(found);
  next_.start();
}

void BackgroundCopies::forgetAll() {
  stop();
  copies_.clear();
  folder_.reset();
}

std::vector<int> BackgroundCopies::stop() {
  next_.stop();
  std::vector<int> stopped;
  for (auto& [id, copy] : copies_) {
    if (copy.wanted || !copy.making.isEmpty()) stopped.push_back(id);
    copy.wanted.reset();
    giveUp(copy);
  }
  emit ended();
  return stopped;
}

}  // namespace gridbay::shell

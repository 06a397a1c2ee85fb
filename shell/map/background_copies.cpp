#include "shell/map/background_copies.h"

#include <QFile>
#include <algorithm>
#include <utility>

#include "shell/import/work_results.h"

namespace gridbay::shell {
namespace {

void removeFile(const QString& path) {
  if (!path.isEmpty()) QFile::remove(path);
}

}  // namespace

BackgroundCopies::BackgroundCopies(std::function<bool()> mayBegin, QObject* parent)
    : QObject(parent), mayBegin_(std::move(mayBegin)), work_(this) {
  constexpr int kMoment = 20;  // milliseconds
  retry_.setSingleShot(true);
  retry_.setInterval(kMoment);
  connect(&retry_, &QTimer::timeout, this, &BackgroundCopies::beginNext);
  connect(&work_, &BackgroundWork::progressed, this,
          [this](double done) { emit progressed(current_, done); });
  connect(&work_, &BackgroundWork::ended, this, &BackgroundCopies::take);
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

QString BackgroundCopies::of(const BackgroundSource& source, const MapFrame& frame,
                             const std::string& projection) {
  Copy& copy = copies_[source.id];
  const Wanted wanted{source, frame, projection};
  const bool isFaulty =
      copy.failed && copy.failed->source.raster == source.raster && copy.failed->projection == projection;
  if (suits(copy, wanted)) {
    copy.wanted.reset();
  } else if (!isFaulty) {
    copy.wanted = wanted;
    if (current_ == 0) retry_.start();
  }
  return isOf(copy, wanted) ? QString::fromStdString(copy.is.file) : QString();
}

const RasterNames& BackgroundCopies::rastersOf(int id) const {
  return copies_.at(id).is.rasters;
}

bool BackgroundCopies::isWaiting() const {
  return std::ranges::any_of(copies_, [](const auto& each) { return each.second.wanted.has_value(); });
}

void BackgroundCopies::beginNext() {
  if (current_ != 0) return;
  const auto next =
      std::ranges::find_if(copies_, [](const auto& each) { return each.second.wanted.has_value(); });
  if (next == copies_.end()) return emit ended();
  if (!mayBegin_()) return retry_.start();
  if (folder_ == nullptr) folder_ = std::make_unique<QTemporaryDir>();
  if (!folder_->isValid()) {
    const QString why = folder_->errorString();
    folder_.reset();
    next->second.failed = std::exchange(next->second.wanted, std::nullopt);
    emit failed(next->first, tr("cannot make a temporary folder: %1").arg(why));
    return beginNext();
  }
  current_ = next->first;
  atWork_ = *std::exchange(next->second.wanted, std::nullopt);
  emit progressed(current_, 0);
  work_.begin([wanted = atWork_, made = folder_->filePath(QString::number(++count_)).toStdString()](
                  const WorkApart::Progress& progress) {
    return packed(copyBackground(wanted.source.path.toStdString(), wanted.source.raster.toStdString(),
                                 wanted.projection, pixelsOf(wanted.frame), made, progress));
  });
}

void BackgroundCopies::take(const std::optional<std::string>& bytes) {
  const int id = std::exchange(current_, 0);
  const auto found = copies_.find(id);
  if (found != copies_.end()) {
    Copy& copy = found->second;
    Result<BackgroundCopy> made = bytes ? unpackedCopy(*bytes)
                                        : Failure{"cannot show \"" + atWork_.source.path.toStdString() +
                                                  "\": its reader came to a sudden end"};
    if (made) {
      removeFile(std::exchange(copy.before, QString::fromStdString(copy.is.file)));
      copy.is = std::move(*made);
      copy.made = atWork_;
      copy.failed.reset();
      if (copy.wanted && suits(copy, *copy.wanted)) copy.wanted.reset();
      emit this->made(id);
    } else {
      copy.wanted.reset();
      copy.failed = atWork_;
      emit failed(id, QString::fromStdString(made.error()));
    }
  }
  beginNext();
}

void BackgroundCopies::forget(int id) {
  const auto found = copies_.find(id);
  if (found == copies_.end()) return;
  removeFile(found->second.before);
  removeFile(QString::fromStdString(found->second.is.file));
  copies_.erase(found);
  if (current_ != id) return;
  work_.stop();
  current_ = 0;
  beginNext();
}

void BackgroundCopies::forgetAll() {
  stop();
  copies_.clear();
  folder_.reset();
}

std::vector<int> BackgroundCopies::stop() {
  work_.stop();
  retry_.stop();
  std::vector<int> stopped;
  for (auto& [id, copy] : copies_) {
    if (std::exchange(copy.wanted, std::nullopt) || id == current_) stopped.push_back(id);
  }
  current_ = 0;
  emit ended();
  return stopped;
}

}  // namespace gridbay::shell

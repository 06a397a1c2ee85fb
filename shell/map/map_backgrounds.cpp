#include "shell/map/map_backgrounds.h"

#include <QFileInfo>
#include <algorithm>
#include <array>
#include <utility>

namespace gridbay::shell {
namespace {

// Of lines, one after the other.
constexpr std::array<QRgb, 5> kColours{0xFF202020, 0xFF0B3C8C, 0xFF9C1C1C, 0xFF2E6B1F, 0xFF6A2C91};

}  // namespace

MapBackgrounds::MapBackgrounds(QObject* parent) : QObject(parent), copies_(this) {
  connect(&copies_, &BackgroundCopies::made, this, &MapBackgrounds::requestAgain);
  connect(&copies_, &BackgroundCopies::failed, this, &MapBackgrounds::fail);
  connect(&copies_, &BackgroundCopies::progressed, this, [this](int id, double done) {
    if (const MapBackground* background = of(id)) emit reading(background->path, done);
  });
  connect(&copies_, &BackgroundCopies::ended, this, &MapBackgrounds::readingEnded);
}

std::size_t MapBackgrounds::placeOf(int id) const {
  return static_cast<std::size_t>(std::ranges::find(all_, id, &MapBackground::id) - all_.begin());
}

const MapBackground* MapBackgrounds::of(int id) const {
  const std::size_t place = placeOf(id);
  return place < all_.size() ? &all_[place] : nullptr;
}

QString MapBackgrounds::told(const MapBackground& background) {
  if (!background.picture) return {};
  const BackgroundPicture& picture = *background.picture;
  if (!picture.fault.isEmpty()) return picture.fault;
  return picture.notice.isEmpty()
             ? QString()
             : QString("%1: %2").arg(QFileInfo(background.path).fileName(), picture.notice);
}

void MapBackgrounds::add(const QString& path) {
  ++lastId_;
  const QColor colour(kColours[static_cast<std::size_t>(lastId_) % kColours.size()]);
  const auto place = all_.begin() + static_cast<std::ptrdiff_t>(below_);
  all_.insert(place, {.id = lastId_, .path = QFileInfo(path).absoluteFilePath(), .colour = colour});
  ++below_;
  requestAgain();
  emit changed();
}

void MapBackgrounds::remove(int id) {
  const std::size_t place = placeOf(id);
  if (place >= all_.size()) return;
  all_.erase(all_.begin() + static_cast<std::ptrdiff_t>(place));
  if (place < below_) --below_;
  copies_.forget(id);
  requestAgain();
  emit changed();
  emit painted();
}

void MapBackgrounds::move(int id, bool isUp) {
  const std::size_t place = placeOf(id);
  if (place >= all_.size()) return;
  if (isUp && place + 1 == below_) {
    --below_;
  } else if (!isUp && place == below_) {
    ++below_;
  } else if (isUp && place + 1 < all_.size()) {
    std::swap(all_[place], all_[place + 1]);
  } else if (!isUp && place > 0) {
    std::swap(all_[place], all_[place - 1]);
  } else {
    return;
  }
  emit changed();
  emit painted();
}

void MapBackgrounds::setShown(int id, bool isShown) {
  const std::size_t place = placeOf(id);
  if (place >= all_.size() || all_[place].isShown == isShown) return;
  all_[place].isShown = isShown;
  if (!isShown) copies_.forget(id);
  requestAgain();
  emit changed();
  emit painted();
}

void MapBackgrounds::setOpacity(int id, double opacity) {
  const std::size_t place = placeOf(id);
  if (place >= all_.size() || all_[place].opacity == opacity) return;
  all_[place].opacity = std::clamp(opacity, 0.0, 1.0);
  emit changed();
  emit painted();
}

void MapBackgrounds::setColour(int id, const QColor& colour) {
  const std::size_t place = placeOf(id);
  if (place >= all_.size() || !colour.isValid()) return;
  all_[place].colour = colour;
  requestAgain();
  emit changed();
}

void MapBackgrounds::setRaster(int id, const QString& name) {
  const std::size_t place = placeOf(id);
  if (place >= all_.size() || all_[place].raster == name) return;
  all_[place].raster = name;
  requestAgain();
  emit changed();
}

void MapBackgrounds::stopReading() {
  for (const int id : copies_.stop()) setShown(id, false);
}

QVariantList MapBackgrounds::saved() const {
  QVariantList list;
  for (std::size_t i = 0; i < all_.size(); ++i) {
    const MapBackground& each = all_[i];
    list << QVariantMap{{"path", each.path},       {"shown", each.isShown},
                        {"opacity", each.opacity}, {"colour", each.colour.name()},
                        {"placed", each.hasPlace}, {"above", i >= below_},
                        {"raster", each.raster}};
  }
  return list;
}

void MapBackgrounds::restore(const QVariantList& saved) {
  all_.clear();
  below_ = 0;
  copies_.forgetAll();
  for (const QVariant& each : saved) {
    const QVariantMap map = each.toMap();
    const QString path = map["path"].toString();
    if (path.isEmpty()) continue;
    all_.push_back({.id = ++lastId_,
                    .path = path,
                    .isShown = map["shown"].toBool(),
                    .opacity = std::clamp(map["opacity"].toDouble(), 0.0, 1.0),
                    .colour = QColor(map["colour"].toString()),
                    .raster = map["raster"].toString(),
                    .hasPlace = map["placed"].toBool()});
    if (!map["above"].toBool()) below_ = all_.size();
  }
  requestAgain();
  emit changed();
  emit painted();
}

void MapBackgrounds::request(const MapFrame& frame, const std::string& projection) {
  if (frame == frame_ && projection == projection_) return;
  frame_ = frame;
  projection_ = projection;
  requestAgain();
}

void MapBackgrounds::requestAgain() {
  BackgroundRequest request{{}, frame_, projection_};
  for (const MapBackground& each : all_) {
    if (!each.isShown) continue;
    BackgroundSource source{each.id, each.path, each.raster, each.colour, {}};
    if (each.needsCopy) source.copy = copies_.of(source, frame_, projection_);
    if (each.needsCopy && source.copy.isEmpty()) continue;
    request.sources.push_back(std::move(source));
  }
  if (frame_.size.isEmpty() || (worker_ == nullptr && request.sources.empty())) return;
  if (worker_ == nullptr) {
    worker_ = new BackgroundWorker(this);
    connect(worker_, &BackgroundWorker::painted, this, &MapBackgrounds::take);
  }
  worker_->paint(std::move(request));
}

void MapBackgrounds::fail(int id, const QString& why) {
  BackgroundPicture none;
  none.id = id;
  none.frame = frame_;
  none.projection = projection_;
  none.fault = why;
  take(std::move(none));
}

void MapBackgrounds::take(BackgroundPicture picture) {
  const std::size_t place = placeOf(picture.id);
  if (place >= all_.size() || !all_[place].isShown) return;
  MapBackground& background = all_[place];
  if (picture.needsCopy) {
    // The last picture stays until there is another one.
    if (std::exchange(background.needsCopy, true)) return;
    return requestAgain();
  }
  if (background.needsCopy && picture.fault.isEmpty()) {
    // Those that are known stay where the copy has been forgotten meanwhile.
    const RasterNames& names = copies_.rastersOf(picture.id);
    picture.raster = names.all.empty() ? background.raster : QString::fromStdString(names.shown);
    picture.rasters = names.all.empty() ? background.rasters : QStringList();
    for (const std::string& name : names.all) picture.rasters << QString::fromStdString(name);
  }
  const QString before = told(background);
  if (!picture.fault.isEmpty()) {
    takeFault(background, std::move(picture));
    if (before != told(background)) emit changed();
    return emit painted();
  }
  if (background.needsCopy) picture.fault = copies_.faultOf(picture.id);
  const bool hasOtherRasters = background.rasters != picture.rasters;
  if (hasOtherRasters) {
    background.rasters = picture.rasters;
    background.raster = picture.raster;
  }
  background.picture = picture;
  bool isMoved = hasOtherRasters;
  if (!background.hasPlace) {
    background.hasPlace = true;
    isMoved = true;
    if (!picture.isRaster && place < below_) {
      std::rotate(all_.begin() + static_cast<std::ptrdiff_t>(place),
                  all_.begin() + static_cast<std::ptrdiff_t>(place) + 1,
                  all_.begin() + static_cast<std::ptrdiff_t>(below_));
      --below_;
    }
  }
  if (isMoved || before != told(*of(picture.id))) emit changed();
  emit painted();
}

// A picture of the same raster in the same projection, which is not as fine or of another part, stays.
void MapBackgrounds::takeFault(MapBackground& background, BackgroundPicture picture) const {
  const std::optional<BackgroundPicture>& last = background.picture;
  const bool isSame = last && last->projection == picture.projection &&
                      (background.raster.isEmpty() || last->raster == background.raster);
  if (isSame && !last->image.isNull()) {
    background.picture->fault = picture.fault;
  } else {
    background.picture = std::move(picture);
  }
}

void MapBackgrounds::paint(QPainter& painter, const MapFrame& frame, bool above) const {
  const std::span all(all_);
  paintBackgrounds(painter, frame, above ? all.subspan(below_) : all.first(below_));
}

void paintBackgrounds(QPainter& painter, const MapFrame& frame, std::span<const MapBackground> backgrounds) {
  const QRectF all({0, 0}, frame.size);
  for (const MapBackground& each : backgrounds) {
    if (!each.isShown || !each.picture || each.picture->image.isNull()) continue;
    const QRectF place = each.picture->frame.in(frame);
    if (!place.intersects(all)) continue;
    painter.save();
    painter.setOpacity(each.opacity);
    painter.drawImage(place, each.picture->image);
    painter.restore();
  }
}

}  // namespace gridbay::shell

#include "shell/map/background_worker.h"

#include <QPainter>
#include <algorithm>
#include <utility>

#include "platform/no_copy_now.h"
#include "shell/map/map_drawing.h"

namespace gridbay::shell {
namespace {

QString keyOf(const BackgroundSource& source) {
  return source.copy.isEmpty() ? source.path + '\n' + source.raster : source.copy;
}

QStringList listOf(const std::vector<std::string>& texts) {
  QStringList list;
  for (const std::string& text : texts) list << QString::fromStdString(text);
  return list;
}

// Points of a line that fall on one pixel are left out.
QPolygonF lineOf(const MapFrame& frame, const VectorFeature& feature) {
  QPolygonF line;
  for (const auto& [east, north] : feature.points) {
    const QPointF at = frame.toScreen({east, north});
    if (line.isEmpty() || (at - line.back()).manhattanLength() >= 1) line << at;
  }
  return line;
}

// False when cancelled.
bool paintShapes(QImage& image, const Background& background, const MapFrame& frame, const QColor& colour,
                 const std::function<bool()>& isCancelled) {
  constexpr double kWidth = 1.5;
  constexpr double kRadius = 3;
  const QRectF all(QPointF(-kRadius, -kRadius), frame.size + QSizeF(2 * kRadius, 2 * kRadius));
  QPainter painter(&image);
  painter.setRenderHint(QPainter::Antialiasing);
  painter.setPen(QPen(colour, kWidth));
  painter.setBrush(colour);
  for (const VectorLayer& layer : background.shapes()) {
    for (const VectorFeature& feature : layer.features) {
      if (isCancelled()) return false;
      const QPolygonF line = lineOf(frame, feature);
      const QRectF cover = line.boundingRect().adjusted(-kRadius, -kRadius, kRadius, kRadius);
      if (!cover.intersects(all)) continue;
      if (layer.shape == VectorShape::points || line.size() < 2) {
        painter.drawEllipse(line.front(), kRadius, kRadius);
      } else {
        painter.drawPolyline(layer.shape == VectorShape::polygon ? QPolygonF(line + QPolygonF{{line.front()}})
                                                                 : line);
      }
    }
  }
  return true;
}

}  // namespace

BackgroundFrame pixelsOf(const MapFrame& frame) {
  const MapPoint corner = frame.toMap({0, 0});
  return {corner.east, corner.north, frame.metresPerPixel,
          std::max(1, static_cast<int>(std::ceil(frame.size.width()))),
          std::max(1, static_cast<int>(std::ceil(frame.size.height())))};
}

BackgroundWorker::BackgroundWorker(QObject* parent)
    : QObject(parent), thread_([this](const std::stop_token& stop) { work(stop); }) {}

BackgroundWorker::~BackgroundWorker() {
  thread_.request_stop();
  thread_.join();
}

void BackgroundWorker::paint(BackgroundRequest request) {
  {
    const std::lock_guard lock(mutex_);
    request_ = std::move(request);
  }
  wake_.notify_one();
}

bool BackgroundWorker::isIdle() const {
  const std::lock_guard lock(mutex_);
  return !request_ && !atWork_ && undelivered_ == 0;
}

std::optional<BackgroundRequest> BackgroundWorker::next(const std::stop_token& stop) {
  std::unique_lock lock(mutex_);
  atWork_ = false;
  if (!wake_.wait(lock, stop, [this] { return request_.has_value(); })) return std::nullopt;
  atWork_ = true;
  return std::exchange(request_, std::nullopt);
}

void BackgroundWorker::deliver(BackgroundPicture picture) {
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

BackgroundWorker::Opened* BackgroundWorker::openedOf(const BackgroundSource& source,
                                                     const std::string& projection,
                                                     const std::function<bool()>& isCancelled) {
  if (projection != projection_) opened_.clear();
  projection_ = projection;
  if (const auto found = opened_.find(keyOf(source)); found != opened_.end()) return &found->second;
  Opened opened;
  const std::string path = (source.copy.isEmpty() ? source.path : source.copy).toStdString();
  if (source.copy.isEmpty() && needsBackgroundCopy(path)) {
    opened.needsCopy = true;
  } else if (auto background = openBackground(path, source.raster.toStdString(), projection, isCancelled)) {
    opened.background = std::move(*background);
  } else if (isCancelled()) {
    return nullptr;
  } else {
    opened.fault = QString::fromStdString(background.error());
  }
  return &(opened_[keyOf(source)] = std::move(opened));
}

void BackgroundWorker::work(const std::stop_token& stop) {
  while (std::optional<BackgroundRequest> request = next(stop)) {
    const auto isOutOfDate = [this, &stop] {
      if (stop.stop_requested()) return true;
      const std::lock_guard lock(mutex_);
      return request_.has_value();
    };
    // The reading of a whole file goes on while the map moves, for as long as the file is wanted.
    const auto isUnwanted = [this, &stop, &request](const BackgroundSource& source) {
      if (stop.stop_requested()) return true;
      const std::lock_guard lock(mutex_);
      return request_ &&
             (request_->projection != request->projection ||
              std::ranges::find(request_->sources, keyOf(source), keyOf) == request_->sources.end());
    };
    std::optional<NoCopyNow> whileTheyAreClosed(std::in_place);
    std::erase_if(opened_, [&request](const auto& each) {
      return std::ranges::none_of(
          request->sources, [&each](const BackgroundSource& source) { return keyOf(source) == each.first; });
    });
    whileTheyAreClosed.reset();
    // What is open already does not wait for what is not.
    std::ranges::stable_partition(request->sources, [&](const BackgroundSource& source) {
      return request->projection == projection_ && opened_.contains(keyOf(source));
    });
    for (const BackgroundSource& source : request->sources) {
      if (isOutOfDate()) break;
      const NoCopyNow whileItIsRead;
      Opened* opened =
          openedOf(source, request->projection, [&isUnwanted, &source] { return isUnwanted(source); });
      if (opened == nullptr) break;
      BackgroundPicture picture;
      picture.id = source.id;
      picture.projection = request->projection;
      picture.frame = request->frame;
      picture.fault = opened->fault;
      picture.needsCopy = opened->needsCopy;
      if (opened->background) {
        const BackgroundFrame pixels = pixelsOf(request->frame);
        picture.notice = QString::fromStdString(opened->background->notice());
        picture.isRaster = opened->background->isRaster();
        picture.rasters = listOf(opened->background->rasters().all);
        picture.raster = QString::fromStdString(opened->background->rasters().shown);
        picture.image =
            QImage(pixels.width, pixels.height,
                   picture.isRaster ? QImage::Format_ARGB32 : QImage::Format_ARGB32_Premultiplied);
        picture.image.fill(Qt::transparent);
        std::string fault;
        const std::span values(
            reinterpret_cast<std::uint32_t*>(picture.image.bits()),
            static_cast<std::size_t>(pixels.width) * static_cast<std::size_t>(pixels.height));
        const bool isDone = picture.isRaster ? opened->background->paint(pixels, values, isOutOfDate, &fault)
                                             : paintShapes(picture.image, *opened->background, request->frame,
                                                           source.colour, isOutOfDate);
        if (!isDone && fault.empty()) break;
        if (!isDone) {
          picture.image = QImage();
          picture.fault = QString("cannot show \"%1\": %2").arg(source.path, QString::fromStdString(fault));
        }
      }
      deliver(std::move(picture));
    }
  }
}

}  // namespace gridbay::shell

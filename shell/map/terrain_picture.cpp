#include "shell/map/terrain_picture.h"

#include <algorithm>
#include <array>
#include <cmath>
#include <limits>
#include <span>

namespace gridbay::shell {
namespace {

constexpr float kLand = std::numeric_limits<float>::infinity();
constexpr float kNothing = std::numeric_limits<float>::quiet_NaN();
constexpr QRgb kZeroLine = qRgb(0x20, 0x20, 0x20);
constexpr int kColours = 512;

// Even steps of brightness, so that equal differences look equal.
constexpr std::array kViridis{qRgb(0x44, 0x01, 0x54), qRgb(0x3B, 0x52, 0x8B), qRgb(0x21, 0x91, 0x8C),
                              qRgb(0x5E, 0xC9, 0x62), qRgb(0xFD, 0xE7, 0x25)};
constexpr std::array kSea{qRgb(0x08, 0x1D, 0x58), qRgb(0x22, 0x5E, 0xA8), qRgb(0x41, 0xB6, 0xC4),
                          qRgb(0xA8, 0xDD, 0xC3), qRgb(0xF7, 0xF3, 0xD0)};
constexpr std::array kGrey{qRgb(0x30, 0x30, 0x30), qRgb(0x60, 0x60, 0x60), qRgb(0x90, 0x90, 0x90),
                           qRgb(0xC0, 0xC0, 0xC0), qRgb(0xF0, 0xF0, 0xF0)};

// The values of a picture's pixels, or of its squares of several pixels.
struct Values {
  int width;
  int height;
  std::vector<float> all;

  float& at(int x, int y) {
    return all[static_cast<std::size_t>(y) * static_cast<std::size_t>(width) + static_cast<std::size_t>(x)];
  }
  float at(int x, int y) const { return const_cast<Values&>(*this).at(x, y); }
};

// Squares of the picture from `first` up to `last`, without it.
struct Reach {
  int first;
  int last;
};

// What an area's value shows; the land value and the missing one are no depths.
class Kind {
 public:
  explicit Kind(const TerrainArea& area)
      : land_(area.landValue), missing_(area.values->opened()->missing()) {}
  float operator()(float value) const {
    return value == missing_ || std::isnan(value) ? kNothing : value >= land_ ? kLand : value;
  }

 private:
  float land_;
  float missing_;
};

class Sampler {
 public:
  Sampler(const TerrainRequest& request, int step, const std::function<bool()>& isCancelled, Values& values)
      : request_(request), step_(step), isCancelled_(isCancelled), values_(values) {}

  // False when cancelled.
  bool add(const TerrainArea& area) {
    const bool upright = area.grid.stepJ.north == 0 && area.grid.stepK.east == 0;
    return upright ? addUpright(area) : addTurned(area);
  }

 private:
  MapPoint placeOf(double x, double y) const {
    return request_.frame.toMap({(x + 0.5) * step_, (y + 0.5) * step_});
  }

  // Rows and columns of the grid stand along those of the picture: each row of the picture is a part of one
  // row of the file, and rows that show the same one are copied.
  bool addUpright(const TerrainArea& area) {
    const auto points = [](std::size_t n) { return static_cast<double>(n); };
    std::vector<std::size_t> columns;
    const Reach across = reach(values_.width, points(area.values->columns()),
                               [&](int x) { return area.grid.pointOf(placeOf(x, 0))[0]; });
    const Reach along = reach(values_.height, points(area.values->rows()),
                              [&](int y) { return area.grid.pointOf(placeOf(0, y))[1]; });
    if (across.first >= across.last || along.first >= along.last) return true;
    for (int x = across.first; x < across.last; ++x)
      columns.push_back(nearest(area.grid.pointOf(placeOf(x, 0))[0], area.values->columns()));
    const auto [low, high] = std::ranges::minmax(columns);
    std::vector<float> row(high - low + 1);
    const Kind kind(area);
    const StoredGrid& grid = *area.values->opened();
    const double square = request_.frame.metresPerPixel * step_;
    const double apart = square / std::max(std::abs(area.grid.stepJ.east), std::abs(area.grid.stepK.north));
    std::optional<std::size_t> shown;
    for (int y = along.first; y < along.last; ++y) {
      if (isCancelled_()) return false;
      const std::size_t k = nearest(area.grid.pointOf(placeOf(0, y))[1], area.values->rows());
      float* const out = &values_.at(across.first, y);
      if (shown == k) {
        std::copy_n(out - values_.width, columns.size(), out);
        continue;
      }
      if (!grid.read(k, low, row, apart)) std::ranges::fill(row, kNothing);
      for (std::size_t i = 0; i < columns.size(); ++i) out[i] = kind(row[columns[i] - low]);
      shown = k;
    }
    return true;
  }

  // The points in view are read first, no denser than the picture has squares.
  bool addTurned(const TerrainArea& area) {
    const double columns = static_cast<double>(area.values->columns());
    const double rows = static_cast<double>(area.values->rows());
    std::array<double, 2> low{columns - 1, rows - 1};
    std::array<double, 2> high{0, 0};
    for (const auto& [x, y] :
         {std::pair{0, 0}, {values_.width, 0}, {0, values_.height}, {values_.width, values_.height}}) {
      const std::array<double, 2> point = area.grid.pointOf(placeOf(x, y));
      for (std::size_t i = 0; i < 2; ++i) {
        low[i] = std::min(low[i], std::floor(point[i]));
        high[i] = std::max(high[i], std::ceil(point[i]));
      }
    }
    for (double& each : low) each = std::max(each, 0.0);
    high = {std::min(high[0], columns - 1), std::min(high[1], rows - 1)};
    if (low[0] > high[0] || low[1] > high[1]) return true;
    const double square = request_.frame.metresPerPixel * step_;
    const auto strideOf = [square](const MapPoint& along) {
      return std::max<std::size_t>(1, static_cast<std::size_t>(square / std::hypot(along.east, along.north)));
    };
    const std::size_t strideJ = strideOf(area.grid.stepJ);
    const std::size_t strideK = strideOf(area.grid.stepK);
    const auto first = std::array{static_cast<std::size_t>(low[0]), static_cast<std::size_t>(low[1])};
    const std::size_t across = (static_cast<std::size_t>(high[0]) - first[0]) / strideJ + 1;
    const std::size_t along = (static_cast<std::size_t>(high[1]) - first[1]) / strideK + 1;
    std::vector<float> sample(across * along);
    std::vector<float> row((across - 1) * strideJ + 1);
    const Kind kind(area);
    const StoredGrid& grid = *area.values->opened();
    const double apart = static_cast<double>(std::min(strideJ, strideK));
    for (std::size_t r = 0; r < along; ++r) {
      if (isCancelled_()) return false;
      if (!grid.read(first[1] + r * strideK, first[0], row, apart)) std::ranges::fill(row, kNothing);
      for (std::size_t c = 0; c < across; ++c) sample[r * across + c] = kind(row[c * strideJ]);
    }
    for (int y = 0; y < values_.height; ++y) {
      for (int x = 0; x < values_.width; ++x) {
        const auto [j, k] = area.grid.pointOf(placeOf(x, y));
        if (!(j >= -0.5 && k >= -0.5 && j < columns - 0.5 && k < rows - 0.5)) continue;
        const auto place = [](double at, std::size_t from, std::size_t stride, std::size_t count) {
          const double index = std::round((at - static_cast<double>(from)) / static_cast<double>(stride));
          return static_cast<std::size_t>(std::clamp(index, 0.0, static_cast<double>(count - 1)));
        };
        values_.at(x, y) =
            sample[place(k, first[1], strideK, along) * across + place(j, first[0], strideJ, across)];
      }
    }
    return true;
  }

  static std::size_t nearest(double at, std::size_t count) {
    return static_cast<std::size_t>(std::clamp(std::round(at), 0.0, static_cast<double>(count - 1)));
  }
  // The squares whose middle lies in a grid of so many points; their indices rise or fall steadily.
  template <class Index>
  static Reach reach(int squares, double points, const Index& index) {
    const double start = index(0);
    const double each = index(1) - start;
    double first = (-0.5 - start) / each;
    double last = (points - 0.5 - start) / each;
    if (first > last) std::swap(first, last);
    const auto whole = [squares](double at) {
      return static_cast<int>(std::clamp(std::ceil(at), 0.0, static_cast<double>(squares)));
    };
    return {whole(first), whole(last)};
  }

  const TerrainRequest& request_;
  int step_;
  const std::function<bool()>& isCancelled_;
  Values& values_;
};

// All values, and a slope that few pixels go beyond.
TerrainScale scaleOf(const Values& values, double square) {
  TerrainScale scale{std::numeric_limits<float>::max(), std::numeric_limits<float>::lowest(), 1};
  double squares = 0;
  std::size_t count = 0;
  for (int y = 0; y < values.height; ++y) {
    for (int x = 0; x < values.width; ++x) {
      const float value = values.at(x, y);
      if (!std::isfinite(value)) continue;
      scale.least = std::min(scale.least, value);
      scale.greatest = std::max(scale.greatest, value);
      const float next = x + 1 < values.width ? values.at(x + 1, y) : kNothing;
      if (!std::isfinite(next)) continue;
      squares += (next - value) * (next - value);
      ++count;
    }
  }
  if (scale.least > scale.greatest) return {};
  if (scale.least == scale.greatest) scale.greatest = scale.least + 1;
  constexpr double kSteepest = 4;  // of the mean
  if (count > 0 && squares > 0)
    scale.steepest = static_cast<float>(kSteepest * std::sqrt(squares / static_cast<double>(count)) / square);
  return scale;
}

class Painter {
 public:
  Painter(const TerrainRequest& request, const TerrainScale& scale, const Values& values, double square)
      : style_(request.style), scale_(scale), values_(values) {
    for (int i = 0; i < kColours; ++i)
      colours_[static_cast<std::size_t>(i)] = terrainColour(style_.colours, i / (kColours - 1.0));
    // Between pixels of one cell there is no slope: it is taken over a cell at least, of the grid in the
    // middle.
    constexpr int kFarthest = 256;
    double cell = 0;
    for (const TerrainArea& area : request.areas) {
      const auto [column, row] = area.grid.pointOf(request.frame.centre);
      const bool isThere = column >= 0 && row >= 0 && column < static_cast<double>(area.values->columns()) &&
                           row < static_cast<double>(area.values->rows());
      if (isThere) cell = std::hypot(area.grid.stepJ.east, area.grid.stepJ.north);
    }
    apart_ = std::clamp(static_cast<int>(std::lround(cell / square)), 1, kFarthest);
    perSlope_ = static_cast<float>(1 / (2 * apart_ * square * scale.steepest));
  }

  QImage paint() const {
    QImage image(values_.width, values_.height, QImage::Format_ARGB32_Premultiplied);
    for (int y = 0; y < values_.height; ++y) {
      const std::span line(reinterpret_cast<QRgb*>(image.scanLine(y)),
                           static_cast<std::size_t>(values_.width));
      for (int x = 0; x < values_.width; ++x) line[static_cast<std::size_t>(x)] = colourAt(x, y);
    }
    return image;
  }

 private:
  QRgb colourAt(int x, int y) const {
    const float value = values_.at(x, y);
    if (std::isnan(value)) return 0;
    if (value == kLand) return style_.land ? landColour() : 0;
    if (style_.zeroLine && isZeroLine(x, y, value)) return kZeroLine;
    const float part = (value - scale_.least) / (scale_.greatest - scale_.least);
    const float place = std::clamp(part, 0.0F, 1.0F) * (kColours - 1);
    const QRgb colour = colours_[static_cast<std::size_t>(place)];
    return style_.hillShade ? shaded(colour, x, y, value) : colour;
  }

  bool isZeroLine(int x, int y, float value) const {
    const auto crosses = [value](float other) { return std::isfinite(other) && (value < 0) != (other < 0); };
    return (x + 1 < values_.width && crosses(values_.at(x + 1, y))) ||
           (y + 1 < values_.height && crosses(values_.at(x, y + 1)));
  }

  // By the light from the north-west.
  QRgb shaded(QRgb colour, int x, int y, float value) const {
    const auto near = [&](int nx, int ny) {
      const float other =
          values_.at(std::clamp(nx, 0, values_.width - 1), std::clamp(ny, 0, values_.height - 1));
      return std::isfinite(other) ? other : value;
    };
    const float rise = near(x + apart_, y) - near(x - apart_, y) + near(x, y + apart_) - near(x, y - apart_);
    constexpr float kDepth = 0.4F;
    const float light = 1 - kDepth * std::clamp(-rise * perSlope_, -1.0F, 1.0F);
    const auto lit = [light](int part) {
      return std::min(static_cast<int>(static_cast<float>(part) * light), 255);
    };
    return qRgb(lit(qRed(colour)), lit(qGreen(colour)), lit(qBlue(colour)));
  }

  const TerrainStyle& style_;
  TerrainScale scale_;
  const Values& values_;
  std::array<QRgb, kColours> colours_{};
  int apart_ = 1;
  float perSlope_ = 0;
};

}  // namespace

QRgb terrainColour(TerrainColours colours, double part) {
  const auto& stops = colours == TerrainColours::sea    ? kSea
                      : colours == TerrainColours::grey ? kGrey
                                                        : kViridis;
  const double place = std::clamp(part, 0.0, 1.0) * (stops.size() - 1);
  const auto below = std::min(static_cast<std::size_t>(place), stops.size() - 2);
  const double rest = place - static_cast<double>(below);
  const auto mixed = [rest](int a, int b) { return static_cast<int>(std::lround(a + (b - a) * rest)); };
  const QRgb a = stops[below];
  const QRgb b = stops[below + 1];
  return qRgb(mixed(qRed(a), qRed(b)), mixed(qGreen(a), qGreen(b)), mixed(qBlue(a), qBlue(b)));
}

QRgb landColour() {
  return qRgb(0xC9, 0xB9, 0x8F);
}

std::optional<TerrainPicture> paintTerrain(const TerrainRequest& request, int step,
                                           const std::function<bool()>& isCancelled) {
  const auto squares = [step](double pixels) {
    return std::max(1, static_cast<int>(std::ceil(pixels / step)));
  };
  Values values{squares(request.frame.size.width()), squares(request.frame.size.height()), {}};
  values.all.assign(static_cast<std::size_t>(values.width) * static_cast<std::size_t>(values.height),
                    kNothing);
  Sampler sampler(request, step, isCancelled, values);
  for (const TerrainArea& area : request.areas) {
    if (area.values->opened() != nullptr && !sampler.add(area)) return std::nullopt;
  }
  const double square = request.frame.metresPerPixel * step;
  const TerrainScale scale = request.style.scale ? *request.style.scale : scaleOf(values, square);
  if (isCancelled()) return std::nullopt;
  // Of whole squares, so that the picture may reach a little beyond the frame.
  MapFrame frame = request.frame;
  const QSizeF whole(values.width * step, values.height * step);
  frame.centre = request.frame.toMap({whole.width() / 2, whole.height() / 2});
  frame.size = whole;
  return TerrainPicture{Painter(request, scale, values, square).paint(),
                        frame,
                        scale,
                        request.isBase,
                        step == 1,
                        request.version};
}

}  // namespace gridbay::shell

#include "advice/series_mending.h"

#include <algorithm>
#include <array>
#include <cmath>
#include <functional>
#include <vector>

#include "platform/units/units.h"

namespace gridbay {
namespace {

// Smooth curves that are sampled well go no such way in one step, as a part of their range. What is mended
// goes well below what is spoken of.
constexpr double kMostPart = 0.6;
constexpr double kMostPartMended = 0.5;
constexpr double kOrdinaryPart = 0.2;
constexpr std::size_t kLeastSteps = 10;

double rangeOf(std::span<const double> values) {
  const auto [lowest, highest] = std::ranges::minmax(values);
  return highest - lowest;
}

// Values strictly between two places on the line between the values there.
void putOnLine(std::span<double> values, std::size_t first, std::size_t last) {
  const double slope = (values[last] - values[first]) / static_cast<double>(last - first);
  for (std::size_t i = first + 1; i < last; ++i)
    values[i] = values[first] + slope * static_cast<double>(i - first);
}

// A full circle in the unit of a direction; 0 for what is no direction.
double circleOf(const TsbItem& item) {
  constexpr std::array kDirections{item::kWindDirection, item::kMeanWaveDirection, item::kWaveDirection,
                                   item::kFlowDirection};
  if (std::ranges::count(kDirections, item.type) == 0) return 0;
  constexpr double kDegrees = 360;
  return CVdUnitConverter("degree", item.unit).Convert(kDegrees);
}

// Where the series comes back to the value before step `at`, from which it jumps there; 0 where it does not
// within a few steps.
std::size_t comesBackAt(std::span<const double> values, std::size_t at) {
  constexpr std::size_t kFew = 3;
  const double before = values[at - 1];
  const double jump = std::abs(values[at] - before);
  for (std::size_t i = at + 1; i < values.size() && i <= at + kFew; ++i) {
    if (std::abs(values[i] - before) < jump / 2) return i;
  }
  return 0;
}

// Whether there were any.
bool takeOutSpikes(std::span<double> values) {
  const double most = kMostPartMended * rangeOf(values);
  bool isChanged = false;
  for (std::size_t i = 1; i < values.size(); ++i) {
    if (!(std::abs(values[i] - values[i - 1]) > most)) continue;
    const std::size_t back = comesBackAt(values, i);
    if (back == 0) continue;
    putOnLine(values, i - 1, back);
    isChanged = true;
  }
  return isChanged;
}

// Spreads each jump over at least `width` steps, and as many as make each of them an ordinary one. Whether
// there were any jumps.
bool spreadJumps(std::span<double> values, std::size_t width) {
  const double range = rangeOf(values);
  bool isChanged = false;
  for (std::size_t i = 1; i < values.size(); ++i) {
    if (!(std::abs(values[i] - values[i - 1]) > kMostPartMended * range)) continue;
    std::size_t first = i - 1;
    std::size_t last = i;
    const auto isSteep = [&] {
      const auto steps = static_cast<double>(last - first);
      return last - first < width || std::abs(values[last] - values[first]) > kOrdinaryPart * range * steps;
    };
    while (isSteep() && last - first < values.size() - 1) {
      if (last + 1 < values.size()) ++last;
      if (isSteep() && first > 0) --first;
    }
    putOnLine(values, first, last);
    isChanged = true;
  }
  return isChanged;
}

}  // namespace

bool isMissing(double value, const TsbItem& item) {
  return !std::isfinite(value) || static_cast<float>(value) == static_cast<float>(item.deleteValue);
}

bool fillGaps(std::span<double> values, const TsbItem& item, const TsbTimeAxis& time) {
  const double circle = circleOf(item);
  const std::size_t none = values.size();
  const auto isGap = [&](std::size_t i) { return isMissing(values[i], item); };
  double lowest = INFINITY;
  for (std::size_t i = 0; i < values.size(); ++i) {
    if (!isGap(i)) lowest = std::min(lowest, values[i]);
  }
  if (!std::isfinite(lowest)) return values.empty();
  const double turn = lowest < 0 ? -circle / 2 : 0;  // where the directions of the series begin to count
  std::size_t before = none;
  for (std::size_t i = 0; i < values.size(); ++i) {
    if (!isGap(i)) {
      before = i;
      continue;
    }
    std::size_t behind = i;
    while (behind < none && isGap(behind)) ++behind;
    for (; i < behind; ++i) {
      if (before == none || behind == none) {
        values[i] = values[before == none ? behind : before];
        continue;
      }
      double part = (time.at(i) - time.at(before)) / (time.at(behind) - time.at(before));
      if (!(part >= 0 && part <= 1)) part = 0;  // on an axis whose times don't rise
      double way = values[behind] - values[before];
      if (circle > 0) way = std::remainder(way, circle);
      values[i] = values[before] + part * way;
      if (circle > 0) values[i] -= circle * std::floor((values[i] - turn) / circle);
    }
    before = behind;
  }
  return true;
}

std::optional<std::size_t> valueApart(std::span<const double> values) {
  constexpr double kFar = 300;  // times the range of all others
  constexpr std::size_t kLeastOthers =
      5;  // of different values: what is mostly at rest may have a single event
  if (values.size() < kLeastSteps) return std::nullopt;
  const auto apart = [&](auto isBefore) -> std::optional<std::size_t> {
    const auto most = std::ranges::min_element(values, isBefore);
    double next = isBefore(0.0, 1.0) ? INFINITY : -INFINITY;
    double last = -next;
    for (auto each = values.begin(); each != values.end(); ++each) {
      if (each == most) continue;
      if (isBefore(*each, next)) next = *each;
      if (isBefore(last, *each)) last = *each;
    }
    const double range = std::abs(next - last);
    if (!(range > 0 && std::abs(*most - next) > kFar * range)) return std::nullopt;
    return static_cast<std::size_t>(most - values.begin());
  };
  std::vector<double> different(values.begin(), values.end());
  std::ranges::sort(different);
  different.erase(std::ranges::unique(different).begin(), different.end());
  if (different.size() <= kLeastOthers) return std::nullopt;
  const std::optional<std::size_t> highest = apart(std::greater<>());
  return highest ? highest : apart(std::less<>());
}

std::optional<SeriesJump> greatestJump(std::span<const double> values) {
  if (values.size() < kLeastSteps) return std::nullopt;
  std::size_t at = 1;
  const auto way = [&](std::size_t i) { return std::abs(values[i] - values[i - 1]); };
  for (std::size_t i = 2; i < values.size(); ++i) {
    if (way(i) > way(at)) at = i;
  }
  if (!(way(at) > kMostPart * rangeOf(values))) return std::nullopt;
  return SeriesJump{at, values[at - 1], values[at]};
}

// Spikes first: without them the range is that of the series itself, and a smaller one may be seen. Ever
// longer ways come to an end with the line through the whole series.
std::size_t takeOutJumps(std::span<double> values) {
  if (!greatestJump(values)) return 0;
  const std::vector<double> given(values.begin(), values.end());
  constexpr int kMostPasses = 32;
  constexpr std::size_t kLeastWidth = 2;
  for (int pass = 0; pass < kMostPasses && takeOutSpikes(values); ++pass) {
  }
  for (std::size_t width = kLeastWidth; spreadJumps(values, width); width *= 2) {
  }
  std::size_t changed = 0;
  for (std::size_t i = 0; i < values.size(); ++i) changed += values[i] != given[i] ? 1 : 0;
  return changed;
}

}  // namespace gridbay

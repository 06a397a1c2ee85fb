// Data files of fixes that are series without what is wrong in another one.

#include <fmt/format.h>

#include <algorithm>
#include <cmath>
#include <utility>
#include <vector>

#include "advice/file_making.h"
#include "advice/fix_files.h"
#include "advice/series_mending.h"
#include "conversion/history.h"
#include "platform/tsb/tsb_file.h"
#include "platform/tsb/tsb_writer.h"
#include "platform/units/units.h"

namespace gridbay {
namespace {

constexpr std::size_t kValuesAtOnce = 1 << 18;  // values that are read or written at a time

void tell(TsbDefinition& definition, const std::string& what) {
  definition.history = historyWith(definition.history, what);
}

Outcome tellProgress(const FileProgress& progress, double done) {
  if (progress && !progress(done)) return Failure{std::string(kFixStopped)};
  return {};
}

// Several time steps of an item of a series or profile. The writer takes those of a profile one by one.
Outcome writeSteps(TsbWriter& to, const TsbDefinition& definition, std::size_t item, std::size_t step,
                   std::span<const double> values) {
  if (definition.axes.empty()) return to.write(item, step, values);
  const std::size_t points = definition.pointCount();
  for (; !values.empty(); values = values.subspan(points), ++step) {
    if (Outcome written = to.write(item, step, values.first(points)); !written) return written;
  }
  return {};
}

std::size_t stepsAtOnce(const TsbDefinition& definition) {
  return std::max<std::size_t>(kValuesAtOnce / definition.pointCount(), 1);
}

// An item of a series or profile, each point by its own.
class ItemMending {
 public:
  ItemMending(const TsbFile& from, TsbWriter& to, std::size_t number)
      : from_(from),
        to_(to),
        number_(number),
        item_(from.definition().items[number - 1]),
        time_(from.definition().time),
        points_(from.definition().pointCount()),
        values_(points_ * time_.count) {}

  // Progress goes from 0 to 1.
  Outcome make(bool isSmooth, bool hasApart, const FileProgress& progress) {
    constexpr double kHalf = 0.5;
    if (Outcome read = eachPiece(progress, 0,
                                 [&](std::size_t step, std::span<double> values) {
                                   return from_.readSteps(number_, step, values);
                                 });
        !read)
      return read;
    mend(isSmooth, hasApart);
    return eachPiece(progress, kHalf, [&](std::size_t step, std::span<double> values) {
      return writeSteps(to_, from_.definition(), number_, step, values);
    });
  }

 private:
  Outcome eachPiece(const FileProgress& progress, double begin, auto&& take) {
    const std::size_t most = stepsAtOnce(from_.definition());
    for (std::size_t step = 0; step < time_.count; step += most) {
      const std::size_t steps = std::min(most, time_.count - step);
      if (Outcome taken = take(step, std::span(values_).subspan(step * points_, steps * points_)); !taken)
        return taken;
      const double part = static_cast<double>(step + steps) / static_cast<double>(time_.count);
      if (Outcome told = tellProgress(progress, begin + part / 2); !told) return told;
    }
    return {};
  }

  void mend(bool isSmooth, bool hasApart) {
    std::vector<double> course(time_.count);
    std::vector<std::size_t> known;
    std::vector<std::size_t> empty;
    for (std::size_t point = 0; point < points_; ++point) {
      for (std::size_t step = 0; step < time_.count; ++step) course[step] = values_[step * points_ + point];
      bool hasValues = fillGaps(course, item_, time_);
      if (const auto at = hasApart && hasValues ? valueApart(course) : std::nullopt) {
        course[*at] = NAN;
        hasValues = fillGaps(course, item_, time_);
      }
      (hasValues ? known : empty).push_back(point);
      if (hasValues && isSmooth) takeOutJumps(course);
      for (std::size_t step = 0; step < time_.count; ++step) values_[step * points_ + point] = course[step];
    }
    for (const std::size_t point : empty) {
      const auto away = [point](std::size_t other) {
        return std::max(point, other) - std::min(point, other);
      };
      const auto nearest = std::ranges::min_element(known, {}, away);
      for (std::size_t step = 0; step < time_.count; ++step)
        values_[step * points_ + point] = known.empty() ? 0 : values_[step * points_ + *nearest];
    }
  }

  const TsbFile& from_;
  TsbWriter& to_;
  std::size_t number_;
  const TsbItem& item_;
  const TsbTimeAxis& time_;
  std::size_t points_;
  std::vector<double> values_;
};

// The times of a series that covers a run; an error where that can't be.
Result<TsbTimeAxis> covering(const CoveringSeries& run, TsbTimeAxis time) {
  constexpr double kHalfSecond = 0.5 / 86400;  // days
  constexpr double kMostSteps = 10'000'000;    // that are added to an axis of equal ones
  const CVdUnitConverter toUnit("d", time.unit);
  const auto begin = run.begin.parts();
  if (!toUnit.IsValid() || !begin) return Failure{"its time axis is none of time"};
  if (run.isMoved) {
    const double first = time.at(0);
    time.start = *begin;
    time.first = 0;
    for (double& each : time.values) each -= first;
  }
  const DateTime origin = time.isCalendar() ? DateTime::of(time.start) : run.begin;
  const double until = toUnit.Convert(run.end.linear() - origin.linear());
  const double last = time.at(time.count - 1);
  if (!(last < until - toUnit.Convert(kHalfSecond))) return time;
  const double added = std::ceil((until - last) / time.step * (1 - 1e-9));
  if (time.isEquidistant() && run.keepsSteps && added <= kMostSteps) {
    time.count += static_cast<std::size_t>(added);
    return time;
  }
  if (time.isEquidistant()) {
    for (std::size_t step = 0; step < time.count; ++step) time.values.push_back(time.at(step));
    time.type = time.isCalendar() ? TsbTimeAxisType::calendar : TsbTimeAxisType::relative;
  }
  time.values.push_back(until);
  ++time.count;
  return time;
}

// Copies the time steps of an item; those beyond the last one are held.
class ItemCopy {
 public:
  ItemCopy(const TsbFile& from, TsbWriter& to, const TsbDefinition& covering, std::size_t number)
      : from_(from),
        to_(to),
        covering_(covering),
        number_(number),
        known_(from.definition().time.count),
        points_(covering.pointCount()) {}

  Outcome make(const FileProgress& progress) {
    const bool isMap = covering_.axes.size() > 1;
    const std::size_t most = isMap ? 1 : stepsAtOnce(covering_);
    for (std::size_t step = 0; step < covering_.time.count; step += most) {
      const std::size_t steps = std::min(most, covering_.time.count - step);
      if (Outcome copied = isMap ? copyMap(step) : copySteps(step, steps); !copied) return copied;
      const double part = static_cast<double>(step + steps) / static_cast<double>(covering_.time.count);
      if (Outcome told = tellProgress(progress, part); !told) return told;
    }
    return {};
  }

 private:
  Outcome copySteps(std::size_t step, std::size_t steps) {
    const std::size_t there = step < known_ ? std::min(steps, known_ - step) : 0;
    values_.resize(steps * points_);
    const std::span<double> values(values_);
    if (there > 0) {
      if (Outcome read = from_.readSteps(number_, step, values.first(there * points_)); !read) return read;
      const std::span<double> last = values.subspan((there - 1) * points_, points_);
      held_.assign(last.begin(), last.end());
    }
    for (std::size_t i = there; i < steps; ++i) std::ranges::copy(held_, values.subspan(i * points_).begin());
    return writeSteps(to_, covering_, number_, step, values);
  }

  // A map may be larger than what is to be held at once.
  Outcome copyMap(std::size_t step) {
    const std::size_t columns = covering_.axes[0].points;
    const std::size_t most = std::max<std::size_t>(kValuesAtOnce / columns, 1);
    std::vector<float> values;
    for (std::size_t row = 0; row < covering_.axes[1].points; row += most) {
      values.resize(columns * std::min(most, covering_.axes[1].points - row));
      if (Outcome read = from_.readRows(number_, std::min(step, known_ - 1), row, std::span(values)); !read)
        return read;
      if (Outcome written = to_.writeRows(number_, step, row, std::span<const float>(values)); !written)
        return written;
    }
    return {};
  }

  const TsbFile& from_;
  TsbWriter& to_;
  const TsbDefinition& covering_;
  std::size_t number_;
  std::size_t known_;
  std::size_t points_;
  std::vector<double> values_;
  std::vector<double> held_;
};

// The file `to` of another one, item by item.
Outcome makeItems(const std::string& toPath, const TsbDefinition& definition, const FileProgress& progress,
                  auto&& make) {
  Result<TsbWriter> to = TsbWriter::create(toPath, definition);
  if (!to) return Failure{to.error()};
  const std::size_t items = definition.items.size();
  for (std::size_t number = 1; number <= items; ++number) {
    const auto part = [&](double done) {
      return !progress || progress((static_cast<double>(number - 1) + done) / static_cast<double>(items));
    };
    if (Outcome made = make(*to, number, part); !made) return made;
  }
  return to->commit();
}

Outcome mend(const std::string& fromPath, const std::string& toPath,
             const std::vector<std::uint32_t>& smoothItems, const std::vector<std::uint32_t>& apartItems,
             const FileProgress& progress) {
  const Result<TsbFile> from = TsbFile::open(fromPath);
  if (!from) return Failure{from.error()};
  TsbDefinition definition = from->definition();
  if (definition.axes.size() > 1) return Failure{fmt::format("{} is no time series", fromPath)};
  tell(definition, "missing values filled by the lines between their neighbours");
  if (!smoothItems.empty()) tell(definition, "jumps taken out");
  if (!apartItems.empty()) tell(definition, "values that stand apart taken out");
  // What stands for a missing value may be what lies on such a line.
  for (TsbItem& item : definition.items) item.deleteValue = TsbItem().deleteValue;
  return makeItems(toPath, definition, progress, [&](TsbWriter& to, std::size_t number, const auto& part) {
    return ItemMending(*from, to, number)
        .make(std::ranges::count(smoothItems, number) > 0, std::ranges::count(apartItems, number) > 0, part);
  });
}

}  // namespace

Outcome makeFile(const FilledSeries& making, const std::string& from, const std::string& to,
                 const FileProgress& progress) {
  return mend(from, to, {}, making.apart, progress);
}

Outcome makeFile(const SmoothedSeries& making, const std::string& from, const std::string& to,
                 const FileProgress& progress) {
  return mend(from, to, making.items, {}, progress);
}

Outcome makeFile(const CoveringSeries& making, const std::string& fromPath, const std::string& toPath,
                 const FileProgress& progress) {
  const Result<TsbFile> from = TsbFile::open(fromPath);
  if (!from) return Failure{from.error()};
  TsbDefinition definition = from->definition();
  const std::size_t known = definition.time.count;
  Result<TsbTimeAxis> time = covering(making, std::move(definition.time));
  if (!time) return Failure{fmt::format("{} can't be made to cover the run: {}", fromPath, time.error())};
  definition.time = std::move(*time);
  if (making.isMoved) tell(definition, "moved in time to the begin of a run");
  if (definition.time.count > known) tell(definition, "last values held until the end of a run");
  return makeItems(toPath, definition, progress, [&](TsbWriter& to, std::size_t number, const auto& part) {
    return ItemCopy(*from, to, definition, number).make(part);
  });
}

}  // namespace gridbay

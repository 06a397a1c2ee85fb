// Data files of fixes that are series without what is wrong in another one.

#include <fmt/format.h>

#include <algorithm>
#include <cmath>
#include <iterator>
#include <vector>

#include "advice/file_making.h"
#include "advice/fix_files.h"
#include "platform/tsb/tsb_file.h"
#include "platform/tsb/tsb_writer.h"

namespace gridbay {
namespace {

// Each run of missing values by the line between the values around it; at the ends by the one beside it.
void fill(std::vector<double>& values, const TsbItem& item, const TsbTimeAxis& time) {
  const auto isMissing = [&](double value) {
    return !std::isfinite(value) || static_cast<float>(value) == static_cast<float>(item.deleteValue);
  };
  std::vector<std::size_t> known;
  for (std::size_t i = 0; i < values.size(); ++i) {
    if (!isMissing(values[i])) known.push_back(i);
  }
  if (known.empty()) return;
  for (std::size_t i = 0; i < values.size(); ++i) {
    const auto behind = std::ranges::lower_bound(known, i);
    if (behind != known.end() && *behind == i) continue;
    if (behind == known.begin()) {
      values[i] = values[*behind];
    } else if (const std::size_t before = *std::prev(behind); behind == known.end()) {
      values[i] = values[before];
    } else {
      const double part = (time.at(i) - time.at(before)) / (time.at(*behind) - time.at(before));
      values[i] = values[before] + part * (values[*behind] - values[before]);
    }
  }
}

}  // namespace

Outcome makeFile(const FilledSeries&, const std::string& fromPath, const std::string& toPath,
                 const FileProgress& progress) {
  const Result<TsbFile> from = TsbFile::open(fromPath);
  if (!from) return Failure{from.error()};
  TsbDefinition definition = from->definition();
  if (!definition.axes.empty()) return Failure{fmt::format("{} is no time series", fromPath)};
  definition.history += fmt::format("{}missing values filled by the lines between their neighbours",
                                    definition.history.empty() ? "" : "\n");
  Result<TsbWriter> to = TsbWriter::create(toPath, definition);
  if (!to) return Failure{to.error()};
  std::vector<double> values(definition.time.count);
  for (std::size_t item = 1; item <= definition.items.size(); ++item) {
    if (const Outcome read = from->readSteps(item, 0, std::span(values)); !read) return read;
    fill(values, definition.items[item - 1], definition.time);
    if (const Outcome written = to->write(item, 0, std::span<const double>(values)); !written) return written;
    const double done = static_cast<double>(item) / static_cast<double>(definition.items.size());
    if (progress && !progress(done)) return Failure{std::string(kFixStopped)};
  }
  return to->commit();
}

}  // namespace gridbay

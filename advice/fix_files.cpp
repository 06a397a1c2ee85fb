#include "advice/fix_files.h"

#include <fmt/format.h>

#include <algorithm>
#include <cmath>
#include <filesystem>
#include <fstream>
#include <iterator>
#include <vector>

#include "platform/files/paths.h"
#include "platform/files/save_file.h"
#include "platform/tsb/tsb_file.h"
#include "platform/tsb/tsb_writer.h"

namespace gridbay {
namespace {

using Told = std::function<bool(double)>;

Outcome copy(const AdviceFile& file, const Told& progress) {
  constexpr std::size_t kBytesAtOnce = std::size_t{1} << 20;
  std::ifstream from(file.from, std::ios::binary);
  std::error_code error;
  const auto size = static_cast<double>(std::filesystem::file_size(file.from, error));
  if (!from || error) return Failure{fmt::format("{} can't be read", file.from)};
  Result<FileSave> to = FileSave::begin(file.to);
  if (!to) return Failure{to.error()};
  std::string piece(kBytesAtOnce, '\0');
  double done = 0;
  while (from.read(piece.data(), static_cast<std::streamsize>(piece.size())) || from.gcount() > 0) {
    const auto read = static_cast<std::size_t>(from.gcount());
    if (const Outcome written = to->write(std::string_view(piece).substr(0, read)); !written) return written;
    done += static_cast<double>(read);
    if (progress && !progress(done / size)) return Failure{std::string(kFixStopped)};
  }
  if (from.bad()) return Failure{fmt::format("{} can't be read", file.from)};
  return to->commit();
}

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

Outcome writeFilled(const AdviceFile& file, const Told& progress) {
  const Result<TsbFile> from = TsbFile::open(file.from);
  if (!from) return Failure{from.error()};
  TsbDefinition definition = from->definition();
  if (!definition.axes.empty()) return Failure{fmt::format("{} is no time series", file.from)};
  definition.history += fmt::format("{}missing values filled by the lines between their neighbours",
                                    definition.history.empty() ? "" : "\n");
  Result<TsbWriter> to = TsbWriter::create(file.to, definition);
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

}  // namespace

Outcome makeFiles(std::span<const AdviceFile> files, const std::function<bool(double)>& progress) {
  for (std::size_t i = 0; i < files.size(); ++i) {
    const AdviceFile& file = files[i];
    const auto part = [&](double done) {
      return !progress || progress((static_cast<double>(i) + done) / static_cast<double>(files.size()));
    };
    std::error_code error;
    Outcome made = std::filesystem::exists(file.to, error)
                       ? Failure{fmt::format("There is a file {} already", file.to)}
                   : file.fillsGaps ? writeFilled(file, part)
                                    : copy(file, part);
    if (!made) {
      removeFiles(files.first(i));
      return made;
    }
  }
  return {};
}

void removeFiles(std::span<const AdviceFile> files) {
  std::error_code error;
  for (const AdviceFile& file : files) std::filesystem::remove(file.to, error);
}

bool isSmallAndSame(const std::string& a, const std::string& b) {
  constexpr std::uintmax_t kMost = 100'000;  // bytes
  std::error_code error;
  const std::uintmax_t size = std::filesystem::file_size(a, error);
  if (error || size > kMost || std::filesystem::file_size(b, error) != size || error) return false;
  std::ifstream one(a, std::ios::binary);
  std::ifstream two(b, std::ios::binary);
  using Bytes = std::istreambuf_iterator<char>;
  return one && two && std::equal(Bytes(one), Bytes(), Bytes(two), Bytes());
}

}  // namespace gridbay

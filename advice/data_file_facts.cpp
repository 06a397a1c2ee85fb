#include "advice/data_file_facts.h"

#include <algorithm>
#include <cmath>
#include <utility>

#include "basic/grid_file.h"
#include "core/land_value.h"
#include "platform/files/file_stamp.h"
#include "platform/tsb/tsb_file.h"
#include "platform/units/units.h"

namespace gridbay {
namespace {

constexpr std::size_t kSeries = 0;  // in the place of an item: all of them
constexpr std::size_t kMostBlocks = 1'000'000;
constexpr std::size_t kMostAlongAxis = 10'000'000;  // points of a grid, whose border is kept
constexpr std::size_t kPiece = 1 << 18;             // values that are read at a time
constexpr std::size_t kMostSeriesValues = 16'000'000;
constexpr std::size_t kMostProjections = 64;

}  // namespace

bool GridFacts::isWaterAtBorder(int j, int k) const {
  const auto at = [this](const std::vector<float>& edge, int i) {
    return edge[static_cast<std::size_t>(i)] < landValue;
  };
  if (!contains(j, k)) return false;
  if (j == 0) return at(west, k);
  if (j == noJ - 1) return at(east, k);
  if (k == 0) return at(south, j);
  return k == noK - 1 && at(north, j);
}

GridPoint GridFacts::lowestPoint(int blockJ, int blockK) const {
  const auto at = static_cast<int>(lowestAt(blockJ, blockK));
  return {blockJ * blockSize + at % blockSize, blockK * blockSize + at / blockSize};
}

struct DataFileFacts::Entry {
  std::optional<FileStamp> stamp;
  std::string path;
  std::size_t item;
  bool isUsed = true;
  bool isDone = false;
  std::optional<TsbFile> file;  // while it is read
  std::size_t next = 0;         // row of a grid; value of a series, item by item
  std::optional<GridFacts> grid;
  std::optional<SeriesFacts> series;
  std::vector<double> course = {};  // of the item that is read, at its first point

  void open();
  void readOn();
  void startGrid();
  void readRows();
  void readSteps();
  void finishItem(std::size_t number);
  void fail() {
    grid.reset();
    series.reset();
    finish();
  }
  void finish() {
    isDone = true;
    file.reset();
    course = {};
  }
};

void DataFileFacts::Entry::open() {
  Result<TsbFile> opened = TsbFile::open(path);
  if (!opened) return finish();
  file.emplace(std::move(*opened));
  if (item != kSeries) return startGrid();
  series.emplace();
  series->file = file->definition();
  const TsbDefinition& definition = series->file;
  const std::size_t values = definition.pointCount() * definition.time.count * definition.items.size();
  series->hasValues = definition.axes.size() < 2 && values > 0 && values <= kMostSeriesValues;
  series->items.resize(definition.items.size());
  if (!series->hasValues) finish();
}

void DataFileFacts::Entry::startGrid() {
  const TsbDefinition& definition = file->definition();
  if (definition.axes.size() != 2 || item > definition.items.size() || definition.time.count == 0)
    return fail();
  grid.emplace();
  grid->file = definition;
  const TsbGridAxis& x = definition.axes[0];
  const TsbGridAxis& y = definition.axes[1];
  const Result<std::optional<float>> land = landValueOf(definition);
  grid->landValue = land ? land->value_or(kNoLandValue) : kNoLandValue;
  grid->dx = x.spacing;
  grid->dy = y.spacing;
  if (x.points < 2 || y.points < 2 || !(x.spacing > 0) || !(y.spacing > 0)) return fail();
  if (x.points > kMostAlongAxis || y.points > kMostAlongAxis) return fail();
  grid->noJ = static_cast<int>(x.points);
  grid->noK = static_cast<int>(y.points);
  const auto blocks = [&](std::size_t points) {
    return (points + static_cast<std::size_t>(grid->blockSize) - 1) /
           static_cast<std::size_t>(grid->blockSize);
  };
  while (blocks(x.points) * blocks(y.points) > kMostBlocks) ++grid->blockSize;
  const auto fill = [&](auto& array, auto value) {
    array = {static_cast<int>(blocks(x.points)), static_cast<int>(blocks(y.points))};
    std::ranges::fill(array.values(), value);
  };
  fill(grid->lowestOfBlocks, INFINITY);
  if (grid->blockSize > 1) {
    fill(grid->highestOfBlocks, -INFINITY);
    fill(grid->lowestAt, 0U);
  }
  grid->lowest = INFINITY;
  grid->highest = -INFINITY;
  grid->highestOfOthers = -INFINITY;
}

void DataFileFacts::Entry::readRows() {
  const auto columns = static_cast<std::size_t>(grid->noJ);
  const auto rows =
      std::min(std::max<std::size_t>(kPiece / columns, 1), static_cast<std::size_t>(grid->noK) - next);
  std::vector<float> values(rows * columns);
  if (!file->readRows(item, 0, next, std::span(values))) return fail();
  const TsbItem& kind = grid->file.items[item - 1];
  const std::span<float> lowest = grid->lowestOfBlocks.values();
  const std::span<float> highest = grid->highestOfBlocks.values();
  const std::span<std::uint32_t> lowestAt = grid->lowestAt.values();
  const auto blockColumns = static_cast<std::size_t>(grid->lowestOfBlocks.endJ());
  const auto size = static_cast<std::size_t>(grid->blockSize);
  for (std::size_t row = 0; row < rows; ++row) {
    const std::span<const float> line = std::span(values).subspan(row * columns, columns);
    const std::size_t first = (next + row) / size * blockColumns;
    for (std::size_t j = 0; j < columns; ++j) {
      const std::size_t block = first + j / size;
      const bool isHole = isMissing(line[j], kind);
      if (size > 1) highest[block] = isHole ? INFINITY : std::max(highest[block], line[j]);
      if (isHole) continue;
      if (size > 1 && line[j] < lowest[block])
        lowestAt[block] = static_cast<std::uint32_t>((next + row) % size * size + j % size);
      lowest[block] = std::min(lowest[block], line[j]);
      grid->lowest = std::min(grid->lowest, line[j]);
      grid->highest = std::max(grid->highest, line[j]);
      if (line[j] == grid->landValue) {
        ++grid->pointsAtLand;
      } else {
        grid->highestOfOthers = std::max(grid->highestOfOthers, line[j]);
        if (line[j] > 0) ++grid->pointsAboveSea;
      }
    }
    grid->west.push_back(line.front());
    grid->east.push_back(line.back());
    if (next + row == 0) grid->south.assign(line.begin(), line.end());
    if (next + row + 1 == static_cast<std::size_t>(grid->noK)) grid->north.assign(line.begin(), line.end());
  }
  next += rows;
  if (next < static_cast<std::size_t>(grid->noK)) return;
  if (size == 1) grid->highestOfBlocks = grid->lowestOfBlocks;
  for (int row = 0; row < grid->lowestOfBlocks.endK(); ++row)
    grid->lowestOfRows.push_back(std::ranges::min(std::as_const(grid->lowestOfBlocks).row(row)));
  finish();
}

void DataFileFacts::Entry::readSteps() {
  const TsbDefinition& definition = series->file;
  const std::size_t points = definition.pointCount();
  const std::size_t number = next / definition.time.count;
  const std::size_t first = next % definition.time.count;
  const std::size_t steps =
      std::min(std::max<std::size_t>(kPiece / points, 1), definition.time.count - first);
  std::vector<float> values(steps * points);
  if (!file->readSteps(number + 1, first, std::span(values))) return fail();
  SeriesFacts::Item& facts = series->items[number];
  for (std::size_t i = 0; i < values.size(); ++i) {
    if (i % points == 0) course.push_back(values[i]);
    if (!isMissing(values[i], definition.items[number])) {
      facts.highest = std::max(facts.highest, values[i]);
    } else if (facts.missing++ == 0) {
      facts.firstMissing = first + i / points;
    }
  }
  if (first + steps == definition.time.count) finishItem(number);
  next += steps;
  if (next == definition.time.count * definition.items.size()) finish();
}

void DataFileFacts::Entry::finishItem(std::size_t number) {
  SeriesFacts::Item& facts = series->items[number];
  if (fillGaps(course, series->file.items[number], series->file.time)) {
    if (const auto at = valueApart(course); at && series->file.axes.empty()) facts.apart = {*at, course[*at]};
    facts.jump = greatestJump(course);
    facts.jumping = takeOutJumps(course);
  }
  course.clear();
}

void DataFileFacts::Entry::readOn() {
  if (!file) {
    open();
  } else if (grid) {
    readRows();
  } else {
    readSteps();
  }
}

DataFileFacts::DataFileFacts() = default;
DataFileFacts::~DataFileFacts() = default;

DataFileFacts::Entry& DataFileFacts::entry(const std::string& path, std::size_t item) {
  std::unique_ptr<Entry>& found = entries_[{path, item}];
  // One that is in use in this look stays, whoever writes to its file.
  if (found != nullptr && found->isUsed) return *found;
  const std::optional<FileStamp> stamp = fileStamp(path);
  if (found == nullptr || found->stamp != stamp) {
    found = std::make_unique<Entry>();
    found->stamp = stamp;
    found->path = path;
    found->item = item;
    found->isDone = !stamp;
  }
  found->isUsed = true;
  return *found;
}

const GridFacts* DataFileFacts::grid(const std::string& path, std::size_t item) {
  const Entry& known = entry(path, item);
  return known.isDone && known.grid ? &*known.grid : nullptr;
}

const SeriesFacts* DataFileFacts::series(const std::string& path) {
  const Entry& known = entry(path, kSeries);
  return known.isDone && known.series ? &*known.series : nullptr;
}

const DataFileFacts::KnownProjection& DataFileFacts::known(const std::string& text) {
  if (const auto found = projections_.find(text); found != projections_.end()) return found->second;
  CVdMapProjection projection(text);
  std::string fullText = projection.GetProjectionString();
  return projections_.emplace(text, KnownProjection{std::move(projection), std::move(fullText)})
      .first->second;
}

bool DataFileFacts::read(std::chrono::milliseconds time) {
  using Clock = std::chrono::steady_clock;
  const Clock::time_point end = Clock::now() + time;
  for (const auto& [key, known] : entries_) {
    while (!known->isDone) {
      known->readOn();
      if (Clock::now() >= end) return isComplete();
    }
  }
  return true;
}

bool DataFileFacts::isComplete() const {
  return std::ranges::all_of(entries_, [](const auto& each) { return each.second->isDone; });
}

void DataFileFacts::forgetUnused() {
  std::erase_if(entries_, [](const auto& each) { return !each.second->isUsed; });
  for (const auto& [key, known] : entries_) known->isUsed = false;
  if (projections_.size() > kMostProjections) projections_.clear();
}

}  // namespace gridbay

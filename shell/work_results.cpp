#include "shell/work_results.h"

#include <utility>

#include "platform/packing.h"

namespace gridbay {

// Found by the packing, as they stand beside it.
static void pass(Packing& pack, RasterPreview& each) {
  pack(each.columns, each.rows, each.values, each.points, each.first, each.spacing, each.rotation,
       each.hasPlace, each.isOfPoints, each.isOwnMap, each.unit, each.projection, each.projectionName,
       each.itemType, each.valueUnit, each.landValue, each.middle, each.bands, each.rasters);
}
static void pass(Packing& pack, BackgroundCopy& each) {
  pack(each.file, each.isWhole, each.isFull, each.rasters.all, each.rasters.shown);
}
static void pass(Packing& pack, TableColumn& each) {
  pack(each.role, each.name, each.unit, each.itemType);
}
static void pass(Packing& pack, TableForm& each) {
  pack(each.separator, each.decimalComma, each.headerLines, each.dateOrder, each.start, each.timeUnit,
       each.takesMissing, each.missing, each.columns);
}
static void pass(Packing& pack, TableGuess& each) {
  pack(each.form, each.doubts, each.missingDoubts, each.dateOrderDoubt);
}
static void pass(Packing& pack, TableFault& each) {
  pack(each.line, each.text, each.why);
}
static void pass(Packing& pack, SeriesTable& each) {
  pack(each.start, each.timeUnit, each.times, each.items, each.values, each.faults, each.faultCount);
}

}  // namespace gridbay

namespace gridbay::shell {
namespace {

template <class Value>
std::string packedResult(Result<Value> result) {
  Packing pack;
  bool isMade = static_cast<bool>(result);
  std::string error = isMade ? std::string() : result.error();
  pack(isMade, error);
  if (isMade) pack(*result);
  return std::move(pack.bytes());
}

// Of what is only told in words.
template <class Converted>
std::string packedSummary(const Result<Converted>& converted) {
  if (!converted) return packedResult(Result<std::string>(Failure{converted.error()}));
  return packedResult(Result<std::string>(converted->summary));
}

template <class Value>
Result<Value> unpackedResult(const std::string& bytes) {
  Packing pack(bytes);
  bool isMade = false;
  std::string error;
  pack(isMade, error);
  if (!isMade) return Failure{error};
  Value value;
  pack(value);
  return value;
}

}  // namespace

std::string packed(const Result<RasterPreview>& preview) {
  return packedResult(preview);
}

std::string packed(const Result<ConvertedRaster>& converted) {
  return packedSummary(converted);
}

std::string packed(const Result<BackgroundCopy>& copy) {
  return packedResult(copy);
}

std::string packed(TableGuess guess) {
  Packing pack;
  pack(guess);
  return std::move(pack.bytes());
}

std::string packed(Result<SeriesTable> table) {
  return packedResult(std::move(table));
}

std::string packed(const Result<ConvertedSeries>& converted) {
  return packedSummary(converted);
}

Result<RasterPreview> unpackedPreview(const std::string& bytes) {
  return unpackedResult<RasterPreview>(bytes);
}

TableGuess unpackedGuess(const std::string& bytes) {
  TableGuess guess;
  Packing pack(bytes);
  pack(guess);
  return guess;
}

Result<SeriesTable> unpackedTable(const std::string& bytes) {
  return unpackedResult<SeriesTable>(bytes);
}

Result<std::string> unpackedSummary(const std::string& bytes) {
  return unpackedResult<std::string>(bytes);
}

Result<BackgroundCopy> unpackedCopy(const std::string& bytes) {
  return unpackedResult<BackgroundCopy>(bytes);
}

}  // namespace gridbay::shell

#include "shell/import/terrain_packing.h"

#include "platform/packing.h"

namespace gridbay::shell {
namespace {

void pass(Packing& pack, RasterPreview& each) {
  pack(each.columns, each.rows, each.values, each.points, each.first, each.spacing, each.rotation,
       each.hasPlace, each.isOfPoints, each.isOwnMap, each.unit, each.projection, each.projectionName,
       each.itemType, each.valueUnit, each.landValue, each.middle, each.bands, each.rasters);
}
void pass(Packing& pack, BackgroundCopy& each) {
  pack(each.file, each.isWhole, each.isFull, each.rasters.all, each.rasters.shown);
}
void pass(Packing& pack, std::string& text) {
  pack(text);
}

template <class Value>
std::string packedResult(Result<Value> result) {
  Packing pack;
  bool isMade = static_cast<bool>(result);
  std::string error = isMade ? std::string() : result.error();
  pack(isMade, error);
  if (isMade) pass(pack, *result);
  return std::move(pack.bytes());
}

template <class Value>
Result<Value> unpackedResult(const std::string& bytes) {
  Packing pack(bytes);
  bool isMade = false;
  std::string error;
  pack(isMade, error);
  if (!isMade) return Failure{error};
  Value value;
  pass(pack, value);
  return value;
}

}  // namespace

std::string packed(const Result<RasterPreview>& preview) {
  return packedResult(preview);
}

std::string packed(const Result<ConvertedRaster>& converted) {
  if (!converted) return packedResult(Result<std::string>(Failure{converted.error()}));
  return packedResult(Result<std::string>(converted->summary));
}

std::string packed(const Result<BackgroundCopy>& copy) {
  return packedResult(copy);
}

Result<RasterPreview> unpackedPreview(const std::string& bytes) {
  return unpackedResult<RasterPreview>(bytes);
}

Result<std::string> unpackedSummary(const std::string& bytes) {
  return unpackedResult<std::string>(bytes);
}

Result<BackgroundCopy> unpackedCopy(const std::string& bytes) {
  return unpackedResult<BackgroundCopy>(bytes);
}

}  // namespace gridbay::shell

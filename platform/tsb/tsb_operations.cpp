#include "platform/tsb/tsb_operations.h"

#include <fmt/format.h>

#include <limits>

#include "platform/units/units.h"

namespace gridbay {
namespace {

constexpr int kDone = 0;
constexpr int kFailed = 1;

bool hasItem(const TsbHeader& header, int item) {
  return header.file != nullptr && item >= 1 && item <= tsbGetNoOfItems(header);
}

}  // namespace

int tsbFileRead(const std::string& path, TsbHeader* header, std::string* error) {
  Result<TsbFile> opened = TsbFile::open(path);
  if (!opened) {
    if (error != nullptr) *error = opened.error();
    return kFailed;
  }
  *header = {std::make_unique<TsbFile>(std::move(*opened)), 0, 1};
  return kDone;
}

int tsbGetNoOfItems(const TsbHeader& header) {
  return static_cast<int>(header.file->definition().items.size());
}

const TsbItem* tsbItemD(const TsbHeader& header, int item) {
  return hasItem(header, item) ? &header.file->definition().items[static_cast<std::size_t>(item) - 1]
                               : nullptr;
}

int tsbGetItemInfo(const TsbHeader& header, int item, int* type, std::string* name, std::string* unit) {
  const TsbItem* found = tsbItemD(header, item);
  if (found == nullptr) return kFailed;
  *type = found->type;
  *name = found->name;
  *unit = found->unit;
  return kDone;
}

TsbAxisType tsbGetItemAxisType(const TsbHeader& header, int) {
  return header.file->definition().axisType();
}

int tsbGetItemAxisEqD2(const TsbHeader& header, int item, int* noJ, int* noK, float* dx, float* dy) {
  if (!hasItem(header, item) || tsbGetItemAxisType(header, item) != TsbAxisType::d2) return kFailed;
  const std::vector<TsbGridAxis>& axes = header.file->definition().axes;
  constexpr std::size_t kMostPoints = std::numeric_limits<int>::max();
  if (axes[0].points > kMostPoints || axes[1].points > kMostPoints) return kFailed;
  *noJ = static_cast<int>(axes[0].points);
  *noK = static_cast<int>(axes[1].points);
  *dx = static_cast<float>(axes[0].spacing);
  *dy = static_cast<float>(axes[1].spacing);
  return kDone;
}

int tsbFindBlockDynamic(TsbHeader* header) {
  return tsbFindItemDynamic(header, 0, 1);
}

int tsbFindItemDynamic(TsbHeader* header, int step, int item) {
  if (!hasItem(*header, item) || step < 0) return kFailed;
  if (static_cast<std::size_t>(step) >= header->file->definition().time.count) return kFailed;
  header->step = static_cast<std::size_t>(step);
  header->item = static_cast<std::size_t>(item);
  return kDone;
}

int tsbReadItemTimeStep(const TsbHeader& header, std::span<float> values) {
  return header.file->read(header.item, header.step, values) ? kDone : kFailed;
}

int tsbGetEqCalendarAxis(const TsbHeader& header, std::string* date, std::string* time, double* step) {
  const TsbTimeAxis& axis = header.file->definition().time;
  if (axis.type != TsbTimeAxisType::calendarEquidistant) return kFailed;
  *date = fmt::format("{}-{}-{}", axis.start[0], axis.start[1], axis.start[2]);
  *time = fmt::format("{}:{}:{}", axis.start[3], axis.start[4], axis.start[5]);
  *step = CVdUnitConverter(axis.unit, "s").Convert(axis.step);
  return kDone;
}

int tsbGetCustomBlockRef(const TsbHeader& header, const TsbCustomBlock** block) {
  const std::vector<TsbCustomBlock>& blocks = header.file->definition().customBlocks;
  *block = blocks.empty() ? nullptr : &blocks.front();
  return kDone;
}

int tsbGetCustomBlock(const TsbHeader& header, const TsbCustomBlock** block, std::string* name,
                      std::span<const float>* values) {
  if (*block == nullptr || !(*block)->readable) return kFailed;
  *name = (*block)->name;
  *values = (*block)->values;
  *block = *block == &header.file->definition().customBlocks.back() ? nullptr : *block + 1;
  return kDone;
}

int tsbGetGeoInfoType(const TsbHeader& header) {
  return header.file->definition().geography ? 1 : 0;
}

int tsbGetGeoInfoUTMProj(const TsbHeader& header, std::string* projection, double* longitude,
                         double* latitude, double* rotation) {
  const std::optional<TsbGeography>& place = header.file->definition().geography;
  if (!place) return kFailed;
  *projection = place->projection;
  *longitude = place->longitude;
  *latitude = place->latitude;
  *rotation = place->rotation;
  return kDone;
}

void tsbFileClose(TsbHeader* header) {
  header->file.reset();
}
void tsbHeaderDestroy(TsbHeader* header) {
  *header = {};
}

}  // namespace gridbay

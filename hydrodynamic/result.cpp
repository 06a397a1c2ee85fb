#include "hydrodynamic/result.h"

#include <algorithm>
#include <optional>
#include <stdexcept>

#include "basic/area_description.h"
#include "basic/basic_parts.h"
#include "basic/bathymetry.h"
#include "core/model_root.h"
#include "core/table_code.h"
#include "families/result_texts.h"
#include "hydrodynamic/hydrodynamic_parts.h"
#include "hydrodynamic/infiltration.h"
#include "hydrodynamic/resistance.h"
#include "hydrodynamic/texts.h"
#include "platform/tsb/tsb_operations.h"

namespace gridbay {
namespace {

using Output = CNhdResultObjectKvs;

constexpr std::string_view kX = "X_Range_And_Interval";
constexpr std::string_view kY = "Y_Range_And_Interval";

constexpr auto typeRow() {
  return keyword("Type", &Output::type);
}
constexpr auto pointRows() {
  return keywords(writtenOnly("Number_Of_Points", [](const Output& output) { return output.PointCount(); }),
                  numbers(kX, &Output::pointsJ), numbers(kY, &Output::pointsK));
}
constexpr auto rangeRows() {
  return keywords(subArea(kX, kY, &Output::part));
}

void setItemCount(std::vector<std::int32_t>& items, int count) {
  if (count < 0) return;
  const auto wanted = static_cast<std::size_t>(count);
  while (items.size() < wanted) items.push_back(static_cast<std::int32_t>(items.size()) + 1);
  items.resize(wanted);
}

// How many cells of the overland grid lie along a cell of Area 1, in x and in y; 1 where there is none.
struct OverlandCells {
  double alongX = 1;
  double alongY = 1;
};

OverlandCells overlandCells(const CBathymetryKvs& areas) {
  const CBathymetryObjectKvs* area = areas.GetItem(1);
  TsbHeader header;
  if (!areas.overlandSolver || area == nullptr || area->noJ == 0 ||
      tsbFileRead(areas.overlandFile.absolute(), &header) != 0)
    return {};
  int noJ = 0;
  int noK = 0;
  float dx = 0;
  float dy = 0;
  const bool isGrid = tsbGetItemAxisType(header, 1) == TsbAxisType::d2 &&
                      tsbGetItemAxisEqD2(header, 1, &noJ, &noK, &dx, &dy) == 0 && dx != 0 && dy != 0;
  tsbFileClose(&header);
  return isGrid ? OverlandCells{double{area->dx} / dx, double{area->dy} / dy} : OverlandCells{};
}

// Whole intervals in a number of points or steps; an interval of 0 counts as 1.
double intervalsIn(std::int64_t number, std::int32_t interval) {
  return static_cast<double>(interval == 0 ? number : number / interval);
}

double pointsAlong(const USubLine& line) {
  return intervalsIn(std::int64_t{line.last} - line.first + 1, line.interval);
}

// Values of 4 bytes: of each item at each step, and once of the grid.
double sizeMB(double items, double steps, double columns, double rows) {
  constexpr double kBytes = 4;
  constexpr double kMegabytesPerByte = 9.536743e-7;
  return (items * steps + 1) * columns * rows * kBytes * kMegabytesPerByte;
}

}  // namespace

void Output::TypeRow::save(const Output& output, KvsFile& file, const std::string& documentPath) const {
  typeRow().save(output, file, documentPath);
  if (output.type <= kPoints) {
    pointRows().save(output, file, documentPath);
  } else {
    rangeRows().save(output, file, documentPath);
  }
}

void Output::TypeRow::load(Output& output, KvsSection from, const std::string& documentPath) const {
  const bool hasType = kvsKeywordByNameNum(from, typeRow().name, 1) != nullptr;
  typeRow().load(output, from, documentPath);
  if (hasType && output.type == kPoints) pointRows().load(output, from, documentPath);
  if (hasType && output.type <= kPoints) return;
  rangeRows().load(output, from, documentPath);
  if (hasType) return;
  switch (extentOf(output.part)) {
    case Extent::point:
      output.type = kPoints;
      output.pointsJ = {static_cast<double>(output.part.x.first)};
      output.pointsK = {static_cast<double>(output.part.y.first)};
      break;
    case Extent::line:
      output.type = kLine;
      break;
    case Extent::map:
      break;
  }
}

void Output::TypeRow::copy(Output& output, const Output& other) const {
  typeRow().copy(output, other);
  pointRows().copy(output, other);
  rangeRows().copy(output, other);
}

bool Output::TypeRow::access(Output& output, std::string_view path, PathAccess& access) const {
  if (table_detail::accessRow(typeRow(), output, path, access)) return true;
  return output.type <= kPoints ? pointRows().access(output, path, access)
                                : rangeRows().access(output, path, access);
}

void Output::ItemNumbersRow::save(const Output& output, KvsFile& file,
                                  const std::string& documentPath) const {
  kvsPutParam(file, count, static_cast<std::int32_t>(output.items.size()));
  putValue(file, numbers, output.items, documentPath);
}

void Output::ItemNumbersRow::load(Output& output, KvsSection from, const std::string&) const {
  std::int32_t stated = -1;
  kvsGetParam(from, count, &stated, 1, 1);
  if (stated < 0) return;
  const KvsKeyword given = kvsKeywordByNameNum(from, numbers, 1);
  const int there = given == nullptr ? 0 : kvsGetNoParams(given);
  if (given == nullptr) output.items.clear();
  setItemCount(output.items, std::min(stated, there + kCountSlack));
  for (std::size_t i = 0; i < output.items.size(); ++i)
    kvsGetParam(from, numbers, &output.items[i], 1, static_cast<int>(i) + 1);
}

bool Output::ItemNumbersRow::access(Output& output, std::string_view path, PathAccess& access) const {
  if (!sameName(path, count)) return gridbay::numbers(numbers, &Output::items).access(output, path, access);
  auto wanted = static_cast<std::int32_t>(output.items.size());
  if (access.what == PathAccess::What::set) kvsGetParam(access.in, count, &wanted, 1, 1);
  if (wanted <= kCountSlack) setItemCount(output.items, wanted);
  if (access.what == PathAccess::What::write)
    kvsPutParam(*access.out, count, static_cast<std::int32_t>(output.items.size()));
  return true;
}

int Output::PointCount() const {
  return static_cast<int>(std::min(pointsJ.size(), pointsK.size()));
}

// The walks go on behind an item that was removed, and so pass over the one that takes its place.
void Output::leaveOutItems() {
  auto* hydrodynamic = parts<HydrodynamicParts>();
  if (hydrodynamic == nullptr) return;
  const auto remove = [this](std::size_t place) {
    items.erase(items.begin() + static_cast<std::ptrdiff_t>(place));
  };
  const auto itemAt = [this](std::size_t place) {
    if (place < items.size()) return items[place];
    throw std::invalid_argument(formatted(texts::saturationLast, file.text()));
  };
  if (hydrodynamic->nhdResistance->formulation != CNhdResistanceKvs::kWaveInduced) {
    const auto found = std::ranges::find(items, std::int32_t{kManningNumber});
    if (found != items.end()) items.erase(found);
  }
  const std::int32_t infiltration = hydrodynamic->nhdInfiltration->infiltrationType;
  if (infiltration == CNhdInfiltrationKvs::kNone) {
    for (std::size_t place = 0; place < items.size(); ++place) {
      if (itemAt(place) == kSaturation) remove(place);
      if (itemAt(place) == kInfiltratedVolume) remove(place);
    }
  } else if (infiltration == CNhdInfiltrationKvs::kNetRate) {
    for (std::size_t place = 0; place < items.size(); ++place) {
      if (itemAt(place) == kSaturation) remove(place);
    }
  }
}

void Output::Save(KvsFile& out, const std::string& documentPath) {
  leaveOutItems();
  TableKvs::Save(out, documentPath);
}

unsigned Output::Validate(ValidationList& messages, int) {
  constexpr PageId kPage = PageId::hdResult;
  const ResultLimits limits = Limits();
  unsigned faults = checkResultFileName(messages, kPage, file);
  if (type != kPoints) return faults + checkResultPart(messages, kPage, limits, part, steps, file);
  for (std::size_t point = 0; point < static_cast<std::size_t>(PointCount()); ++point) {
    for (const auto& [place, last] :
         {std::pair(pointsJ[point], limits.lastJ), std::pair(pointsK[point], limits.lastK)}) {
      if (place < 0 || place > last)
        faults += report(messages, kPage, Severity::fault, texts::gridPointOutOfRange);
    }
  }
  return faults;
}

CNhdResultKvs::CNhdResultKvs(CKvsBase* parent)
    : TableKvs(parent),
      outputs(this, [](CKvsBase&, CNhdResultObjectKvs& output, int) { output.TakeWhole(); }),
      hotStarts(this) {}

void CNhdResultKvs::Load(KvsSection section, const std::string& documentPath) {
  outputs.SetCount(0);
  TableKvs::Load(section, documentPath);
}

unsigned CNhdResultKvs::Validate(ValidationList& messages, int) {
  unsigned faults = 0;
  for (int number = 1; number <= outputs.GetCount(); ++number)
    faults += checkedEntry(messages, {number, outputs.GetCount()},
                           [&] { return outputs.GetItem(number)->Validate(messages, 0); });
  for (int number = 1; generateHotStart && number <= hotStarts.GetCount(); ++number)
    faults += hotStarts.GetItem(number)->Validate(messages, 0);
  return faults;
}

double CNhdResultKvs::OutputSizeMB() {
  auto* basic = parts<BasicParts>();
  std::optional<OverlandCells> overland;  // read once, where an output is of every point
  double sum = 0;
  for (int number = 1; number <= outputs.GetCount(); ++number) {
    const CNhdResultObjectKvs& output = *outputs.GetItem(number);
    const USubLine& steps = output.steps;
    const auto items = static_cast<double>(output.items.size());
    if (output.type == CNhdResultObjectKvs::kPoints) {
      const double stepsWritten = intervalsIn(std::int64_t{steps.last} - steps.first, steps.interval) + 1;
      sum += sizeMB(items, stepsWritten, output.PointCount(), 1);
      continue;
    }
    double columns = pointsAlong(output.part.x);
    double rows = pointsAlong(output.part.y);
    if (basic != nullptr && output.part.x.interval == 1 && output.part.y.interval == 1) {
      if (!overland) overland = overlandCells(*basic->bathymetry);
      columns *= overland->alongX;
      rows *= overland->alongY;
    }
    sum += sizeMB(items, pointsAlong(steps), columns, rows);
  }
  return sum;
}

int CNhdResultKvs::hotStartItems() {
  constexpr int kItems = 7;
  constexpr int kItemsWithDrying = 8;
  auto* basic = parts<BasicParts>();
  if (!generateHotStart || basic == nullptr) return 0;
  return basic->areaDescription->enableFloodAndDryChecking != 0 ? kItemsWithDrying : kItems;
}

double CNhdResultKvs::HotStartSizeMB() {
  auto* basic = parts<BasicParts>();
  return basic == nullptr ? 0 : basic->bathymetry->EstimateSizeMB(hotStartItems());
}

double CNhdResultKvs::TotalSizeMB() {
  auto* basic = parts<BasicParts>();
  if (basic == nullptr) return OutputSizeMB();
  const ModuleOutput beside = parts<ModelRoot>()->OutputOfModule();
  return OutputSizeMB() + beside.megabytes +
         basic->bathymetry->EstimateSizeMB(hotStartItems() + beside.hotStartItems);
}

// What is compiled into Output::Save is looked for by a debug build.
template class TableKvs<CNhdResultObjectKvs>;

}  // namespace gridbay

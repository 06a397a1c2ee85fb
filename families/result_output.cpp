#include "families/result_output.h"

#include <algorithm>
#include <array>
#include <limits>

#include "basic/basic_parts.h"
#include "basic/bathymetry.h"
#include "basic/simulation_period.h"
#include "basic/texts.h"
#include "families/result_texts.h"

namespace gridbay {

Extent extentOf(const USubArea& part) {
  const bool alongX = part.x.first != part.x.last;
  const bool alongY = part.y.first != part.y.last;
  if (alongX && alongY) return Extent::map;
  return alongX || alongY ? Extent::line : Extent::point;
}

bool fitsExtent(std::string_view fileName, Extent extent) {
  constexpr std::array<std::array<std::string_view, 2>, 3> kExtensions{
      {{"tsb0", "tb0"}, {"tsb1", "tb1"}, {"tsb2", "tb2"}}};
  const auto& [extension, shortExtension] = kExtensions[static_cast<std::size_t>(extent)];
  return fileName.ends_with(extension) || fileName.ends_with(shortExtension);
}

ResultLimits resultLimits(CKvsBase& object, int areaNumber) {
  auto* basic = object.parts<BasicParts>();
  if (basic == nullptr) return {};
  constexpr std::int32_t kLeast = std::numeric_limits<std::int32_t>::min();
  ResultLimits limits{.lastStep = std::max(basic->simulationPeriod->noPointsInTime, kLeast + 1) - 1};
  if (const CBathymetryObjectKvs* area = basic->bathymetry->GetArea(areaNumber); area != nullptr) {
    limits.hasArea = true;
    limits.lastJ = area->noJ - 1;
    limits.lastK = area->noK - 1;
  }
  return limits;
}

void takeWhole(const ResultLimits& limits, USubArea& part, USubLine& steps) {
  part = {{0, limits.lastJ, 1}, {0, limits.lastK, 1}};
  steps = {0, limits.lastStep, 1};
}

unsigned checkResultFileName(ValidationList& messages, PageId page, const FileNameValue& file) {
  if (CKvsBase::IsValidPathName(file.text().c_str())) return 0;
  return report(messages, page, Severity::fault, texts::resultFileNotValid, file.text());
}

unsigned checkResultPart(ValidationList& messages, PageId page, const ResultLimits& limits,
                         const USubArea& part, const USubLine& steps, const FileNameValue& file) {
  unsigned faults = 0;
  const auto check = [&](bool isWrong, const Text& text) {
    if (isWrong) faults += report(messages, page, Severity::fault, text);
  };
  check(!limits.hasArea, texts::associatedAreaMissing);
  check(part.x.last > limits.lastJ, texts::gridPointOutOfRange);
  check(part.y.last > limits.lastK, texts::gridPointOutOfRange);
  for (const USubLine& line : {part.x, part.y}) check(line.first < 0, texts::firstPointNegative);
  for (const USubLine& line : {part.x, part.y}) check(line.interval < 1, texts::intervalTooSmall);
  for (const USubLine& line : {part.x, part.y}) check(line.first > line.last, texts::firstPointBehindLast);
  check(steps.first < 0, texts::firstTimeStepNegative);
  check(steps.interval < 1, texts::timeStepIntervalTooSmall);
  check(steps.first > steps.last, texts::firstTimeStepAfterLast);
  check(steps.last > limits.lastStep, texts::lastTimeStepOutOfRange);
  check(!fitsExtent(file.text(), extentOf(part)), texts::wrongDimensionOfFile);
  return faults;
}

}  // namespace gridbay

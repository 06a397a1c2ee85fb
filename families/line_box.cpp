#include "families/line_box.h"

#include "basic/basic_parts.h"
#include "basic/simulation_period.h"
#include "basic/texts.h"
#include "families/area_turns.h"
#include "families/data_files.h"
#include "families/output_size.h"
#include "families/result_output.h"
#include "families/result_texts.h"
#include "families/texts.h"

namespace gridbay {
namespace {

constexpr std::int32_t kLastOfNoArea = 9;  // as of a grid of ten points
constexpr int kValuesOfLine = 2;           // of each entry in a step
constexpr int kValuesOfBox = 3;

}  // namespace

void startLineOrBox(LineOrBox& item, CKvsBase& object, int number, std::size_t entries) {
  item.areaNumber = areaInTurn(object, number);
  const ResultLimits limits = resultLimits(object, item.areaNumber);
  item.last =
      limits.hasArea ? GridPoint{limits.lastJ, limits.lastK} : GridPoint{kLastOfNoArea, kLastOfNoArea};
  item.steps.last = limits.lastStep;
  item.entries.assign(entries, 1);
}

unsigned checkLineOrBox(ValidationList& messages, CKvsBase& object, const LineOrBox& item,
                        const LineOrBoxKind& kind) {
  const ResultLimits limits = resultLimits(object, item.areaNumber);
  unsigned faults = 0;
  const auto check = [&](bool isWrong, const Text& text) {
    if (isWrong) faults += report(messages, kind.page, Severity::fault, text);
  };
  const auto checkFile = [&] {
    if (!CKvsBase::IsValidPathName(item.file.text().c_str()))
      faults += reportDataFile(messages, kind.page, item.file, {}, Reason::left);
  };
  const auto isOutside = [](std::int32_t value, std::int32_t last) { return value < 0 || value > last; };

  if (kind.isLine) checkFile();
  if (limits.hasArea) {
    check(isOutside(item.last.j, limits.lastJ), texts::gridPointOutOfRange);
    check(isOutside(item.last.k, limits.lastK), texts::gridPointOutOfRange);
    check(isOutside(item.first.j, limits.lastJ), texts::firstPointNegative);
    check(isOutside(item.first.k, limits.lastK), texts::firstPointNegative);
    check(item.first.j > item.last.j, texts::firstPointBehindLast);
    // A line may lead either way along y.
    if (!kind.isLine) check(item.first.k > item.last.k, texts::firstPointBehindLast);
  } else {
    faults += report(messages, kind.areaPage, Severity::fault,
                     kind.isLine ? texts::lineWithoutArea : texts::boxWithoutArea);
  }
  check(item.steps.first > item.steps.last, texts::firstTimeStepAfterLast);
  check(item.steps.last > limits.lastStep, texts::lastTimeStepOutOfRange);
  if (!kind.isLine) checkFile();
  return faults;
}

unsigned checkLineOrBoxCount(ValidationList& messages, int count, const LineOrBoxKind& kind) {
  if (count <= LineOrBoxList::kMost) return 0;
  return report(messages, kind.countPage, Severity::fault, kind.isLine ? texts::lineCount : texts::boxCount);
}

float sizeOfLinesOrBoxes(LineOrBoxList& list, CKvsBase& object) {
  auto* basic = object.parts<BasicParts>();
  const float timeStep = basic == nullptr ? 0 : basic->simulationPeriod->timeStepInterval;
  const int valuesOfEntry = list.kind().isLine ? kValuesOfLine : kValuesOfBox;
  float size = 0;
  int entries = 0;
  for (int number = 1; number <= list.GetCount(); ++number) {
    const LineOrBox& item = *list.GetLineOrBox(number);
    entries += chosenCount(item.entries);
    const auto span = static_cast<float>(std::int64_t{item.steps.last} - item.steps.first);
    const float steps = span / (timeStep > 0 ? timeStep : 1) + 1;
    size = static_cast<float>(size + megabytesOf(static_cast<float>(valuesOfEntry * entries) * steps));
  }
  return size;
}

}  // namespace gridbay

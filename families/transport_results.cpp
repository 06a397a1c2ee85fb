#include "families/transport_results.h"

#include <algorithm>

#include "families/area_turns.h"
#include "families/output_size.h"
#include "families/texts.h"

namespace gridbay {
namespace {

constexpr int kMostOutputs = 16;

// How many intervals lie in a range; one of 0 counts as 1.
float intervalsIn(const USubLine& range) {
  const std::int64_t interval = range.interval == 0 ? 1 : range.interval;
  return static_cast<float>((std::int64_t{range.last} - range.first) / interval);
}

}  // namespace

void startTransportOutput(TransportOutput& output, CKvsBase& object, int number) {
  output.areaNumber = areaInTurn(object, number);
  takeWhole(resultLimits(object, output.areaNumber), output.part, output.steps);
}

unsigned checkTransportOutput(ValidationList& messages, CKvsBase& object, PageId page,
                              const TransportOutput& output) {
  const unsigned faults = checkResultFileName(messages, page, output.file);
  return faults + checkResultPart(messages, page, resultLimits(object, output.areaNumber), output.part,
                                  output.steps, output.file);
}

unsigned checkOutputCount(ValidationList& messages, PageId page, int count) {
  return count <= kMostOutputs ? 0 : report(messages, page, Severity::fault, texts::outputCount);
}

double sizeOfTransportOutput(const TransportOutput& output, int values) {
  const float columns = intervalsIn(output.part.x) + 1;
  const float rows = intervalsIn(output.part.y) + 1;
  const float frames = intervalsIn(output.steps);
  return megabytesOf(columns * rows * ((frames + 1) * static_cast<float>(values) + 1));
}

}  // namespace gridbay

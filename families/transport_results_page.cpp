#include "families/transport_results_page.h"

namespace gridbay {
namespace {

// The dialog of a part goes by the limits of the first area, wherever an output is.
constexpr int kFirstArea = 1;

}  // namespace

void TransportOutputColumns::ListOutput(const Output& output) {
  const auto kind = [output](GridRow row) { return resultFileKind(extentOf(output(row)->part)); };
  const FileChoice file = resultFileOf(output, &TransportOutput::file, kind);
  Integer("Area", 45, output, &TransportOutput::areaNumber);
  const Column::Pick pick = partPick([output](GridRow row) { return &output(row)->part; },
                                     [output](GridRow row) { return output(row)->areaNumber; });
  Range("J", 70, [output](GridRow row) { return &output(row)->part.x; }).Picks(pick);
  Range("K", 70, [output](GridRow row) { return &output(row)->part.y; }).Picks(pick);
  Range("Time", 70, [output](GridRow row) { return &output(row)->steps; });
  Button("...", 20, [this, output](GridRow row) {
    TransportOutput& it = *output(row);
    if (chooseResultPart(document(), resultLimits(GetKvs(), kFirstArea), it.areaNumber, it.part, it.steps))
      UpdateDoc();
  });
  ResultFile("Data File", 160, file);
  BrowseBeside(file);
  View(texts::view.format, 45, file);
  Text("Title", 120, output, &TransportOutput::title);
}

}  // namespace gridbay

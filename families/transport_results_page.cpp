#include "families/transport_results_page.h"

namespace gridbay {

void TransportOutputColumns::ListOutput(const Output& output) {
  const auto kind = [output](GridRow row) { return resultFileKind(extentOf(output(row)->part)); };
  const FileChoice file = resultFileOf(output, &TransportOutput::file, kind);
  Integer("Area", 45, output, &TransportOutput::areaNumber);
  Range("J", 70, [output](GridRow row) { return &output(row)->part.x; });
  Range("K", 70, [output](GridRow row) { return &output(row)->part.y; });
  Range("Time", 70, [output](GridRow row) { return &output(row)->steps; });
  Button("...", 20, [this, output](GridRow row) {
    TransportOutput& it = *output(row);
    if (chooseResultPart(document(), resultLimits(GetKvs(), it.areaNumber), it.part, it.steps)) UpdateDoc();
  });
  ResultFile("Data File", 160, file);
  BrowseBeside(file);
  View(texts::view.format, 45, file);
  Text("Title", 120, output, &TransportOutput::title);
}

}  // namespace gridbay

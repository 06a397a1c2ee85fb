#include "ecology/forcings_page.h"

namespace gridbay {

using Forcing = CWQSForcingsItemKvs;

void CWQSForcingsGridDlg::LayOut() {
  const auto forcing = RowsOf(&EcologyParts::wqsForcings);
  ListDeclared<Forcing>(
      [](EcologyParts& module, int number) { return module.wqsForcings->GetItem(number); },
      [](Forcing& held) {
        Choices choices{{Forcing::kConstant, "Constant"}, {Forcing::kTimeSeries, "Type 0 File"}};
        if (held.HasSpatialVariation()) choices.Add({Forcing::kMap, "Type 2 File"});
        return choices;
      });
  const auto isFile = [forcing](GridRow row) {
    const Forcing* held = forcing(row);
    return held != nullptr && held->IsUserSpecified() && !held->IsConstant();
  };
  const auto kind = [forcing](GridRow row) {
    return forcing(row)->format == Forcing::kMap ? texts::type2File : texts::type0File;
  };
  File({.file = fileOf(forcing, &Forcing::file, kind, &Forcing::RequestDataFile),
        .browse = "...",
        .enabled = isFile});
}

}  // namespace gridbay

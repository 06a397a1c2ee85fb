#include "mud_transport_expanded/dredgings_page.h"

#include <algorithm>

#include "basic/basic_parts.h"
#include "basic/bathymetry.h"
#include "mud_transport_expanded/bed_page_texts.h"
#include "mud_transport_expanded/dredgings.h"
#include "mud_transport_expanded/mud_transport_expanded_parts.h"
#include "mud_transport_expanded/transported.h"

namespace gridbay {

using Dredger = CNmtExpDredgingItemKvs;

int CNmtExpDredgingGrid::LayoutKey() {
  return std::min(fractionCount(GetKvs()), Dredger::kMostFractions);
}

void CNmtExpDredgingGrid::LayOut() {
  const auto dredger = RowsOf(&MudTransportExpandedParts::nmtExpDredgings);
  for (int fraction = 1; fraction <= LayoutKey(); ++fraction) {
    const auto place = static_cast<std::size_t>(fraction) - 1;
    Number(formatted(texts::bed::weight, fraction), 70,
           [dredger, place](GridRow row) { return &dredger(row)->weights[place]; });
  }
  Projection("Projection", 90, dredger, &Dredger::coordinateType).Tip([dredger](GridRow row) {
    return CVdDoc::GetToolTipsString(dredger(row)->coordinateType);
  });
  File({.file =
            fileOf(dredger, &Dredger::file, FileKind{texts::bed::dredgingFile}, &Dredger::RequestDataFile)});
  const auto areas = [this](GridRow) {
    Choices numbers;
    for (int area = 1; area <= parts<BasicParts>().bathymetry->GetCount(); ++area)
      numbers.Add({area, std::to_string(area)});
    return numbers;
  };
  List("Area", 60, dredger, &Dredger::nesting, areas);
}

void CNmtExpDredgingsDlg::DoDataExchange(Form& form) {
  constexpr int kMostOnPage = 99;
  const auto dredgers = objectOf(&MudTransportExpandedParts::nmtExpDredgings);
  form.Count("Number of dredgers", countOf(dredgers), kMostOnPage);
  form.Check("Update bed", dredgers, &CNmtExpDredgingsKvs::updateBed);
  form.Grid("Dredgers", grid_);
}

}  // namespace gridbay

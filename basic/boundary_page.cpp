#include "basic/boundary_page.h"

#include "basic/basic_parts.h"
#include "basic/boundary.h"

namespace gridbay {
void CBoundaryGrid::LayOut() {
  constexpr int kWidth = 90;
  const auto boundary = RowsOf(&BasicParts::boundary);
  const auto isDetected = [this](GridRow) { return !parts<BasicParts>().boundary->isUserSpecified(); };
  Point("First point", kWidth, boundary, &CBoundaryObjectKvs::first)
      .Right()
      .ReadOnlyIf(isDetected)
      .OnBorder();
  Point("Last point", kWidth, boundary, &CBoundaryObjectKvs::last).Right().ReadOnlyIf(isDetected).OnBorder();
}

void CBoundaryDlg::DoDataExchange(Form& form) {
  const auto list = objectOf(&BasicParts::boundary);
  const auto isGiven = [list] { return list().isUserSpecified(); };
  const auto setPosition = [=](std::int32_t position) {
    list().defaultPosition = position;
    if (!isGiven()) list().RecalculateBoundaries();
  };
  const auto setCount = [=](std::int32_t count) {
    if (isGiven()) list().SetNoBoundaries(count);
  };
  form.Radio("Default position", Choices::numbered({"User specified", "Program detected"}),
             {.get = [=] { return list().defaultPosition; }, .set = setPosition});
  form.Count("Number of boundaries", {.get = [=] { return list().GetCount(); }, .set = setCount},
             CBoundaryKvs::kMostOnPage)
      .EnabledIf(isGiven);
  form.Grid("Boundaries", grid_);
}

}  // namespace gridbay

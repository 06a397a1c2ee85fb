#include "basic/bathymetry_page.h"

#include "basic/basic_parts.h"
#include "basic/bathymetry.h"
#include "basic/bathymetry_requests.h"
#include "basic/boundary.h"
#include "basic/page_texts.h"
#include "core/edition.h"
#include "core/model_root.h"

namespace gridbay {

void CBathymetryGrid::LayOut() {
  using Area = CBathymetryObjectKvs;
  const auto area = RowsOf(&BasicParts::bathymetry);
  const auto inner = [area](GridRow row) { return row.item == 1 ? nullptr : area(row); };
  const auto isFixed = [this](GridRow row) {
    return row.item == 1 || parts<BasicParts>().bathymetry->hotStart == 1;
  };
  FileChoice file =
      fileOf(area, &Area::fileName, texts::bathymetryFile, [this](CVdFileSelectorDlg& selector, GridRow) {
        RequestBathymetry(selector, parts<BasicParts>().bathymetry->hotStart == 1);
      });
  file.changed = [this](GridRow row) {
    if (row == 1) OnArea1FileChanged();
  };
  file.chosen = [this](GridRow row) {
    if (row == 1) parts<BasicParts>().bathymetry->projectionStale = true;
  };
  file.typed = [this](GridRow row) {
    if (row != 1) ResetDispersion();
  };
  FileName("Bathymetry", 210, file);
  Browse(texts::browse.format, 30, file);
  // Blank for Area 1, which lies in none.
  Point("Origin", 60, inner, &Area::origin)
      .Right()
      .ReadOnlyIf(isFixed)
      .EnabledIf({})
      .OfArea([area](GridRow row) { return area(row)->enclosingArea; });
  PlainInteger("Enclosing Area", 100, inner, &Area::enclosingArea).Right().ReadOnlyIf(isFixed).EnabledIf({});
  View(texts::view.format, 45, file);
}

// Another grid for Area 1 brings its projection, and makes boundaries that were detected worthless.
void CBathymetryGrid::OnArea1FileChanged() {
  CBathymetryKvs& areas = *parts<BasicParts>().bathymetry;
  areas.OnArea1FileChanged();
  CBoundaryKvs& boundaries = *parts<BasicParts>().boundary;
  if (!boundaries.isUserSpecified()) {
    const bool ask = boundaries.GetCount() > 0;
    if (!ask || document().host().askYesNo(formatted(texts::recalculateBoundaries)))
      boundaries.RecalculateBoundaries();
  }
  ResetDispersion();
}

// Who has a dispersion by the spacing of the grids is told, unless the user has given one.
void CBathymetryGrid::ResetDispersion() {
  if (document().HasBeenTouched(PageId::mtExpDispersionCoef)) return;
  if (auto* root = parts<BasicParts>().bathymetry->parts<ModelRoot>(); root != nullptr) root->TellOfGrids();
}

void CBathymetryDlg::DoDataExchange(Form& form) {
  using Areas = CBathymetryKvs;
  const auto areas = objectOf(&BasicParts::bathymetry);
  const auto isShown = [] { return !theEdition.wetlandSweepKit; };
  const auto isOverland = [areas] { return areas().overlandSolver; };
  const auto isNotOverland = [areas] { return !areas().overlandSolver; };
  const Binding<std::int32_t> coriolis{
      .get = [this, areas] { return hasProjection_ && areas().coriolis ? 1 : 0; },
      .set = [areas](std::int32_t on) { areas().coriolis = on != 0; }};

  form.Radio("Type", Choices::numbered({"Cold start", "Hot start"}), areas, &Areas::hotStart);
  form.Count("Number of areas", countOf(areas), Areas::kMostAreas)
      .VisibleIf(isShown)
      .EnabledIf(isNotOverland);
  form.TextList(
          "Map projection:", [this] { return projections_; }, memberOf(areas, &Areas::projection))
      .EnabledIf([this] { return hasProjection_; });
  form.Check("Apply Coriolis forcing:", coriolis).VisibleIf(isShown).EnabledIf([this, isNotOverland] {
    return hasProjection_ && isNotOverland();
  });
  form.Check("Landslides:", areas, &Areas::landSlides).VisibleIf(isShown).EnabledIf(isNotOverland);
  form.Check("Multi-cell overland solver for inland applications:            ", areas,
             &Areas::overlandSolver);
  AddFile(form, texts::fineBathymetryFile.format, overlandFile(), "...", "Edit")
      .VisibleIf(isOverland)
      .view.EnabledIf({});
  form.Grid("Areas", grid_);
}

void CBathymetryDlg::SetData() {
  std::string held;
  int flag = 0;
  hasProjection_ = parts<BasicParts>().bathymetry->GetProjection(&held, &flag) == 1;
  CVdMapProjectionGXComboBox list;
  list.UpdateMapProjection(held);
  projections_ = list.choices();
  CV27SetupFormView::SetData();
}

// The fine grid is held against Area 1, and so comes after it.
FileChoice CBathymetryDlg::overlandFile() {
  const auto area1 = std::make_shared<std::unique_ptr<CBathymetryObjectKvs>>();
  const auto areas = [this](GridRow) { return parts<BasicParts>().bathymetry.get(); };
  FileChoice file = fileOf(areas, &CBathymetryKvs::overlandFile, texts::fineBathymetry,
                           [area1](CVdFileSelectorDlg& selector, GridRow) {
                             selector.SetSelectedItems({1});
                             selector.AddRequest(std::make_unique<COverlandRqTsbItem>(**area1));
                           });
  file.ready = [this, area1](GridRow) {
    *area1 = parts<BasicParts>().bathymetry->ReadArea1Aside();
    if (*area1 == nullptr) document().host().show(formatted(texts::area1First));
    return *area1 != nullptr;
  };
  return file;
}

}  // namespace gridbay

#include "structures/dike_page.h"

#include "platform/files/paths.h"
#include "platform/units/units.h"
#include "structures/page_texts.h"
#include "structures/structure_choices.h"
#include "structures/structures_parts.h"
#include "structures/xyz_import.h"

namespace gridbay {
namespace {

using Dike = CNhdDikeObjectKvs;

}  // namespace

Dike* CDikeGrid::selected() {
  return parts<StructureParts>().nhdDike->GetItem(current_);
}

void CDikeGrid::OnCurrentRow(int row) {
  if (row == current_) return;
  current_ = row;
  host().Refresh();
}

void CDikeGrid::LayOut() {
  const auto dike = RowsOf(&StructureParts::nhdDike);
  Text("Name", 90, dike, &Dike::name);
  Check("Include", 60, dike, &Dike::include);
  Projection("Projection", 100, dike, &Dike::coordinateType);
  Number("Discharge Coef", 120, dike, &Dike::dischargeCoefficient, item::kChezyNumber);
  Number("Delta level", 120, dike, &Dike::deltaLevel, item::kLevelDifference);
  List(
      "Crest variation", 100, [dike](GridRow row) { return dike(row)->crest(); },
      [dike](GridRow row, std::int32_t crest) {
        // The one that is shown keeps its fraction.
        if (crest != dike(row)->crest()) dike(row)->crestLevelSpecification = crest;
      },
      crestVariations());
  Number("Crest level", 120, dike, &Dike::crestLevel, item::kCrestLevel);
}

Stored CDikeGrid::storeCell(int row, int col, std::string_view text) {
  const Dike& dike = *parts<StructureParts>().nhdDike->GetItem(row);
  Dike before(nullptr);
  before.AssignState(dike);
  const Stored stored = ColumnGrid::storeCell(row, col, text);
  return stored == Stored::taken && dike.SameState(before) ? Stored::same : stored;
}

void CPointGrid::LayOut() {
  Rows([this] {
    const Dike* dike = dikes_.selected();
    return dike == nullptr ? 0 : static_cast<int>(dike->points.size());
  });
  constexpr int kCoordinateWidth = 120;
  constexpr int kLevelWidth = 90;
  const auto wanted = [this](GridRow row) {
    const Dike& dike = *dikes_.selected();
    const DikePoint& point = dike.points[static_cast<std::size_t>(row.item) - 1];
    return std::optional(CellPick{.name = "Point",
                                  .of = CellPick::Of::coordinates,
                                  .projection = dike.coordinateType,
                                  .held = {{.x = point.x, .y = point.y}}});
  };
  const auto take = [this](GridRow row, std::span<const PickedPlace> places) {
    DikePoint& point = dikes_.selected()->points.edit(static_cast<std::size_t>(row.item) - 1);
    point.x = places.front().x;
    point.y = places.front().y;
    return Stored::taken;
  };
  coordinate("Easting", kCoordinateWidth, &DikePoint::x, item::kGeographicalCoordinate).Picks({wanted, take});
  coordinate("Northing", kCoordinateWidth, &DikePoint::y, item::kGeographicalCoordinate)
      .Picks({wanted, take});
  coordinate("Z", kLevelWidth, &DikePoint::z, item::kElevation).WidthBy([this] {
    const Dike* dike = dikes_.selected();
    return dike != nullptr && dike->crest() == Dike::kInSpace ? kLevelWidth : 0;
  });
}

Column& CPointGrid::coordinate(std::string_view header, int width, double DikePoint::*member, int quantity) {
  return Number(
      header, width,
      [this, member](GridRow row) {
        return std::optional(dikes_.selected()->points[static_cast<std::size_t>(row.item) - 1].*member);
      },
      [this, member](GridRow row, double typed) {
        if (!std::isfinite(typed)) return false;
        dikes_.selected()->points.edit(static_cast<std::size_t>(row.item) - 1).*member = typed;
        return true;
      },
      quantity);
}

Stored CPointGrid::storeCell(int row, int col, std::string_view text) {
  const SharedArray<DikePoint> before = dikes_.selected()->points;
  const Stored stored = ColumnGrid::storeCell(row, col, text);
  return stored == Stored::taken && dikes_.selected()->points == before ? Stored::same : stored;
}

void CNHdDikeDlg::DoDataExchange(Form& form) {
  const auto isSelected = [this] { return dikes_.selected() != nullptr; };
  Binding<std::int32_t> dikes = countOf(objectOf(&StructureParts::nhdDike));
  dikes.set = [this, set = std::move(dikes.set)](std::int32_t count) {
    dikes_.Unselect();
    set(count);
  };
  form.Count("Number of dikes", std::move(dikes), kMostDikes);
  form.Grid("Dikes", dikes_);
  form.Group("Crest level variation in space and time",
             [&] {
               const FileField file = AddFile(form, "File", crestLevelFile(), "Select...", "View..");
               file.view.Changed([this] { viewFile(); }).EnabledIf({});
               form.Text("", {.get = [this, isSelected] {
                           return isSelected() ? std::optional(itemText()) : std::nullopt;
                         }});
             })
      .EnabledIf(
          [this, isSelected] { return isSelected() && dikes_.selected()->crest() == Dike::kInSpaceAndTime; });
  form.Count("Number of points",
             {.get =
                  [this, isSelected] {
                    return isSelected()
                               ? std::optional(static_cast<std::int32_t>(dikes_.selected()->points.size()))
                               : std::nullopt;
                  },
              .set =
                  [this](std::int32_t count) {
                    // Fewer dikes leave none selected, in the same store.
                    if (Dike* dike = dikes_.selected()) dike->SetNoPoints(count);
                  }},
             kMostPoints)
      .EnabledIf(isSelected);
  form.Button("Import from file...", [this] { importPoints(); }).Beside().EnabledIf(isSelected);
  form.Grid("Points", points_);
}

FileChoice CNHdDikeDlg::crestLevelFile() {
  return {.file =
              [this](GridRow) {
                Dike* dike = dikes_.selected();
                if (dike == nullptr) return FileRef();
                FileRef file(dike->crestLevelFile);
                items_ = {static_cast<std::uint32_t>(dike->itemNumber)};
                file.items = &items_;
                return file;
              },
          .kind = texts::crestLevelFile,
          .request = [this](CVdFileSelectorDlg& selector,
                            GridRow) { dikes_.selected()->RequestCrestLevelFile(selector); },
          .chosen =
              [this](GridRow) {
                if (!items_.empty())
                  dikes_.selected()->itemNumber = static_cast<std::int32_t>(items_.front());
              }};
}

std::string CNHdDikeDlg::itemText() {
  const Dike& dike = *dikes_.selected();
  const CVdFileSelectorDlg file(texts::crestLevelFile.extension, dike.crestLevelFile.absolute());
  return formatted(texts::itemOfFile,
                   dike.crestLevelFile.empty() ? std::string() : file.GetNameOfItem(dike.itemNumber));
}

void CNHdDikeDlg::viewFile() {
  const Dike& dike = *dikes_.selected();
  const std::string path = dike.crestLevelFile.absolute();
  if (isReadableFile(path)) {
    document().host().openFile(document().getAbsoluteFilepath(path), dike.itemNumber);
  } else {
    document().host().show(formatted(texts::fileNotFound, dike.crestLevelFile.text()));
  }
}

void CNHdDikeDlg::importPoints() {
  SetupHost& host = document().host();
  CXyzGeoConvertDlg dialog(document().units());
  if (dialog.DoModal(host) != 1) return;
  SharedArray<DikePoint> points = dikes_.selected()->points;
  XyzOutcome outcome = XyzOutcome::stopped;
  host.doLongWork(texts::xyzImport.format, [&](const Progress& progress) {
    outcome = importXyz(dialog.fileName(), dialog.scales(), points, progress);
  });
  if (outcome == XyzOutcome::illegal) host.show(texts::illegalXyz.format.data());
  if (outcome != XyzOutcome::success) return;
  dikes_.selected()->points = std::move(points);
  UpdateDoc();
}

}  // namespace gridbay

#include "hydrodynamic/boundary_page.h"

#include <algorithm>
#include <array>
#include <cmath>

#include "basic/basic_parts.h"
#include "basic/boundary.h"
#include "basic/page_texts.h"
#include "hydrodynamic/hydrodynamic_parts.h"
#include "hydrodynamic/page_texts.h"
#include "hydrodynamic/sine_series_dialog.h"
#include "pages/scan.h"
#include "platform/units/units.h"

namespace gridbay {
namespace {

using Object = CNhdBoundaryObjectKvs;

// The list of data formats ends with the rating curve, which is for a flux only.
Choices dataFormats(const Object& object) {
  const Choices all{{Object::kConstant, "Constant:"},
                    {Object::kSineSeries, "Sine Series:"},
                    {Object::kType0File, "Type 0 data file:"},
                    {Object::kType1File, "Type 1 Data file:"},
                    {Object::kTransferFile, "Transfer Data File:"},
                    {Object::kRatingCurve, "Rating curve"}};
  return object.formulation == Object::kFlux ? all : all.first(5);
}

FileKind fileKind(const Object& object) {
  if (object.dataFormat == Object::kRatingCurve) return texts::ratingCurveFile;
  return object.dataFormat == Object::kType0File ? texts::timeSeriesFile : texts::profileFile;
}

}  // namespace

std::string CNhdBoundaryGrid::editName(int row, int) {
  constexpr std::array kNames{"title", "formulation", "data", "FAB type", "tilting", "flow direction"};
  return "Boundary " + std::to_string(boundaryOf(row)) + ", " +
         kNames[static_cast<std::size_t>(subRowOf(row)) - 1];
}

void CNhdBoundaryGrid::LayOut() {
  const auto object = RowsOf(&HydrodynamicParts::nhdBoundary);
  const auto hasDirections = [object](GridRow row) { return object(row)->enableUserDirections; };

  Label([boundary = itemOf(&BasicParts::boundary)](int number) {
    return formatted(texts::boundaryBlock, number) + (boundary({number}) ? boundary({number})->Text() : "");
  }).Look([](GridRow, CellStyle& style) { style.isHeading = true; });
  NewLine();
  Label("Formulation:");
  List("", 0, object, &Object::formulation, Choices{{Object::kLevel, "Level"}, {Object::kFlux, "Flux"}});
  NewLine();
  layOutData();
  NewLine();
  Label("FAB type:");
  List(
      "", 0, [object](GridRow row) { return object(row)->fabType == 3 ? 12 : object(row)->fabType; },
      [object](GridRow row, std::int32_t value) { object(row)->fabType = value; },
      Choices{{0, "0"}, {1, "1"}, {2, "2"}, {12, "12"}});
  NewLine();
  List("", 0, object, &Object::tiltType,
       Choices::lines("No tilting\r\nNon-linear tilting about:\r\nLinear tilting about:\r\n", -1));
  Integer("", 0, object, &Object::tiltingPoint)
      .EnabledIf([object](GridRow row) { return object(row)->tiltType >= 0; })
      .Picks(tiltingPick());
  NewLine();
  List("", 0, object, &Object::enableUserDirections,
       Choices::lines("No user defined flow direction\r\nFlow direction from file:\r\n"));
  // The name can be typed before directions are switched on.
  const FileChoice file =
      fileOf(object, &Object::directionFile, texts::flowDirectionFile, &Object::RequestDirectionFile);
  File({.file = file, .browse = "...", .enabled = hasDirections}).EnabledIf({});
}

// The point of the boundary's line that is nearest to the place along it. A slanting line has no such points.
Column::Pick CNhdBoundaryGrid::tiltingPick() {
  const auto object = itemOf(&HydrodynamicParts::nhdBoundary);
  const auto lineOf = itemOf(&BasicParts::boundary);
  const auto isAlongK = [](const CBoundaryObjectKvs& line) { return line.first.j == line.last.j; };
  const auto wanted = [=](GridRow row) -> std::optional<CellPick> {
    const CBoundaryObjectKvs* line = lineOf({row.item});
    if (line == nullptr || (line->first.j != line->last.j && line->first.k != line->last.k))
      return std::nullopt;
    const std::int32_t held = object(row)->tiltingPoint;
    const GridPoint point = isAlongK(*line) ? GridPoint{line->first.j, held} : GridPoint{held, line->first.k};
    return CellPick{.of = CellPick::Of::border, .held = {{.point = point}}};
  };
  const auto take = [=](GridRow row, std::span<const PickedPlace> places) {
    const CBoundaryObjectKvs& line = *lineOf({row.item});
    const auto along = [&](GridPoint point) { return isAlongK(line) ? point.k : point.j; };
    const auto [least, most] = std::minmax({along(line.first), along(line.last)});
    object(row)->tiltingPoint = std::clamp(along(places.front().point), least, most);
    return Stored::taken;
  };
  return {wanted, take};
}

void CNhdBoundaryGrid::layOutData() {
  const auto object = itemOf(&HydrodynamicParts::nhdBoundary);
  const auto isSine = [object](GridRow row) { return object(row)->dataFormat == Object::kSineSeries; };
  FileChoice file = fileOf(
      object, &Object::dataFile, [object](GridRow row) { return fileKind(*object(row)); },
      [object](CVdFileSelectorDlg& selector, GridRow row) {
        if (object(row)->dataFormat == Object::kTransferFile) selector.SetSelectedItems({});
        object(row)->RequestDataFile(selector, row);
      });
  file.chosen = [object](GridRow row) {
    if (object(row)->dataFormat == Object::kRatingCurve) object(row)->dataFile.SetNoItems(1);
  };
  List(
      "", 0, [object](GridRow row) { return object(row)->dataFormat; },
      [object](GridRow row, std::int32_t value) { object(row)->SetDataFormat(value); },
      [object](GridRow row) { return dataFormats(*object(row)); });
  Column& data = FileName("", 0, file);
  data.get = [this, object](GridRow row) { return dataText(*object(row)); };
  data.set = [this, object, typed = data.set](GridRow row, std::string_view text) {
    return object(row)->isFromFile() ? typed(row, text) : storeData(*object(row), text);
  };
  data.Look([this, object](GridRow row, CellStyle& style) {
    style.align = object(row)->isFromFile() ? CellAlign::left : CellAlign::right;
    style.toolTip =
        CVdEditStyle(document().units()).SetQunUnitBaseGroup(object(row)->dataQuantity()).GetQunToolTipText();
  });
  Column& browse = Browse("...", 0, file);
  browse.EnabledIf([object](GridRow row) { return object(row)->dataFormat != Object::kConstant; });
  browse.press = [=, this, chooseFile = browse.press](GridRow row) {
    if (!isSine(row)) {
      chooseFile(row);
    } else if (CNhdSineSeriesDlg dialog(document(), *object(row)); dialog.DoModal() == 1) {
      dialog.OnOK(*object(row));
      UpdateDoc();
    }
  };
  View(texts::view.format, 0, file, [object](GridRow row) { return object(row)->isFromFile(); });
}

std::string CNhdBoundaryGrid::dataText(const Object& object) {
  const CVdEditStyle style = CVdEditStyle(document().units()).SetQunUnitBaseGroup(object.quantity());
  if (object.dataFormat == Object::kConstant) return style.Text(object.value);
  return object.isFromFile() ? object.dataFile.fileName.text() : sineText(object, style);
}

Stored CNhdBoundaryGrid::storeData(Object& object, std::string_view text) {
  const CVdEditStyle style = CVdEditStyle(document().units()).SetQunUnitBaseGroup(object.quantity());
  if (object.dataFormat != Object::kConstant) return storeSineText(object, text, style);
  const std::optional<double> typed = scannedReal(text);
  const auto value = static_cast<float>(style.UnitConvertFromBase(typed.value_or(NAN), 0));
  if (!std::isfinite(value)) return Stored::refused;
  object.value = value;
  return Stored::taken;
}

}  // namespace gridbay

#include "hydrodynamic/boundary_page.h"

#include <array>
#include <cmath>

#include "basic/basic_parts.h"
#include "basic/boundary.h"
#include "basic/page_texts.h"
#include "hydrodynamic/hydrodynamic_parts.h"
#include "hydrodynamic/page_texts.h"
#include "pages/dialog.h"
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

bool isFile(const Object& object) {
  return object.dataFormat != Object::kConstant && object.dataFormat != Object::kSineSeries;
}

FileKind fileKind(const Object& object) {
  if (object.dataFormat == Object::kRatingCurve) return texts::ratingCurveFile;
  return object.dataFormat == Object::kType0File ? texts::timeSeriesFile : texts::profileFile;
}

int quantityOf(const Object& object) {
  return object.formulation == Object::kFlux ? item::kDischarge : item::kWaterLevel;
}

int tipQuantityOf(const Object& object) {
  if (object.formulation != Object::kFlux) {
    return object.dataFormat == Object::kTransferFile ? item::kFlowFlux : item::kWaterLevel;
  }
  if (object.dataFormat <= Object::kType0File) return item::kDischarge;
  return object.dataFormat == Object::kRatingCurve ? item::kUndefined : item::kFlowFlux;
}

CVdEditStyle levelOrFlux(const Object& object, const CVdDoc& document) {
  return CVdEditStyle(document.units()).SetQunUnitBaseGroup(quantityOf(object));
}

// The dialog of a sine series, over a copy of it; OK copies the four values back.
class CNhdSineSeriesDlg final : public CV27SetupDialog {
 public:
  CNhdSineSeriesDlg(CVdDoc& document, const Object& object)
      : CV27SetupDialog(document, texts::sineTitle.format) {
    copy_.copyWhole(object);
    const auto copy = [this]() -> Object& { return copy_; };
    form().Number("Reference level:", copy, &Object::referenceLevel, quantityOf(object));
    form().Number("Range", copy, &Object::range, quantityOf(object));
    form().Number("Period", copy, &Object::period);
    form().Number("Phase", copy, &Object::phase);
  }
  void OnOK(Object& object) const {
    for (float Object::*value : {&Object::referenceLevel, &Object::range, &Object::period, &Object::phase})
      object.*value = copy_.*value;
  }

 private:
  Object copy_{nullptr};
};

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
       Choices::numbered({"No tilting", "Non-linear tilting about:", "Linear tilting about:"}, -1));
  Integer("", 0, object, &Object::tiltingPoint).EnabledIf([object](GridRow row) {
    return object(row)->tiltType >= 0;
  });
  NewLine();
  List("", 0, object, &Object::enableUserDirections,
       Choices::numbered({"No user defined flow direction", "Flow direction from file:"}));
  // The name can be typed before directions are switched on.
  const FileChoice file =
      fileOf(object, &Object::directionFile, texts::flowDirectionFile, &Object::RequestDirectionFile);
  File({.file = file, .browse = "...", .enabled = hasDirections}).EnabledIf({});
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
    return isFile(*object(row)) ? typed(row, text) : storeData(*object(row), text);
  };
  data.Look([this, object](GridRow row, CellStyle& style) {
    style.align = isFile(*object(row)) ? CellAlign::left : CellAlign::right;
    style.toolTip =
        CVdEditStyle(document().units()).SetQunUnitBaseGroup(tipQuantityOf(*object(row))).GetQunToolTipText();
  });
  Column& browse = Browse("...", 0, file);
  browse.EnabledIf([object](GridRow row) { return object(row)->dataFormat != Object::kConstant; });
  browse.press = [=, this, chooseFile = browse.press](GridRow row) {
    isSine(row) ? editSine(*object(row)) : chooseFile(row);
  };
  View(texts::view.format, 0, file, [object](GridRow row) { return isFile(*object(row)); });
}

std::string CNhdBoundaryGrid::dataText(const Object& object) {
  const CVdEditStyle style = levelOrFlux(object, document());
  if (object.dataFormat == Object::kConstant) return style.Text(object.value);
  if (object.dataFormat != Object::kSineSeries) return object.dataFile.fileName.text();
  return formatted(texts::sineText, style.UnitConvertFromBase(object.range / 2, 1), double{object.phase},
                   double{object.period}, style.UnitConvertFromBase(object.referenceLevel, 1));
}

// The fields of a sine series go into the object as they are read, also when the text then turns out to be
// too short: phase and period that were read, and amplitude and reference level as 0 where they were not.
Stored CNhdBoundaryGrid::storeData(Object& object, std::string_view text) {
  const CVdEditStyle style = levelOrFlux(object, document());
  const auto inBase = [&style](double typed) {
    return static_cast<float>(style.UnitConvertFromBase(typed, 0));
  };
  if (object.dataFormat == Object::kConstant) {
    const std::optional<double> value = scannedReal(text);
    if (!value || !std::isfinite(inBase(*value))) return Stored::refused;
    object.value = inBase(*value);
    return Stored::taken;
  }
  float amplitude = 0;
  float reference = 0;
  const int read =
      scan(text, texts::sineForm.format, {&amplitude, &object.phase, &object.period, &reference});
  object.range = inBase(2.0 * amplitude);
  object.referenceLevel = inBase(reference);
  return read == 4 ? Stored::taken : Stored::partly;
}

void CNhdBoundaryGrid::editSine(Object& object) {
  CNhdSineSeriesDlg dialog(document(), object);
  if (dialog.DoModal() != 1) return;
  dialog.OnOK(object);
  UpdateDoc();
}

}  // namespace gridbay

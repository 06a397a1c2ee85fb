#include "hydrodynamic/boundary_page.h"

#include <algorithm>
#include <array>
#include <cstdio>

#include "basic/basic_parts.h"
#include "basic/boundary.h"
#include "basic/page_texts.h"
#include "hydrodynamic/hydrodynamic_parts.h"
#include "hydrodynamic/page_texts.h"
#include "platform/files/paths.h"
#include "platform/units/units.h"

namespace gridbay {
namespace {

using Object = CNhdBoundaryObjectKvs;

enum SubRow { kTitleRow = 1, kFormulationRow, kDataRow, kFabRow, kTiltRow, kDirectionRow };
enum Column { kNameColumn = 1, kValueColumn, kBrowseColumn, kViewColumn };

struct Choice {
  std::int32_t value;
  const char* text;
};

constexpr std::array<Choice, 2> kFormulations{{{Object::kLevel, "Level"}, {Object::kFlux, "Flux"}}};
constexpr std::array<Choice, 6> kDataFormats{{{Object::kConstant, "Constant:"},
                                              {Object::kSineSeries, "Sine Series:"},
                                              {Object::kType0File, "Type 0 data file:"},
                                              {Object::kType1File, "Type 1 Data file:"},
                                              {Object::kTransferFile, "Transfer Data File:"},
                                              {Object::kRatingCurve, "Rating curve"}}};
constexpr std::array<Choice, 4> kFabTypes{{{0, "0"}, {1, "1"}, {2, "2"}, {12, "12"}}};
constexpr std::array<Choice, 3> kTilts{
    {{-1, "No tilting"}, {0, "Non-linear tilting about:"}, {1, "Linear tilting about:"}}};
constexpr std::array<Choice, 2> kDirections{
    {{0, "No user defined flow direction"}, {1, "Flow direction from file:"}}};

// The list of data formats ends with the rating curve, which is for a flux only.
std::span<const Choice> dataFormats(const Object& object) {
  return std::span<const Choice>(kDataFormats).first(object.formulation == Object::kFlux ? 6 : 5);
}

void showChoice(CellStyle& style, std::span<const Choice> choices, std::int32_t value) {
  style.kind = CellKind::dropDown;
  for (const Choice& choice : choices) {
    style.choices.emplace_back(choice.text);
    if (choice.value == value) style.value = choice.text;
  }
}

bool storeChoice(std::span<const Choice> choices, std::string_view text, auto store) {
  const auto found =
      std::ranges::find_if(choices, [text](const Choice& choice) { return text == choice.text; });
  if (found == choices.end()) return false;
  store(found->value);
  return true;
}

bool isFile(std::int32_t dataFormat) {
  return dataFormat != Object::kConstant && dataFormat != Object::kSineSeries;
}

void showButton(CellStyle& style, std::string_view face, bool enabled) {
  style.kind = CellKind::button;
  style.value = face;
  style.enabled = enabled;
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

}  // namespace

CNhdSineSeriesDlg::CNhdSineSeriesDlg(const Object& object, const UnitChoices& units)
    : units_(units),
      referenceLevel_(object.referenceLevel),
      range_(object.range),
      period_(object.period),
      phase_(object.phase) {
  form_.DDX_VDedit("Reference level:", referenceLevel_, quantityOf(object));
  form_.DDX_VDedit("Range", range_, quantityOf(object));
  form_.DDX_VDedit("Period", period_, 0);
  form_.DDX_VDedit("Phase", phase_, 0);
  form_.show(units_);
}

std::string_view CNhdSineSeriesDlg::title() const {
  return texts::sineTitle.format;
}

void CNhdSineSeriesDlg::OnOK(Object& object) const {
  object.referenceLevel = referenceLevel_;
  object.range = range_;
  object.period = period_;
  object.phase = phase_;
}

int CNhdBoundaryGrid::GetRowCount() {
  return kRowsPerBoundary * parts<HydrodynamicParts>().nhdBoundary->GetCount();
}

int CNhdBoundaryGrid::GetColWidth(int col) {
  constexpr std::array kWidths{0, 160, 240, 30, 30};
  return kWidths[static_cast<std::size_t>(col)];
}

CNhdBoundaryObjectKvs* CNhdBoundaryGrid::object(int row) {
  return parts<HydrodynamicParts>().nhdBoundary->GetItem(boundaryOf(row));
}

CVdEditStyle CNhdBoundaryGrid::levelOrFlux(const Object& object) {
  return CVdEditStyle(page().document().units()).SetQunUnitBaseGroup(quantityOf(object)).SetFormat("%-lf");
}

bool CNhdBoundaryGrid::styleOf(int row, int col, CellStyle& style) {
  Object* it = object(row);
  const CBoundaryObjectKvs* boundary = parts<BasicParts>().boundary->GetItem(boundaryOf(row));
  if (it == nullptr || boundary == nullptr) return false;
  style.kind = CellKind::label;
  switch (subRowOf(row)) {
    case kTitleRow:
      style.isHeading = col == kNameColumn;
      if (col == kNameColumn)
        style.value = formatted(texts::boundaryBlock, boundaryOf(row)) + boundary->Text();
      break;
    case kFormulationRow:
      if (col == kNameColumn) style.value = "Formulation:";
      if (col == kValueColumn) showChoice(style, kFormulations, it->formulation);
      break;
    case kDataRow:
      styleOfData(*it, col, style);
      break;
    case kFabRow:
      if (col == kNameColumn) style.value = "FAB type:";
      if (col == kValueColumn) showChoice(style, kFabTypes, it->fabType == 3 ? 12 : it->fabType);
      break;
    case kTiltRow:
      if (col == kNameColumn) showChoice(style, kTilts, it->tiltType);
      if (col == kValueColumn) {
        style.kind = CellKind::plain;
        style.value = std::to_string(it->tiltingPoint);
        if (it->tiltType < 0) SetDisabled(style);
      }
      break;
    default:
      styleOfDirection(*it, col, style);
      break;
  }
  return true;
}

std::string CNhdBoundaryGrid::editName(int row, int) {
  constexpr std::array kNames{"title", "formulation", "data", "FAB type", "tilting", "flow direction"};
  return "Boundary " + std::to_string(boundaryOf(row)) + ", " +
         kNames[static_cast<std::size_t>(subRowOf(row)) - 1];
}

std::string CNhdBoundaryGrid::dataText(const Object& object) {
  const CVdEditStyle style = levelOrFlux(object);
  if (object.dataFormat == Object::kConstant) return style.Text(object.value);
  if (object.dataFormat != Object::kSineSeries) return object.dataFile.fileName.text();
  return formatted(texts::sineText, style.UnitConvertFromBase(object.range / 2, 1), double{object.phase},
                   double{object.period}, style.UnitConvertFromBase(object.referenceLevel, 1));
}

void CNhdBoundaryGrid::styleOfData(Object& object, int col, CellStyle& style) {
  switch (col) {
    case kNameColumn:
      showChoice(style, dataFormats(object), object.dataFormat);
      break;
    case kValueColumn:
      style.kind = CellKind::plain;
      style.align = isFile(object.dataFormat) ? CellAlign::left : CellAlign::right;
      style.value = dataText(object);
      style.toolTip = CVdEditStyle(page().document().units())
                          .SetQunUnitBaseGroup(tipQuantityOf(object))
                          .GetQunToolTipText();
      break;
    case kBrowseColumn:
      showButton(style, "...", object.dataFormat != Object::kConstant);
      break;
    default:
      showButton(style, texts::view.format,
                 isFile(object.dataFormat) && isReadableFile(object.dataFile.fileName.absolute()));
      break;
  }
}

void CNhdBoundaryGrid::styleOfDirection(Object& object, int col, CellStyle& style) {
  switch (col) {
    case kNameColumn:
      showChoice(style, kDirections, object.enableUserDirections ? 1 : 0);
      break;
    case kValueColumn:
      style.kind = CellKind::plain;
      style.value = object.directionFile.fileName.text();
      if (!object.enableUserDirections) SetDisabled(style);
      break;
    case kBrowseColumn:
      showButton(style, "...", object.enableUserDirections);
      break;
    default:
      showButton(style, texts::view.format,
                 object.enableUserDirections && isReadableFile(object.directionFile.fileName.absolute()));
      break;
  }
}

bool CNhdBoundaryGrid::storeCell(int row, int col, std::string_view text) {
  Object& it = *object(row);
  switch (subRowOf(row)) {
    case kFormulationRow:
      return col == kValueColumn &&
             storeChoice(kFormulations, text, [&it](std::int32_t value) { it.formulation = value; });
    case kDataRow:
      if (col == kValueColumn) return storeData(it, text);
      return storeChoice(dataFormats(it), text, [&it](std::int32_t value) { it.SetDataFormat(value); });
    case kFabRow:
      return col == kValueColumn &&
             storeChoice(kFabTypes, text, [&it](std::int32_t value) { it.fabType = value; });
    case kTiltRow: {
      if (col == kNameColumn)
        return storeChoice(kTilts, text, [&it](std::int32_t value) { it.tiltType = value; });
      int point = 0;
      if (std::sscanf(std::string(text).c_str(), "%d", &point) != 1) return false;
      it.tiltingPoint = point;
      return true;
    }
    case kDirectionRow:
      if (col == kNameColumn) {
        return storeChoice(kDirections, text,
                           [&it](std::int32_t value) { it.enableUserDirections = value == 1; });
      }
      it.directionFile.fileName.Set(text, page().document().path());
      return true;
    default:
      return false;
  }
}

bool CNhdBoundaryGrid::storeData(Object& object, std::string_view text) {
  const std::string typed(text);
  if (object.dataFormat == Object::kSineSeries) return storeSine(object, typed);
  if (object.dataFormat != Object::kConstant) {
    object.dataFile.fileName.Set(typed, page().document().path());
    return true;
  }
  double value = 0;
  if (std::sscanf(typed.c_str(), "%lf", &value) != 1) return false;
  object.value = static_cast<float>(levelOrFlux(object).UnitConvertFromBase(value, 0));
  return true;
}

// The fields go into the object as they are read, also when the text then turns out to be too short: phase
// and period that were read, and amplitude and reference level as 0 where they were not.
bool CNhdBoundaryGrid::storeSine(Object& object, const std::string& text) {
  float amplitude = 0;
  float reference = 0;
  const int read = std::sscanf(text.c_str(), texts::sineForm.format.data(), &amplitude, &object.phase,
                               &object.period, &reference);
  const CVdEditStyle style = levelOrFlux(object);
  object.range = static_cast<float>(style.UnitConvertFromBase(2.0 * amplitude, 0));
  object.referenceLevel = static_cast<float>(style.UnitConvertFromBase(reference, 0));
  return read == 4;
}

void CNhdBoundaryGrid::buttonPressed(int row, int col) {
  Object& it = *object(row);
  const bool isData = subRowOf(row) == kDataRow;
  if (col == kViewColumn) {
    page().document().host().openFile((isData ? it.dataFile : it.directionFile).fileName.absolute());
  } else if (isData) {
    chooseData(it, boundaryOf(row));
  } else {
    chooseDirection(it, boundaryOf(row));
  }
}

void CNhdBoundaryGrid::chooseData(Object& object, int number) {
  SetupHost& host = page().document().host();
  if (object.dataFormat == Object::kSineSeries) {
    CNhdSineSeriesDlg dialog(object, page().document().units());
    if (!host.editForm(dialog.title(), dialog.form(), [&dialog] { return dialog.fault(); })) return;
    dialog.OnOK(object);
    UpdateDoc();
    return;
  }
  const bool isSeries = object.dataFormat == Object::kType0File || object.dataFormat == Object::kRatingCurve;
  const Text& filter = object.dataFormat == Object::kRatingCurve ? texts::ratingCurveFilter
                       : isSeries                                ? texts::timeSeriesFilter
                                                                 : texts::profileFilter;
  const bool hasItems = object.dataFormat != Object::kTransferFile;
  CVdFileSelectorDlg selector((isSeries ? texts::seriesExtension : texts::profileExtension).format,
                              object.dataFile.fileName.text(), filter.format,
                              hasItems ? object.dataFile.items : std::vector<std::uint32_t>(), 1);
  object.RequestDataFile(selector, number);
  selector.SetChooser(&host);
  if (selector.DoModal() != 1) return;
  object.dataFile.fileName.Set(selector.fileName(), page().document().path());
  object.dataFile.items = selector.GetSelectedItems();
  if (object.dataFormat == Object::kRatingCurve) object.dataFile.SetNoItems(1);
  UpdateDoc();
}

void CNhdBoundaryGrid::chooseDirection(Object& object, int number) {
  SetupHost& host = page().document().host();
  CVdFileSelectorDlg selector(texts::profileExtension.format, object.directionFile.fileName.text(),
                              texts::flowDirectionFilter.format, object.directionFile.items, 1);
  object.RequestDirectionFile(selector, number);
  selector.SetChooser(&host);
  if (selector.DoModal() != 1) return;
  object.directionFile.fileName.Set(selector.fileName(), page().document().path());
  object.directionFile.items = selector.GetSelectedItems();
  UpdateDoc();
}

}  // namespace gridbay

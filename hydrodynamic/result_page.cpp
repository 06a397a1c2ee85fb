#include "hydrodynamic/result_page.h"

#include <fmt/format.h>

#include <algorithm>
#include <limits>

#include "families/points_dialog.h"
#include "hydrodynamic/infiltration.h"
#include "hydrodynamic/page_texts.h"
#include "hydrodynamic/resistance.h"
#include "pages/scan.h"
#include "platform/units/units.h"

namespace gridbay {
namespace {

using Output = CNhdResultObjectKvs;

// The file that goes with an output; none for a type that is none of the three, along both directions.
FileKind fileKind(const Output& output) {
  const Extent extent = extentOf(output.part);
  if (extent == Extent::point || output.type == Output::kPoints) return resultFileKind(Extent::point);
  if (extent == Extent::line || output.type == Output::kLine) return resultFileKind(Extent::line);
  return output.type == Output::kMap ? resultFileKind(Extent::map) : FileKind{};
}

// Numbers between commas; nothing when one of them is none. An empty text has no numbers.
std::optional<std::vector<double>> numbersOf(std::string_view text) {
  std::vector<double> numbers;
  if (text.empty()) return numbers;
  for (std::size_t start = 0; start <= text.size();) {
    const std::size_t end = std::min(text.find(',', start), text.size());
    const std::optional<double> number = scannedReal(text.substr(start, end - start));
    if (!number) return std::nullopt;
    numbers.push_back(*number);
    start = end + 1;
  }
  return numbers;
}

std::string numbersText(const std::vector<double>& numbers, int count) {
  std::string text;
  for (int i = 0; i < count; ++i)
    text += fmt::format("{}{:.0f}", i == 0 ? "" : ",", numbers[static_cast<std::size_t>(i)]);
  return text;
}

// The items that an output can have in this model, by their numbers.
Choices itemsOffered(const HydrodynamicParts& model) {
  Choices items = Choices::numbered(
      {" Water depth", " P flux", " Q flux", " Surface elevation", " U-velocity", " V-velocity",
       " Still water depth", " Shear stress x-direction", " Shear stress y-direction", " Shear stress size",
       " Current Speed", " Current Direction", " Froude No."},
      1);
  using Infiltration = CNhdInfiltrationKvs;
  const std::int32_t infiltration = model.nhdInfiltration->infiltrationType;
  if (model.nhdResistance->formulation == CNhdResistanceKvs::kWaveInduced)
    items.Add({Output::kManningNumber, " Manning No."});
  if (infiltration == Infiltration::kCapacity) items.Add({Output::kSaturation, " Saturation"});
  if (infiltration == Infiltration::kNetRate || infiltration == Infiltration::kCapacity)
    items.Add({Output::kInfiltratedVolume, " Infiltrated Volume"});
  return items;
}

std::int64_t bitsOf(const std::vector<std::int32_t>& items, const Choices& offered) {
  std::int64_t bits = 0;
  for (const std::int32_t item : items) {
    if (const int place = offered.placeOf(item); place >= 0) bits |= std::int64_t{1} << place;
  }
  return bits;
}

std::vector<std::int32_t> itemsOf(std::int64_t bits, const Choices& offered) {
  std::vector<std::int32_t> items;
  for (int place = 0; offered.valueAt(place); ++place) {
    if ((bits >> place & 1) != 0) items.push_back(*offered.valueAt(place));
  }
  return items;
}

}  // namespace

void CResultGrid::LayOut() {
  const auto output = [this](GridRow row) {
    return parts<HydrodynamicParts>().nhdResult->outputs.GetItem(row.item);
  };
  Rows([this] { return parts<HydrodynamicParts>().nhdResult->outputs.GetCount(); });
  const auto kind = [output](GridRow row) { return fileKind(*output(row)); };
  const FileChoice file = resultFileOf(output, &Output::file, kind);

  // A type that is none of the list is shown all the same.
  List("Type", 45, output, &Output::type, Choices::lines("0\r\n1\r\n2\r\n")).get = [output](GridRow row) {
    return std::to_string(output(row)->type);
  };
  Shown("Area", 45, [](GridRow) { return std::to_string(Output::kAreaNumber); }).Static();
  const Column::Pick pick = pointsOrPart(output);
  pointsOrRange("J", &Output::pointsJ, &Output::pointsK, &USubArea::x).Picks(pick);
  pointsOrRange("K", &Output::pointsK, &Output::pointsJ, &USubArea::y).Picks(pick);
  Range("Time", 60, [output](GridRow row) { return &output(row)->steps; });
  Button("...", 20, [this, output](GridRow row) { choosePart(*output(row)); });
  ResultFile("Data File", 160, file);
  BrowseBeside(file);
  Text("Title", 120, output, &Output::title);
  chooseItems();
  View(texts::view.format, 45, file);
}

// The cell of J or K: the coordinates of points, or a range.
Column& CResultGrid::pointsOrRange(std::string_view header, std::vector<double> Output::*points,
                                   std::vector<double> Output::*others, USubLine USubArea::*range) {
  const auto output = [this](GridRow row) -> Output& {
    return *parts<HydrodynamicParts>().nhdResult->outputs.GetItem(row.item);
  };
  Column& column = Range(header, 60, [output, range](GridRow row) { return &(output(row).part.*range); });
  column.get = [output, points, shown = column.get](GridRow row) {
    const Output& it = output(row);
    return it.type == Output::kPoints ? numbersText(it.*points, it.PointCount()) : shown(row);
  };
  column.set = [output, points, others, stored = column.set](GridRow row, std::string_view text) {
    Output& it = output(row);
    if (it.type != Output::kPoints) return stored(row, text);
    if (text == numbersText(it.*points, it.PointCount())) return Stored::taken;
    const std::optional<std::vector<double>> numbers = numbersOf(text);
    if (!numbers) return Stored::refused;
    it.*points = *numbers;
    (it.*others).resize(std::max((it.*others).size(), numbers->size()));
    return Stored::taken;
  };
  return column;
}

Column::Pick CResultGrid::pointsOrPart(const std::function<Output*(GridRow)>& output) {
  const Column::Pick part = partPick([output](GridRow row) { return &output(row)->part; },
                                     [](GridRow) { return Output::kAreaNumber; },
                                     [output](GridRow row) { return output(row)->type == Output::kLine; });
  const auto wanted = [output, part](GridRow row) {
    const Output& it = *output(row);
    std::optional<CellPick> pick = part.wanted(row);
    if (it.type != Output::kPoints) return pick;
    pick->shape = CellPick::Shape::points;
    pick->most = std::numeric_limits<std::size_t>::max();
    pick->held.clear();
    for (std::size_t i = 0; i < static_cast<std::size_t>(it.PointCount()); ++i)
      pick->held.push_back(
          {.point = {static_cast<std::int32_t>(it.pointsJ[i]), static_cast<std::int32_t>(it.pointsK[i])}});
    return pick;
  };
  const auto take = [output, part](GridRow row, std::span<const PickedPlace> places) {
    Output& it = *output(row);
    if (it.type != Output::kPoints) return part.take(row, places);
    it.pointsJ.clear();
    it.pointsK.clear();
    for (const PickedPlace& place : places) {
      it.pointsJ.push_back(place.point.j);
      it.pointsK.push_back(place.point.k);
    }
    return Stored::taken;
  };
  return {wanted, take};
}

void CResultGrid::choosePart(Output& output) {
  const ResultLimits limits = output.Limits();
  if (output.type != Output::kPoints) {
    const bool isLine = output.type == Output::kLine;
    if (chooseResultPart(document(), limits, Output::kAreaNumber, output.part, output.steps, isLine))
      UpdateDoc();
    return;
  }
  if (!hasAreaOrTells(document(), limits)) return;
  CPoints4Dlg dialog(document(), output.pointsJ, output.pointsK, limits, output.steps);
  if (dialog.DoModal() != 1) return;
  output.pointsJ = dialog.j();
  output.pointsK = dialog.k();
  output.steps = dialog.steps();
  UpdateDoc();
}

// A mask that is stored as it is shown leaves the items as they are, in their order and with those that are
// not offered.
void CResultGrid::chooseItems() {
  const auto items = [this](GridRow row) -> std::vector<std::int32_t>& {
    return parts<HydrodynamicParts>().nhdResult->outputs.GetItem(row.item)->items;
  };
  const auto offered = [this](GridRow) { return itemsOffered(parts<HydrodynamicParts>()); };
  MultiChoice(
      "Output Items", 140, [items, offered](GridRow row) { return bitsOf(items(row), offered(row)); },
      [items, offered](GridRow row, std::int64_t bits) {
        if (bits != bitsOf(items(row), offered(row))) items(row) = itemsOf(bits, offered(row));
      },
      offered)
      .Tip([](GridRow) { return std::string(texts::outputItems.format); });
}

void CResultDlg::DoDataExchange(Form& form) {
  using Results = CNhdResultKvs;
  const auto results = objectOf(&HydrodynamicParts::nhdResult);
  const auto outputs = [results]() -> auto& {
    return results().outputs;
  };
  const auto isInundation = [results] { return results().includeInundationStatistics; };
  const auto size = [&form, results](std::string_view label, double (Results::*megabytes)()) -> Control& {
    return form.Shown(label,
                      [results, megabytes] { return formatted(texts::megabytes, (results().*megabytes)()); });
  };

  form.Count("Number of Output Areas", countOf(outputs), Results::kMostOutputs);
  size("Size of HD output", &Results::OutputSizeMB).Beside();
  size("Size of total output", &Results::TotalSizeMB).Beside();
  form.Grid("Output areas", outputs_);
  form.Check(texts::generateHotStart.format, results, &Results::generateHotStart).Caption([results] {
    return hotStartCaption(texts::generateHotStart.format, results().generateHotStart,
                           results().HotStartSizeMB());
  });
  form.Grid("Hot start files", hotStarts_);
  form.Check("Calculation of inundation statistics", results, &Results::includeInundationStatistics);
  const auto kind = [](GridRow) { return resultFileKind(Extent::map); };
  const auto holder = [results](GridRow) -> Results& { return results(); };
  AddFile(form, "Inundation file", resultFileOf(holder, &Results::inundationFile, kind))
      .EnabledIf(isInundation);
  form.Number("Update frequency", results, &Results::inundationStoreStep).EnabledIf(isInundation);
  form.Check("Include duration above threshold depth item", results, &Results::durationAboveThreshold)
      .EnabledIf(isInundation);
  form.Number("Threshold depth", results, &Results::thresholdHeight, item::kFloodDepth)
      .EnabledIf([results, isInundation] { return isInundation() && results().durationAboveThreshold; });
}

}  // namespace gridbay

#include "hydrodynamic/source_sink_page.h"

#include "basic/basic_parts.h"
#include "basic/page_texts.h"
#include "basic/source_sink.h"
#include "hydrodynamic/hydrodynamic_parts.h"
#include "hydrodynamic/page_texts.h"
#include "hydrodynamic/source_sink.h"
#include "platform/units/units.h"

namespace gridbay {
namespace {

using Entry = CNhdSourceSinkObjectKvs;
using Flows = CNhdSourceSinkKvs;

// A file that has just been chosen says what its items are called.
void takeItemNames(Entry& entry) {
  const CVdFileSelectorDlg file({}, entry.dataFile.fileName.absolute());
  const auto nameOf = [&](std::size_t place) {
    const auto& items = entry.dataFile.items;
    return place < items.size() ? file.GetNameOfItem(static_cast<int>(items[place])) : std::string();
  };
  entry.itemMagnitude = nameOf(0);
  entry.itemVelocity = nameOf(1);
}

}  // namespace

std::string CNhdSourceSinkGrid::RowHeader(GridRow row) {
  const CSourceSinkObjectKvs* location = parts<BasicParts>().sourceSink->GetItem(row);
  return formatted(texts::sourceRow, row.item) + (location == nullptr ? "" : location->Text());
}

void CNhdSourceSinkGrid::LayOut() {
  constexpr int kNumberWidth = 80;
  constexpr int kNameWidth = 130;
  const auto entry = RowsOf(&HydrodynamicParts::nhdSourceSink);
  const auto isFile = [entry](GridRow row) { return entry(row)->dataFormat == Entry::kFromFile; };
  const auto isConstant = [isFile](GridRow row) { return !isFile(row); };
  const auto hasVelocity = [entry](GridRow row) { return entry(row)->NoItems(row) > 1; };
  FileChoice file = fileOf(entry, &Entry::dataFile, texts::sourceSeriesFile, &Entry::RequestDataFile);
  file.chosen = [entry](GridRow row) { takeItemNames(*entry(row)); };

  List("Type", 100, entry, &Entry::dataFormat,
       Choices{{Entry::kConstant, "Constant value"}, {Entry::kFromFile, "From file"}});
  Number("Magnitude", kNumberWidth, entry, &Entry::constantMagnitude, item::kDischarge).EnabledIf(isConstant);
  Number("Velocity", kNumberWidth, entry, &Entry::constantVelocity, item::kFlowVelocity)
      .EnabledIf([=](GridRow row) { return isConstant(row) && hasVelocity(row); });
  Number("Outlet Dir.", kNumberWidth, entry, &Entry::outletDirection, item::kFlowDirection)
      .EnabledIf(hasVelocity);
  FileName("File name", 210, file).EnabledIf(isFile);
  Text("Item Name Magnitude", kNameWidth, entry, &Entry::itemMagnitude)
      .EnabledIf(isFile)
      .Tip([entry](GridRow row) { return entry(row)->itemMagnitude; });
  Text(" Item Name Velocity", kNameWidth, entry, &Entry::itemVelocity)
      .EnabledIf([=](GridRow row) { return isFile(row) && hasVelocity(row); })
      .Tip([entry](GridRow row) { return entry(row)->itemVelocity; });
  Browse("...", 30, file).EnabledIf(isFile).header = " ... ";
  View(texts::view.format, 45, file, isFile).header = texts::view.format;
}

void CNhdSourceSinkDlg::DoDataExchange(Form& form) {
  const auto flows = objectOf(&HydrodynamicParts::nhdSourceSink);
  const auto mayBeNet = [flows] {
    return flows().precipitationKind != Flows::kConstant || flows().precipitation != 0;
  };
  struct Water {
    std::int32_t Flows::*kind;
    float Flows::*value;
    UTsbSelection Flows::*file;
    FileKind map;
    void (Flows::*request)(CVdFileSelectorDlg&);
  };
  const auto listWater = [&](const Water& water) {
    const auto isConstant = [flows, kind = water.kind] { return flows().*kind == Flows::kConstant; };
    const auto fileKind = [flows, water](GridRow) {
      return flows().*water.kind == Flows::kMap ? water.map : texts::rainSeriesFile;
    };
    const auto request = [flows, ask = water.request](CVdFileSelectorDlg& selector, GridRow) {
      (flows().*ask)(selector);
    };
    form.List("Given as", Choices::numbered({"Constant", "Type 0", "Type 2"}), flows, water.kind);
    form.Number("Value", flows, water.value, item::kRainAndEvaporation).EnabledIf(isConstant);
    AddFile(form, "File name", fileOf([flows](GridRow) { return &flows(); }, water.file, fileKind, request))
        .EnabledIf([isConstant] { return !isConstant(); });
  };

  form.Group("Evaporation",
             [&] {
               listWater({&Flows::evaporationKind, &Flows::evaporation, &Flows::evaporationFile,
                          texts::evaporationMapFile, &Flows::RequestEvaporation});
             })
      .EnabledIf([flows, mayBeNet] { return !(mayBeNet() && flows().netPrecipitation); });
  form.Group(
          "Precipitation",
          [&] {
            listWater({&Flows::precipitationKind, &Flows::precipitation, &Flows::precipitationFile,
                       texts::precipitationMapFile, &Flows::RequestPrecipitation});
            form.Check("Included as net-precipitation", flows, &Flows::netPrecipitation).EnabledIf(mayBeNet);
            form.Check("Precipitation on dry land", flows, &Flows::rainOnDryLand);
          })
      .Beside();
  form.Grid("Sources and sinks", grid_);
}

}  // namespace gridbay

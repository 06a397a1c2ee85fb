#include "mud_transport_expanded/wave_database_page.h"

#include <limits>

#include "mud_transport_expanded/mud_transport_expanded_parts.h"
#include "mud_transport_expanded/page_texts.h"
#include "mud_transport_expanded/texts.h"
#include "mud_transport_expanded/wave_database.h"
#include "platform/units/units.h"

namespace gridbay {
namespace {

using Database = CNmtExpWaveDatabaseKvs;

}  // namespace

void CNmtExpWaveDatabaseGrid::LayOut() {
  const auto database = [this]() -> Database& {
    return *parts<MudTransportExpandedParts>().nmtExpWaveDatabase;
  };
  const auto map = [database](GridRow row) { return database().maps.GetItem(row.item); };
  Rows([database] { return database().maps.GetCount(); });
  const auto axis = [&](std::string_view header, float Database::*start, float Database::*increment,
                        std::int32_t WaveCounts::*place, int quantity) {
    const auto value = [=](GridRow row) -> std::optional<double> {
      const std::int32_t number = database().PlaceOf(row.item).*place;
      return double{database().*start} + (number - 1) * double{database().*increment};
    };
    Number(
        header, 90, RealGetter(value), [](GridRow, double) { return false; }, quantity)
        .ReadOnlyIf([](GridRow) { return true; });
  };
  axis("Wind speed", &Database::windSpeedStart, &Database::windSpeedIncrement, &WaveCounts::windSpeeds,
       item::kWindSpeed);
  axis("Water level", &Database::waterLevelStart, &Database::waterLevelIncrement, &WaveCounts::waterLevels,
       item::kWaterLevel);
  axis("Wind direction", &Database::windDirectionStart, &Database::windDirectionIncrement,
       &WaveCounts::windDirections, item::kWindDirection);
  File({.file = fileOf(map, &CNmtExpWaveDatabaseObjectKvs::file, texts::waveMapFile,
                       &CNmtExpWaveDatabaseObjectKvs::RequestDataFile)});
}

// What is left is tested at once: the increments of all axes, and how many maps they would have.
void CNmtExpWaveDatabaseDlg::DoDataExchange(Form& form) {
  const auto database = objectOf(&MudTransportExpandedParts::nmtExpWaveDatabase);
  const auto value = [this, database](float Database::*member) {
    Binding<float> binding = memberOf(database, member);
    binding.set = [this, database, member](float wanted) {
      if (database().*member == wanted) return;
      database().*member = wanted;
      tellZeroIncrement();
    };
    return binding;
  };
  const auto count = [this, database](std::int32_t Database::*member, std::int32_t WaveCounts::*axis) {
    Binding<std::int32_t> binding = memberOf(database, member);
    binding.set = [this, database, axis](std::int32_t wanted) {
      WaveCounts counts = database().counts();
      counts.*axis = wanted;
      if (counts.product() > Database::kMostMaps && counts.product() > database().counts().product()) {
        document().host().show(formatted(texts::waveMapsOnPage));
        return;
      }
      database().SetCounts(counts);
      tellZeroIncrement();
    };
    return binding;
  };
  const auto axis = [&](std::string_view label, float Database::*start, float Database::*increment,
                        std::int32_t Database::*member, std::int32_t WaveCounts::*place, int quantity) {
    form.Group(label, [&] {
      form.Number("Start:", value(start), quantity);
      form.Number("Increment:", value(increment), quantity).Beside();
      form.Count("Number:", count(member, place), std::numeric_limits<std::int32_t>::max(),
                 Database::kMostMaps, 1)
          .Beside();
    });
  };
  axis("Wind speed", &Database::windSpeedStart, &Database::windSpeedIncrement, &Database::windSpeeds,
       &WaveCounts::windSpeeds, item::kWindSpeed);
  axis("Wind direction", &Database::windDirectionStart, &Database::windDirectionIncrement,
       &Database::windDirections, &WaveCounts::windDirections, item::kWindDirection);
  axis("Water level", &Database::waterLevelStart, &Database::waterLevelIncrement, &Database::waterLevels,
       &WaveCounts::waterLevels, item::kWaterLevel);
  form.Grid("Wave maps", grid_);
}

void CNmtExpWaveDatabaseDlg::tellZeroIncrement() {
  if (parts<MudTransportExpandedParts>().nmtExpWaveDatabase->HasZeroIncrement())
    document().host().show(formatted(texts::waveIncrementZero));
}

}  // namespace gridbay

#pragma once

#include <cstdint>
#include <string>
#include <string_view>

#include "core/file_name.h"
#include "core/list_kvs.h"

namespace gridbay {

class CVdFileSelectorDlg;

// The waves that belong to one wind speed, water level and wind direction: a file.
class CNmtExpWaveDatabaseObjectKvs final : public TableKvs<CNmtExpWaveDatabaseObjectKvs> {
 public:
  using TableKvs::TableKvs;

  UFileName file;

  // On file under a keyword of the database.
  struct FileRow {
    void save(const CNmtExpWaveDatabaseObjectKvs&, KvsFile&, const std::string&) const {}
    void load(CNmtExpWaveDatabaseObjectKvs&, KvsSection, const std::string&) const {}
    void copy(CNmtExpWaveDatabaseObjectKvs& map, const CNmtExpWaveDatabaseObjectKvs& other) const {
      map.file = other.file;
    }
    static constexpr auto members() { return std::tuple(&CNmtExpWaveDatabaseObjectKvs::file); }
  };
  static constexpr auto table() { return keywords(FileRow{}); }

  unsigned Validate(ValidationList& messages, int deep) override;
  void RequestDataFile(CVdFileSelectorDlg& selector, int number);
};

// How many values each axis of the database has.
struct WaveCounts {
  std::int32_t windSpeeds = 1;
  std::int32_t waterLevels = 1;
  std::int32_t windDirections = 1;

  // Of all three; a count below 1 has no maps.
  std::int64_t product() const;
};

// Waves by wind speed, water level and wind direction. Each has a first value, an increment and a count; the
// maps are a list in which the direction runs fastest and the speed slowest.
class CNmtExpWaveDatabaseKvs final : public TableKvs<CNmtExpWaveDatabaseKvs> {
  using Self = CNmtExpWaveDatabaseKvs;

 public:
  static constexpr int kMostMaps = 120;
  // That are held; of more than may be, so that they can be told of.
  static constexpr int kMostHeld = 2048;

  explicit CNmtExpWaveDatabaseKvs(CKvsBase* parent) : TableKvs(parent) { maps.SetCount(1); }

  float windSpeedStart = 5;  // m/s
  float windSpeedIncrement = 5;
  std::int32_t windSpeeds = 1;
  float windDirectionStart = 90;  // degrees
  float windDirectionIncrement = 90;
  std::int32_t windDirections = 1;
  float waterLevelStart = 0;  // metres
  float waterLevelIncrement = 1;
  std::int32_t waterLevels = 1;
  ItemList<CNmtExpWaveDatabaseObjectKvs> maps{this};

  WaveCounts counts() const { return {windSpeeds, waterLevels, windDirections}; }
  // Each map stays with its speed, level and direction.
  void SetCounts(const WaveCounts& wanted);
  // The place (each from 1) of map `number`, from 1.
  WaveCounts PlaceOf(int number) const;
  // Whether an axis of more than one value does not go on.
  bool HasZeroIncrement() const;

  unsigned Validate(ValidationList& messages, int deep) override;

  // A count; by its path the maps follow it at once.
  struct CountRow : Keyword<Self, std::int32_t> {
    void set(Self& database, KvsSection from, const std::string& documentPath) const;
  };
  // A keyword for each map.
  struct MapsRow : ListRow<ListMember<Self, CNmtExpWaveDatabaseObjectKvs>> {
    void save(const Self& database, KvsFile& file, const std::string& documentPath) const;
    void load(Self& database, KvsSection from, const std::string& documentPath) const;
    bool access(Self& database, std::string_view path, PathAccess& access) const;
  };

  static constexpr auto table() {
    return section(
        "WAVE_DATABASE_PARAMETERS",
        section("WIND_SPEED", keyword("Starting_value_of_windspeed", &Self::windSpeedStart),
                keyword("Increment_value_of_windspeed", &Self::windSpeedIncrement),
                CountRow{{"Number_of_windspeeds", &Self::windSpeeds}}),
        section("WIND_DIRECTION", keyword("Starting_value_of_wind_direction", &Self::windDirectionStart),
                keyword("Increment_value_of_wind_direction", &Self::windDirectionIncrement),
                CountRow{{"Number_of_wind_directions", &Self::windDirections}}),
        section("WATER_LEVEL", keyword("Starting_value_of_water_level", &Self::waterLevelStart),
                keyword("Increment_value_of_water_level", &Self::waterLevelIncrement),
                CountRow{{"Number_of_water_levels", &Self::waterLevels}}),
        MapsRow{{{&Self::maps}}});
  }

 private:
  std::string keywordOf(int number) const;
};

}  // namespace gridbay

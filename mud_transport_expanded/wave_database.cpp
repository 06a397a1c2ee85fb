#include "mud_transport_expanded/wave_database.h"

#include <algorithm>
#include <vector>

#include "core/table_code.h"
#include "families/data_files.h"
#include "mud_transport_expanded/texts.h"
#include "mud_transport_expanded/waves.h"

namespace gridbay {
namespace {

constexpr PageId kPage = PageId::mtExpWaveDatabase;
constexpr Text kMapKeyword{"Data_Base_File_Name_%d_%d_%d"};

int heldMaps(const WaveCounts& counts) {
  return static_cast<int>(std::min<std::int64_t>(counts.product(), CNmtExpWaveDatabaseKvs::kMostHeld));
}

// Where a place stands in the list, from 0; -1 for one that the counts do not have.
std::int64_t indexOf(const WaveCounts& place, const WaveCounts& counts) {
  if (place.windSpeeds > counts.windSpeeds || place.waterLevels > counts.waterLevels ||
      place.windDirections > counts.windDirections)
    return -1;
  const std::int64_t row = std::int64_t{place.windSpeeds - 1} * counts.waterLevels + place.waterLevels - 1;
  return row * counts.windDirections + place.windDirections - 1;
}

}  // namespace

std::int64_t WaveCounts::product() const {
  constexpr std::int64_t kEnough = 1 << 20;  // beyond what any database has
  std::int64_t product = 1;
  for (const std::int32_t count : {windSpeeds, waterLevels, windDirections})
    product = std::min(product * std::max(count, 0), kEnough);
  return product;
}

unsigned CNmtExpWaveDatabaseObjectKvs::Validate(ValidationList& messages, int) {
  CVdFileSelectorDlg selector;
  RequestDataFile(selector, 0);
  return checkDataFile(messages, kPage, selector, file);
}

void CNmtExpWaveDatabaseObjectKvs::RequestDataFile(CVdFileSelectorDlg& selector, int) {
  requestWaveMaps(selector, *this);
}

void CNmtExpWaveDatabaseKvs::SetCounts(const WaveCounts& wanted) {
  std::vector<UFileName> files(static_cast<std::size_t>(heldMaps(wanted)));
  for (int number = 1; number <= maps.GetCount(); ++number) {
    const std::int64_t index = indexOf(PlaceOf(number), wanted);
    if (index >= 0 && index < static_cast<std::int64_t>(files.size()))
      files[static_cast<std::size_t>(index)] = maps.at(number).file;
  }
  windSpeeds = wanted.windSpeeds;
  waterLevels = wanted.waterLevels;
  windDirections = wanted.windDirections;
  maps.SetCount(static_cast<int>(files.size()));
  for (int number = 1; number <= maps.GetCount(); ++number)
    maps.at(number).file = files[static_cast<std::size_t>(number) - 1];
}

WaveCounts CNmtExpWaveDatabaseKvs::PlaceOf(int number) const {
  const int index = number - 1;
  const int directions = std::max(windDirections, 1);
  const int levels = std::max(waterLevels, 1);
  return {index / directions / levels + 1, index / directions % levels + 1, index % directions + 1};
}

bool CNmtExpWaveDatabaseKvs::HasZeroIncrement() const {
  return (windSpeedIncrement == 0 && windSpeeds > 1) || (windDirectionIncrement == 0 && windDirections > 1) ||
         (waterLevelIncrement == 0 && waterLevels > 1);
}

unsigned CNmtExpWaveDatabaseKvs::Validate(ValidationList& messages, int deep) {
  unsigned faults = 0;
  if (counts().product() > kMostMaps)
    faults += report(messages, kPage, Severity::fault, texts::tooManyWaveMaps);
  for (int number = 1; deep != 0 && number <= maps.GetCount(); ++number)
    faults += checkedEntry(messages, {number, maps.GetCount()},
                           [&] { return maps.at(number).Validate(messages, deep); });
  return faults;
}

std::string CNmtExpWaveDatabaseKvs::keywordOf(int number) const {
  const WaveCounts place = PlaceOf(number);
  return formatted(kMapKeyword, place.windSpeeds, place.waterLevels, place.windDirections);
}

void CNmtExpWaveDatabaseKvs::CountRow::set(Self& database, KvsSection from,
                                           const std::string& documentPath) const {
  const WaveCounts before = database.counts();
  load(database, from, documentPath);
  const WaveCounts wanted = database.counts();
  database.windSpeeds = before.windSpeeds;
  database.waterLevels = before.waterLevels;
  database.windDirections = before.windDirections;
  database.SetCounts(wanted);
}

void CNmtExpWaveDatabaseKvs::MapsRow::save(const Self& database, KvsFile& file,
                                           const std::string& documentPath) const {
  for (int number = 1; number <= database.maps.GetCount(); ++number)
    database.maps.GetItem(number)->file.Save(file, documentPath, database.keywordOf(number));
}

void CNmtExpWaveDatabaseKvs::MapsRow::load(Self& database, KvsSection from,
                                           const std::string& documentPath) const {
  database.maps.SetCount(heldMaps(database.counts()));
  for (int number = 1; number <= database.maps.GetCount(); ++number)
    database.maps.at(number).file.Load(from, documentPath, database.keywordOf(number));
}

bool CNmtExpWaveDatabaseKvs::MapsRow::access(Self& database, std::string_view path,
                                             PathAccess& access) const {
  if (access.onlySections) return false;
  for (int number = 1; number <= database.maps.GetCount(); ++number) {
    const std::string name = database.keywordOf(number);
    if (!sameName(path, name)) continue;
    UFileName& file = database.maps.at(number).file;
    if (access.what == PathAccess::What::write) file.Save(*access.out, *access.documentPath, name);
    if (access.what == PathAccess::What::set) file.Load(access.in, *access.documentPath, name);
    return true;
  }
  return false;
}

}  // namespace gridbay

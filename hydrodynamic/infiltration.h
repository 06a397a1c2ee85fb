#pragma once

#include <cstdint>
#include <string>

#include "core/file_selector.h"
#include "core/selections.h"
#include "core/table_kvs.h"

namespace gridbay {

// How water leaves the surface into the ground, for the whole model. Its maps fit Area 1.
class CNhdInfiltrationKvs final : public TableKvs<CNhdInfiltrationKvs> {
 public:
  enum Type : std::int32_t { kNone = 0, kNetRate = 1, kCapacity = 2 };
  enum Format : std::int32_t { kConstantInTime = 2, kVaryingInTime = 3 };
  enum GroundwaterDepth : std::int32_t { kDepth = 1, kLevel = 2 };
  enum InitialVolume : std::int32_t { kPercentage = 1, kWaterContent = 2 };
  static constexpr int kCapacityItems = 5;

  using TableKvs::TableKvs;

  std::int32_t infiltrationType = kNone;
  std::int32_t infiltrationFormat = kConstantInTime;  // of a net rate; a capacity is constant in time
  std::int32_t groundwaterDepthType = kDepth;
  std::int32_t initialVolumeType = kPercentage;
  UTsbSelection netRateFile{1};
  UTsbSelection capacityFile{kCapacityItems};

  // The file of the type; none without infiltration.
  UTsbSelection* File();
  const UTsbSelection* File() const { return const_cast<CNhdInfiltrationKvs*>(this)->File(); }

  // On file with a type; that of a capacity has one value, and is not read.
  struct FormatRow : Keyword<CNhdInfiltrationKvs, std::int32_t> {
    void save(const CNhdInfiltrationKvs& object, KvsFile& file, const std::string& documentPath) const;
    void load(CNhdInfiltrationKvs& object, KvsSection from, const std::string& documentPath) const;
    bool access(CNhdInfiltrationKvs& object, std::string_view path, PathAccess& access) const;
  };
  struct FileRow {
    void save(const CNhdInfiltrationKvs& object, KvsFile& file, const std::string& documentPath) const;
    void load(CNhdInfiltrationKvs& object, KvsSection from, const std::string& documentPath) const;
    void copy(CNhdInfiltrationKvs& object, const CNhdInfiltrationKvs& other) const;
    static constexpr auto members() {
      return std::tuple(&CNhdInfiltrationKvs::netRateFile, &CNhdInfiltrationKvs::capacityFile);
    }
    bool access(CNhdInfiltrationKvs& object, std::string_view path, PathAccess& access) const;
  };

  // The type comes first: what else is read depends on it.
  static constexpr auto table() {
    using Self = CNhdInfiltrationKvs;
    return section("INFILTRATION", keyword("InfiltrationType", &Self::infiltrationType),
                   FormatRow{{"InfiltrationFormat", &Self::infiltrationFormat}},
                   keyword("GroundwaterDepthType", &Self::groundwaterDepthType),
                   keyword("InitialVolumeType", &Self::initialVolumeType), FileRow{});
  }

  unsigned Validate(ValidationList& messages, int deep) override;

  // What the map of the net rate, and that of the capacity, must be.
  void RequestNetRate(CVdFileSelectorDlg& selector);
  void RequestCapacity(CVdFileSelectorDlg& selector);
};

}  // namespace gridbay

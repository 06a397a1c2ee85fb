#pragma once

#include <cstdint>
#include <string>

#include "core/file_selector.h"
#include "core/selections.h"
#include "core/table_kvs.h"

namespace gridbay {

// The wind that drives the whole model, and its friction on the water. The friction that varies goes from
// friction 1 at speed 1 to friction 2 at speed 2. Speeds in m/s, the direction in degrees that the wind comes
// from, pressures in hPa.
class CWindConditionsKvs final : public TableKvs<CWindConditionsKvs> {
 public:
  enum DataFormat : std::int32_t { kNone = 0, kConstant = 1, kConstantInSpace = 2, kVarying = 3 };
  static constexpr std::int32_t kConstantFriction = 0;
  static constexpr std::int32_t kVaryingFriction = 1;

  using TableKvs::TableKvs;

  std::int32_t dataFormat = kNone;
  float constantDirection = 270.0F;
  float constantSpeed = 10.0F;
  float neutralPressure = 1013.0F;
  UTsbSelection windFile;
  std::int32_t frictionType = kConstantFriction;
  float constantFriction = 0.0026F;
  float friction1 = 0.0016F;
  float friction2 = 0.0026F;
  float speed1 = 0;
  float speed2 = 24.0F;
  std::int32_t airPressureCorrection = 0;

  // Set by its path it brings the items of the file, as it does on the page.
  struct DataFormatRow : Keyword<CWindConditionsKvs, std::int32_t> {
    void set(CWindConditionsKvs& wind, KvsSection from, const std::string& documentPath) const {
      load(wind, from, documentPath);
      wind.SetDataFormat(wind.dataFormat);
    }
  };
  // The wind file has as many items as the data format asks for; one that is not in use is kept as it is.
  struct WindFileRow {
    void save(const CWindConditionsKvs& wind, KvsFile& file, const std::string& documentPath) const {
      wind.windFile.Save(file, documentPath);
    }
    void load(CWindConditionsKvs& wind, KvsSection from, const std::string& documentPath) const;
    void copy(CWindConditionsKvs& wind, const CWindConditionsKvs& other) const {
      wind.windFile.UpdateData(other.windFile);
    }
    static constexpr auto members() { return std::tuple(&CWindConditionsKvs::windFile); }
    bool access(CWindConditionsKvs& wind, std::string_view path, PathAccess& access) const {
      return wind.windFile.Access(path, access);
    }
  };

  static constexpr auto table() {
    using Self = CWindConditionsKvs;
    return section(
        "WIND_CONDITIONS", pinned(DataFormatRow{{"Data_Format", &Self::dataFormat}}, std::int32_t{kNone}),
        keyword("Constant_Wind_Direction", &Self::constantDirection),
        keyword("Constant_Wind_Speed", &Self::constantSpeed),
        keyword("Neutral_Pressure", &Self::neutralPressure),
        flag("IncludeAirPressureCorrections", &Self::airPressureCorrection), WindFileRow{},
        keyword("Type_Of_Wind_Friction", &Self::frictionType),
        keyword("Constant_Friction", &Self::constantFriction), keyword("Linear_Friction_1", &Self::friction1),
        keyword("Linear_Friction_2", &Self::friction2), keyword("Linear_Speed_1", &Self::speed1),
        keyword("Linear_Speed_2", &Self::speed2));
  }

  // What the wind file must be; nothing for a data format without one.
  virtual void RequestFile(CVdFileSelectorDlg& selector);
  unsigned Validate(ValidationList& messages, int deep) override;

  // With the items that the file then has.
  void SetDataFormat(std::int32_t format);
  bool hasFile() const { return dataFormat == kConstantInSpace || dataFormat == kVarying; }
};

}  // namespace gridbay

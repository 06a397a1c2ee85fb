#pragma once

#include "families/area_values.h"

namespace gridbay {

// What an entry has in an area when the calculation begins: a concentration, or the thickness of a layer.
class CNmtInitialObjectKvs final : public ValueOrFileKvs<CNmtInitialObjectKvs> {
 public:
  static constexpr std::int32_t kMap = 1;

  using ValueOrFileKvs::ValueOrFileKvs;

  // Entry and area from 1.
  void RequestDataFile(CVdFileSelectorDlg& selector, int entry, int area);
};

// That of an entry in each area. The thickness of a layer has one format and one constant for all areas,
// those of area 1, which stand on file once, and a map for each area: it is saved and loaded in a form of
// its own.
class CNmtInitialComponentKvs final : public AreaValuesKvs<CNmtInitialComponentKvs, CNmtInitialObjectKvs> {
 public:
  using AreaValuesKvs::AccessPath;
  using AreaValuesKvs::AreaValuesKvs;
  using AreaValuesKvs::Load;
  using AreaValuesKvs::Save;
  using AreaValuesKvs::Validate;

  void Save(KvsFile& file, const std::string& documentPath, bool isThickness);
  void Load(KvsSection section, const std::string& documentPath, bool isThickness);
  bool AccessPath(std::string_view path, PathAccess& access, bool isThickness);

  // Number of the entry, from 1.
  unsigned Validate(ValidationList& messages, int deep, int entry);
  // The area, from 1, whose format and constant hold in an area.
  static int FormatArea(int area, bool isThickness) { return isThickness ? 1 : area; }
};

// The initial conditions of all entries: salinity, the fractions, and in the task of layers the thickness of
// each.
class CNmtInitialConcentrationKvs final
    : public EntryAreasKvs<CNmtInitialConcentrationKvs, CNmtInitialComponentKvs> {
 public:
  using EntryAreasKvs::EntryAreasKvs;

  static constexpr auto table() { return section("INITIAL_CONCENTRATIONS", EntriesRow{}); }

 private:
  // The sections of the entries, by the task.
  struct EntriesRow : ListRow<OwnList> {
    void save(const CNmtInitialConcentrationKvs& entries, KvsFile& file,
              const std::string& documentPath) const;
    void load(CNmtInitialConcentrationKvs& entries, KvsSection from, const std::string& documentPath) const;
    bool access(CNmtInitialConcentrationKvs& entries, std::string_view path, PathAccess& access) const;
  };
};

}  // namespace gridbay

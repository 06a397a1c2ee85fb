#pragma once

#include <cstdint>
#include <string>
#include <tuple>
#include <vector>

#include "families/area_values.h"

namespace gridbay {

// What there is at the start, in one area: a concentration of what is carried, or the thickness of a layer.
enum class ExpInitial { concentration, thickness };

// `what` is not its own affair alone: of a thickness the format and the constant of the first area hold for
// all areas, and stand on file in the entry, once.
template <ExpInitial what>
class ExpInitialObject final : public ValueOrFileKvs<ExpInitialObject<what>> {
  using Base = ValueOrFileKvs<ExpInitialObject>;

  // Kept with the state, and written by the entry.
  struct InEntry {
    void save(const ExpInitialObject&, KvsFile&, const std::string&) const {}
    void load(ExpInitialObject&, KvsSection, const std::string&) const {}
    void copy(ExpInitialObject& object, const ExpInitialObject& other) const {
      object.format = other.format;
      object.value = other.value;
    }
    static constexpr auto members() {
      return std::tuple(&ExpInitialObject::format, &ExpInitialObject::value);
    }
  };

 public:
  static constexpr std::int32_t kMap = 1;

  using Base::Base;
  using Base::Validate;

  static constexpr auto table() {
    if constexpr (what == ExpInitial::thickness) {
      return keywords(InEntry{}, selection(&ExpInitialObject::file, 1));
    } else {
      return Base::table();
    }
  }

  // Given in the format, of area `area` (from 1).
  unsigned Check(ValidationList& messages, std::int32_t givenAs, int area);
  void RequestDataFile(CVdFileSelectorDlg& selector, int entry, int area);
};

// That of one entry in each area.
template <ExpInitial what>
class ExpInitialEntry final : public ListKvs<ExpInitialEntry<what>, ExpInitialObject<what>> {
  using Object = ExpInitialObject<what>;
  using Base = ListKvs<ExpInitialEntry, Object>;

  // A keyword of the entry that is a member of its first area.
  template <class T>
  struct FirstAreaRow {
    std::string_view name;
    T Object::*member;

    void save(const ExpInitialEntry& entry, KvsFile& file, const std::string& documentPath) const {
      if (const Object* first = entry.GetItem(1); first != nullptr)
        putValue(file, name, first->*member, documentPath);
    }
    void load(ExpInitialEntry& entry, KvsSection from, const std::string& documentPath) const {
      if (Object* first = entry.GetItem(1); first != nullptr)
        getValue(from, name, first->*member, documentPath);
    }
    void copy(ExpInitialEntry&, const ExpInitialEntry&) const {}
    static constexpr auto members() { return std::tuple(); }
  };

 public:
  using Base::Base;

  static constexpr auto table() {
    if constexpr (what == ExpInitial::thickness) {
      return keywords(FirstAreaRow<std::int32_t>{"Data_Format", &Object::format},
                      FirstAreaRow<float>{"Constant_Value", &Object::value}, items("AREA_%d"));
    } else {
      return keywords(items("AREA_%d"));
    }
  }
  void initialise(Object& object, int) { object.value = newValue(); }

  // The item whose format and constant hold in an area.
  Object& given(int area) { return this->at(what == ExpInitial::thickness ? 1 : area); }

  unsigned Validate(ValidationList& messages, int deep) override {
    unsigned faults = 0;
    for (int area = 1; deep != 0 && area <= this->GetCount(); ++area)
      faults += checkedEntry(messages, {area, this->GetCount()},
                             [&] { return this->at(area).Check(messages, given(area).format, area); });
    return faults;
  }

 private:
  // Of an area that comes new.
  float newValue();
};

using CNmtExpInitialObjectKvs = ExpInitialObject<ExpInitial::concentration>;
using CNmtExpInitialComponentKvs = ExpInitialEntry<ExpInitial::concentration>;
using CNmtExpInitialThicknessKvs = ExpInitialEntry<ExpInitial::thickness>;

// How the fractions share a layer of the bed: whole percentages.
class CNmtExpBedDistributionObjectKvs final : public TableKvs<CNmtExpBedDistributionObjectKvs> {
 public:
  using TableKvs::TableKvs;

  std::vector<std::int32_t> percentages;  // one for each fraction

  // As many as there are fractions, each with the same share; the first has what is left over as well.
  void Share(int fractions);
  unsigned Validate(ValidationList& messages, int deep) override;

  // There are as many on file as fractions; further ones are not read, and missing ones stay.
  struct PercentagesRow {
    std::string_view name = "Fraction_Distribution";

    void save(const CNmtExpBedDistributionObjectKvs& layer, KvsFile& file, const std::string&) const {
      putValue(file, name, layer.percentages, {});
    }
    void load(CNmtExpBedDistributionObjectKvs& layer, KvsSection from, const std::string&) const {
      int number = 0;
      for (std::int32_t& percentage : layer.percentages) kvsGetParam(from, name, &percentage, 1, ++number);
    }
    void copy(CNmtExpBedDistributionObjectKvs& layer, const CNmtExpBedDistributionObjectKvs& other) const {
      layer.percentages = other.percentages;
    }
    static constexpr auto members() { return std::tuple(&CNmtExpBedDistributionObjectKvs::percentages); }
  };
  static constexpr auto table() { return keywords(PercentagesRow{}); }
};

// What there is in the water and on the bed when the calculation begins.
class CNmtExpInitialConditionsKvs final : public TableKvs<CNmtExpInitialConditionsKvs> {
  using Self = CNmtExpInitialConditionsKvs;

 public:
  explicit CNmtExpInitialConditionsKvs(CKvsBase* parent);

  ItemList<CNmtExpInitialComponentKvs> components;  // salinity, where it is included, at the head
  ItemList<CNmtExpInitialThicknessKvs> thicknesses;
  ItemList<CNmtExpBedDistributionObjectKvs> distribution;

  // The entries in the water, the layers of the bed and the fractions of which they are. The layers are
  // shared anew where either count is another one.
  void SetCounts(int entries, int layers, int fractions);
  // The model has n areas now.
  void SetNoAreas(int n);

  unsigned Validate(ValidationList& messages, int deep) override;

  // The fractions stand on file by their numbers, and salinity behind them by its name.
  struct ComponentsRow : ListRow<ListMember<Self, CNmtExpInitialComponentKvs>> {
    void save(const Self& object, KvsFile& file, const std::string& documentPath) const;
    void load(Self& object, KvsSection from, const std::string& documentPath) const;
    bool access(Self& object, std::string_view path, PathAccess& access) const;
  };
  static constexpr auto table() {
    return keywords(section("INITIAL_CONCENTRATIONS", ComponentsRow{{{&Self::components}}}),
                    section("INITIAL_BED_THICKNESS", items("BED_LAYER_%d", &Self::thicknesses)),
                    section("INITIAL_BED_SEDIMENT_DISTRIBUTION", items("BED_LAYER_%d", &Self::distribution)));
  }
};

}  // namespace gridbay

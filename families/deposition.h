#pragma once

#include "families/area_values.h"

namespace gridbay {

// What settles on the surface, and what comes from the soil, by entry and area. `Surface` and `Soil` are
// AreaValuesKvs, and the two lists are of one length always. An entry may have
//   void Bind(int number)    by which it knows what it is of
// `Self` has kEntrySection, the numbered sections of the entries, or
//   static constexpr auto entryItems(list)    the row of the list whose member this is
// and it may have kSurface and kSoil, which the checks of an item get to tell the two apart.
template <class Self, class Surface, class Soil>
class DepositionKvs : public TableKvs<Self> {
 public:
  explicit DepositionKvs(CKvsBase* parent) : TableKvs<Self>(parent) {}

  bool includeSurface = false;
  ItemList<Surface> surface{this, setUp<Surface>};
  bool includeSoil = false;
  ItemList<Soil> soil{this, setUp<Soil>};

  static constexpr auto table() {
    return section(Self::kSection, keyword("IncludeSurfaceDeposition", &DepositionKvs::includeSurface),
                   section("SurfaceDeposition", entryRow(&DepositionKvs::surface)),
                   keyword("IncludeSoilDeposition", &DepositionKvs::includeSoil),
                   section("SoilDeposition", entryRow(&DepositionKvs::soil)));
  }

  int GetCount() const { return surface.GetCount(); }
  // Takes entries from the tail or appends default ones, in both lists. A negative count does nothing.
  void SetCount(int n) {
    surface.SetCount(n);
    soil.SetCount(n);
  }
  // The model has n areas now.
  void SetNoAreas(int n) {
    for (int entry = 1; entry <= GetCount(); ++entry) {
      surface.GetItem(entry)->SetCount(n);
      soil.GetItem(entry)->SetCount(n);
    }
  }

  // What is not included is not checked.
  unsigned Validate(ValidationList& messages, int deep) override {
    unsigned faults = 0;
    const auto check = [&](auto& list, const auto&... which) {
      for (int entry = 1; entry <= list.GetCount(); ++entry)
        faults += checkedEntry(messages, {entry, list.GetCount()}, [&] {
          return list.GetItem(entry)->Validate(messages, deep, entry, which...);
        });
    };
    if constexpr (requires { Self::kSurface; }) {
      if (includeSurface) check(surface, Self::kSurface);
      if (includeSoil) check(soil, Self::kSoil);
    } else {
      if (includeSurface) check(surface);
      if (includeSoil) check(soil);
    }
    return faults;
  }

 private:
  template <class Entry>
  static constexpr auto entryRow(ItemList<Entry> DepositionKvs::*list) {
    if constexpr (requires { Self::kEntrySection; }) {
      return items(Self::kEntrySection, list);
    } else {
      return Self::entryItems(list);
    }
  }
  template <class Entry>
  static void setUp(CKvsBase& owner, Entry& entry, int number) {
    if constexpr (requires { entry.Bind(number); }) entry.Bind(number);
    entry.SetCount(areaCount(owner));
  }
};

}  // namespace gridbay

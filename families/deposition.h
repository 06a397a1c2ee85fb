#pragma once

#include "families/area_values.h"

namespace gridbay {

// What settles on the surface, and what comes from the soil, by entry and area. `Surface` and `Soil` are
// AreaValuesKvs, and the two lists are of one length always.
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
                   section("SurfaceDeposition", items(Self::kEntrySection, &DepositionKvs::surface)),
                   keyword("IncludeSoilDeposition", &DepositionKvs::includeSoil),
                   section("SoilDeposition", items(Self::kEntrySection, &DepositionKvs::soil)));
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
    for (int entry = 1; includeSurface && entry <= surface.GetCount(); ++entry)
      faults += surface.GetItem(entry)->Validate(messages, deep, entry);
    for (int entry = 1; includeSoil && entry <= soil.GetCount(); ++entry)
      faults += soil.GetItem(entry)->Validate(messages, deep, entry);
    return faults;
  }

 private:
  template <class Entry>
  static void setUp(CKvsBase& owner, Entry& entry, int) {
    entry.SetCount(areaCount(owner));
  }
};

}  // namespace gridbay

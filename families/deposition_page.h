#pragma once

#include "families/area_values_page.h"
#include "families/root_member.h"

namespace gridbay {

// One of the two lists of a DepositionKvs, while it is included. `member` is that of the root that holds the
// deposition; `list` and `include` are those of the list and of its flag.
template <auto member, class Entry, auto list, auto include>
class DepositionGrid : public AreaValuesGrid<Entry> {
 public:
  bool IsEnabled() override { return held().*include; }

 protected:
  auto& held() { return rootMember<member>(this->GetKvs()); }
  int EntryCount() override { return (held().*list).GetCount(); }
  Entry* EntryAt(int number) override { return (held().*list).GetItem(number); }
};

// The surface above, the soil below, each under the check box that includes it. `Words` has their texts as
// `kSurface` and `kSoil`.
template <std::int32_t dialogTemplate, PageId id, auto member, class Words, class SurfaceGrid, class SoilGrid>
class DepositionDlg : public Page<dialogTemplate, id> {
 public:
  using Page<dialogTemplate, id>::Page;

 private:
  void DoDataExchange(Form& form) override {
    const auto deposition = this->objectOf(member);
    using Deposition = std::remove_reference_t<decltype(deposition())>;
    form.Check(Words::kSurface, deposition, &Deposition::includeSurface);
    form.Grid("Surface deposition", surface_);
    form.Check(Words::kSoil, deposition, &Deposition::includeSoil);
    form.Grid("Soil deposition", soil_);
  }

  SurfaceGrid surface_;
  SoilGrid soil_;
};

}  // namespace gridbay

#pragma once

#include <cstdint>
#include <optional>

#include "basic/simulation_period.h"
#include "core/list_kvs.h"
#include "families/data_files.h"
#include "families/transport_texts.h"
#include "platform/units/units.h"

namespace gridbay {

// The map of dispersion coefficients of an area. `Self::kPage` is the page of its messages.
template <class Self>
class DispersionFileKvs : public TableKvs<Self> {
 public:
  using TableKvs<Self>::TableKvs;
  using TableKvs<Self>::Validate;

  UTsbSelection file{1};

  static constexpr auto table() { return keywords(selection(&DispersionFileKvs::file, 1)); }

  // Area from 1.
  unsigned Validate(ValidationList& messages, int, int area) {
    CVdFileSelectorDlg selector;
    RequestDataFile(selector, area);
    return checkDataFile(messages, Self::kPage, selector, file);
  }
  void RequestDataFile(CVdFileSelectorDlg& selector, int area) {
    requestVaryingMap(selector, *this, area, texts::dispersionRequest, item::kDispersionCoefficient);
  }
};

// The smallest spacing along x and along y of all areas whose grids are known, each by itself (metres);
// nothing while none is.
struct GridSpacing {
  float dx;
  float dy;
};
std::optional<GridSpacing> smallestSpacing(CKvsBase& object);

// Whether the explicit scheme becomes unstable with such a dispersion: dt / dx² fx + dt / dy² fy >= 0.5, in
// the precision of the values. Time step in seconds, spacings in metres.
template <class Real>
bool isTooMuchDispersion(Real dt, Real dx, Real dy, Real factorX, Real factorY) {
  return dt / (dx * dx) * factorX + dt / (dy * dy) * factorY >= Real{0.5};
}

// How a module disperses what it carries: in proportion to the current, or by coefficients of their own along
// x and along y, each a constant or a map for each area. `Self` names its section and page by `kSection` and
// `kPage`, and the text for a missing area by `kAreaMissing`.
template <class Self, class Item, class Real = float>
class DispersionCoefKvs : public TableKvs<Self> {
 public:
  enum Format : std::int32_t { kConstant = 0, kFromFile = 1 };

  explicit DispersionCoefKvs(CKvsBase* parent) : TableKvs<Self>(parent) {}

  std::int32_t proportional = 0;  // 1: to the current
  Real factorX = 1;               // m²/s, like all that follows
  Real factorY = 1;
  Real minimum = 0;
  Real maximum = 0;
  std::int32_t formatX = kConstant;
  Real constantX = 0;
  ItemList<Item> filesX{this};
  std::int32_t formatY = kConstant;
  Real constantY = 0;
  ItemList<Item> filesY{this};

  static constexpr auto table() {
    using Coefs = DispersionCoefKvs;
    return section(Self::kSection, keyword("Dispersion_Prop_to_Current", &Coefs::proportional),
                   keyword("Proportionality_Factor_Xdir", &Coefs::factorX),
                   keyword("Proportionality_Factor_Ydir", &Coefs::factorY),
                   keyword("Min_Dispersion_Coefficient", &Coefs::minimum),
                   keyword("Max_Dispersion_Coefficient", &Coefs::maximum),
                   section("X_DIRECTION_COEFFICIENTS", keyword("Data_Format", &Coefs::formatX),
                           keyword("Constant_Value", &Coefs::constantX),
                           items("AREA_%d", &Coefs::filesX, Self::kAreaMissing)),
                   section("Y_DIRECTION_COEFFICIENTS", keyword("Data_Format", &Coefs::formatY),
                           keyword("Constant_Value", &Coefs::constantY),
                           items("AREA_%d", &Coefs::filesY, Self::kAreaMissing)));
  }

  // The model has n areas now.
  void SetNoAreas(int n) {
    filesX.SetCount(n);
    filesY.SetCount(n);
  }

  // The coefficients that suit the grids: 0.06 of the square of the smallest spacing, in a time step. They
  // stay while no grid is known.
  void SetToGrids() {
    constexpr Real kPart{0.06F};
    auto* basic = this->template parts<BasicParts>();
    const std::optional<GridSpacing> least = smallestSpacing(*this);
    if (basic == nullptr || !least || basic->simulationPeriod->timeStepInterval <= 0) return;
    const Real dt = basic->simulationPeriod->timeStepInterval;
    constantX = least->dx * least->dx * kPart / dt;
    constantY = least->dy * least->dy * kPart / dt;
  }

  unsigned Validate(ValidationList& messages, int deep) override {
    const bool isProportional = proportional != 0;
    unsigned faults = 0;
    if (isProportional && formatX == kConstant && formatY == kConstant && isUnstable())
      faults += report(messages, Self::kPage, Severity::fault, texts::tooMuchDispersion);
    if (!isProportional && deep != 0) {
      faults += checkFiles(messages, deep, formatX, filesX);
      faults += checkFiles(messages, deep, formatY, filesY);
    }
    if (isProportional && minimum > maximum)
      faults += report(messages, Self::kPage, Severity::fault, texts::maximumBelowMinimum);
    return faults;
  }

 private:
  bool isUnstable() {
    auto* basic = this->template parts<BasicParts>();
    const std::optional<GridSpacing> least = smallestSpacing(*this);
    return basic != nullptr && least &&
           isTooMuchDispersion<Real>(basic->simulationPeriod->timeStepInterval, least->dx, least->dy, factorX,
                                     factorY);
  }
  static unsigned checkFiles(ValidationList& messages, int deep, std::int32_t format, ItemList<Item>& files) {
    unsigned faults = 0;
    for (int area = 1; format == kFromFile && area <= files.GetCount(); ++area)
      faults += checkedEntry(messages, {area, files.GetCount()},
                             [&] { return files.GetItem(area)->Validate(messages, deep, area); });
    return faults;
  }
};

}  // namespace gridbay

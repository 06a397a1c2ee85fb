#pragma once

#include "families/area_values.h"
#include "mud_transport_expanded/bed_texts.h"
#include "platform/units/units.h"

namespace gridbay {

class CNmtExpErosionCoefficientComponentKvs;

// How much of a layer of the bed erodes in an area, in kg/m²/s.
class CNmtExpErosionCoefficientObjectKvs final : public ValueOrMapKvs<CNmtExpErosionCoefficientObjectKvs> {
 public:
  using ValueOrMapKvs::ValueOrMapKvs;

  static constexpr PageId kPage = PageId::mtExpErosionCoefficient;
  static constexpr Text kDescription = texts::bed::erosionCoefficient;
  static constexpr int kQuantity = item::kErosionRate;
};

// A keyword of a layer whose value stands in another list of the layers; `find` gives it, or null.
template <class Value>
struct OfLayerRow {
  using Component = CNmtExpErosionCoefficientComponentKvs;

  std::string_view name;
  Value* (*find)(Component& layer);

  void save(const Component& layer, KvsFile& file, const std::string&) const {
    if (const Value* value = find(const_cast<Component&>(layer))) kvsPutParam(file, name, *value);
  }
  void load(Component& layer, KvsSection from, const std::string&) const {
    if (Value* value = find(layer)) kvsGetParam(from, name, value, 1, 1);
  }
  void copy(Component&, const Component&) const {}
  static constexpr auto members() { return std::tuple(); }
};

// Of a layer in each area. Its section also has how the layer erodes, and by which power.
class CNmtExpErosionCoefficientComponentKvs final
    : public AreaValuesKvs<CNmtExpErosionCoefficientComponentKvs, CNmtExpErosionCoefficientObjectKvs> {
 public:
  using AreaValuesKvs::AreaValuesKvs;

  static constexpr auto table() {
    return keywords(OfLayerRow<std::int32_t>{"Erosion_Description", findDescription},
                    OfLayerRow<float>{"Em", findPower}, items("AREA_%d"));
  }

 private:
  static std::int32_t* findDescription(CNmtExpErosionCoefficientComponentKvs& layer);
  static float* findPower(CNmtExpErosionCoefficientComponentKvs& layer);
  // The layer's number, from 1; 0 outside of a list.
  int number() const;
};

// Of all layers.
class CNmtExpErosionCoefficientKvs final
    : public EntryAreasKvs<CNmtExpErosionCoefficientKvs, CNmtExpErosionCoefficientComponentKvs> {
 public:
  using EntryAreasKvs::EntryAreasKvs;

  static constexpr std::string_view kSection = {};
  static constexpr std::string_view kEntrySection = "BED_LAYER_%d";

  static float newValue(int) { return 0.00005F; }
};

}  // namespace gridbay

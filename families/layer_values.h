#pragma once

#include <cstdint>

#include "families/area_values.h"
#include "families/data_files.h"

// Values that are a constant for all areas, or given by a map for each; and such values for each layer of the
// bed.

namespace gridbay {
namespace texts {

inline constexpr Text mapOfBedRequest{"Erosion"};

}  // namespace texts

// The map of one area. Only its file is on file, and its messages lead to the page.
template <class Self, PageId page>
class AreaMapKvs : public TableKvs<Self> {
 public:
  using TableKvs<Self>::TableKvs;
  using TableKvs<Self>::Validate;

  UTsbSelection file{1};

  static constexpr auto table() { return keywords(selection(&AreaMapKvs::file, 1)); }

  // Area from 1.
  unsigned Validate(ValidationList& messages, int, int area) {
    CVdFileSelectorDlg selector;
    RequestDataFile(selector, area);
    return checkDataFile(messages, page, selector, file);
  }
  // What the file must be: a map on the grid of the area, of any quantity.
  void RequestDataFile(CVdFileSelectorDlg& selector, int area) {
    requestMap(selector, *this, area, texts::mapOfBedRequest, {});
  }
};

// A value as a constant, which is `Self::kDefault` in a new one, or as a list of maps that follows the count
// of areas. `Map` is an AreaMapKvs. Where `Self` has further keywords its table has the rows below.
template <class Self, class Map, class Real = float>
class ConstantOrMapsKvs : public ListKvs<Self, Map> {
 public:
  enum Format : std::int32_t { kConstant = 0, kMaps = 1 };

  using ListKvs<Self, Map>::ListKvs;

  std::int32_t format = kConstant;
  Real constant = Self::kDefault;  // base units

  static constexpr auto table() { return keywords(valueRows(), mapRows()); }

  unsigned Validate(ValidationList& messages, int deep) override {
    return format == kMaps ? ListKvs<Self, Map>::Validate(messages, deep) : 0;
  }

 protected:
  static constexpr auto valueRows() {
    return keywords(keyword("Data_Format", &ConstantOrMapsKvs::format),
                    keyword("Constant_Value", &ConstantOrMapsKvs::constant));
  }
  static constexpr auto mapRows() { return items("AREA_%d"); }
};

// The values of the layers of the bed, in the section `Self::kSection`. Follows the count of layers, and
// within each that of areas. `Layer` is a ConstantOrMapsKvs.
template <class Self, class Layer>
class LayerValuesKvs : public EntryAreasKvs<Self, Layer> {
 public:
  using EntryAreasKvs<Self, Layer>::EntryAreasKvs;

  static constexpr auto table() { return section(Self::kSection, layerRows()); }

 protected:
  static constexpr auto layerRows() { return items("LAYER_%d"); }
};

}  // namespace gridbay

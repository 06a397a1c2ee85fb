#pragma once

#include <string>

#include "families/area_grid.h"
#include "families/area_values_page.h"
#include "families/root_member.h"

// The grids of values that are a constant, or given by the map of an area (ValueOrMapKvs). `member` is that
// of the root that holds them; `Words` has the kind of their files as `kFile`.

namespace gridbay {

inline Choices areaMapFormats() {
  return Choices::lines("Constant value\r\nType 2 data file\r\n");
}

// Of an EntryAreasKvs, a band for each entry. `Words` has its title as `static std::string band(int entry)`.
template <auto member, class Words>
class AreaMapBands
    : public AreaValuesGrid<std::remove_pointer_t<decltype(std::declval<RootMember<member>>().GetItem(1))>> {
 protected:
  using Entry = std::remove_pointer_t<decltype(std::declval<RootMember<member>>().GetItem(1))>;

  int EntryCount() override { return held().GetCount(); }
  Entry* EntryAt(int number) override { return held().GetItem(number); }
  std::string BandTitle(int item) override { return Words::band(item); }
  int Quantity(int) override {
    return std::remove_pointer_t<decltype(std::declval<Entry>().GetItem(1))>::kQuantity;
  }
  Choices Formats() override { return areaMapFormats(); }
  FileKind KindOfFile(std::int32_t) override { return Words::kFile; }

 private:
  auto& held() { return rootMember<member>(this->GetKvs()); }
};

// Of a list by area, a row for each area.
template <auto member, class Words>
class AreaMapRows : public AreaGrid {
  void LayOut() override {
    Rows([this] { return held().GetCount(); });
    const auto value = [this](GridRow row) { return held().GetItem(row.item); };
    using MapValue = std::remove_pointer_t<decltype(value(GridRow{}))>;
    const auto has = [value](std::int32_t format) {
      return [value, format](GridRow row) { return value(row)->format == format; };
    };
    ValueOrFileColumns(
        value, ValueOrFile<MapValue>{.formatHeader = "Type",
                                     .formatWidth = 100,
                                     .format = &MapValue::format,
                                     .formats = areaMapFormats(),
                                     .valueHeader = "Value",
                                     .valueWidth = 60,
                                     .value = &MapValue::value,
                                     .quantity = MapValue::kQuantity,
                                     .takesValue = has(MapValue::kConstant),
                                     .file = {.file = fileOf(value, &MapValue::file, FileKind{Words::kFile},
                                                             &MapValue::RequestMap),
                                              .enabled = has(MapValue::kMap)}});
  }
  auto& held() { return rootMember<member>(this->GetKvs()); }
};

}  // namespace gridbay

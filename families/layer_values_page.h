#pragma once

#include <optional>
#include <string>
#include <string_view>

#include "families/area_grid.h"
#include "families/root_member.h"

namespace gridbay {
namespace texts {

inline constexpr FileKind mapOfBedFile{"tsb2", "Maps (*.tsb2;*.tb2)|*.tsb2; *.tb2|All Files (*.*)|*.*||"};
inline constexpr Text dataFilesOf{"Data files of %s"};

}  // namespace texts

// How a value is given that is a constant or a map for each area.
inline Choices constantOrMaps() {
  return Choices::lines("Constant value\r\nType 2 data file\r\n");
}

// The maps of a value, a row for each area.
class AreaMapsGrid : public AreaGrid {
 protected:
  // `values()` gives a ConstantOrMapsKvs, or null where there is none.
  template <class Access>
  void MapColumns(Access values) {
    using Values = std::remove_pointer_t<decltype(values())>;
    Rows([values] { return values() == nullptr ? 0 : values()->GetCount(); });
    const auto map = [values](GridRow row) { return values()->GetItem(row.item); };
    using Map = std::remove_pointer_t<decltype(map(GridRow{}))>;
    File({.file = fileOf(map, &Map::file, texts::mapOfBedFile, &Map::RequestDataFile),
          .enabled = [values](GridRow) { return values()->format == Values::kMaps; }});
  }
};

// The list and the constant of such a value, above the grid of its maps.
void listConstantOrMaps(Form& form, std::string_view constantLabel, int quantity, auto values,
                        AreaMapsGrid& maps) {
  using Values = std::remove_reference_t<decltype(values())>;
  form.List("Given as", constantOrMaps(), values, &Values::format);
  form.Number(constantLabel, values, &Values::constant, quantity).EnabledIf([values] {
    return values().format == Values::kConstant;
  });
  form.Grid("Data files", maps);
}

// What a pair of grids of layers is about, where they are a member of the root: a LayerValuesKvs.
template <auto list>
struct LayersOfRoot {
  static constexpr std::string_view kCorner = "Layer";
  static constexpr int kRowHeaderWidth = 40;

  static int count(CKvsBase& object) { return rootMember<list>(object).GetCount(); }
  static auto* values(CKvsBase& object, int number) { return rootMember<list>(object).GetItem(number); }
  static std::string name(CKvsBase&, int number) { return std::to_string(number); }
  static std::string title(CKvsBase& object, int number) { return "layer " + name(object, number); }
};

// How the values of the layers are given, a row for each. `Words` has what LayersOfRoot has, and their item
// code as `kQuantity`, 0 for plain numbers. The maps of the current row are shown beside.
template <class Words>
class LayerValuesGrid : public ColumnGrid {
 public:
  // Those of the current row, or null where it is none of them; and what they are called.
  auto* current() { return Words::values(GetKvs(), current_); }
  std::string currentTitle() { return current() == nullptr ? "" : Words::title(GetKvs(), current_); }

  void OnCurrentRow(int row) override {
    if (row == current_) return;
    current_ = row;
    host().Refresh();
  }
  std::optional<int> CurrentRow() override { return current_; }

 private:
  std::string CornerHeader() override { return std::string(Words::kCorner); }
  int RowHeaderWidth() override { return Words::kRowHeaderWidth; }
  std::string RowHeader(GridRow row) override { return Words::name(GetKvs(), row.item); }
  void LayOut() override {
    Rows([this] { return Words::count(GetKvs()); });
    const auto values = [this](GridRow row) { return Words::values(GetKvs(), row.item); };
    using Values = std::remove_pointer_t<decltype(values(GridRow{}))>;
    List("Given as", 110, values, &Values::format, constantOrMaps());
    Number("Value", 90, values, &Values::constant, Words::kQuantity).EnabledIf([values](GridRow row) {
      return values(row)->format == Values::kConstant;
    });
  }

  int current_ = 1;
};

template <class LayersGrid>
class LayerMapsGrid : public AreaMapsGrid {
 public:
  explicit LayerMapsGrid(LayersGrid& layers) : layers_(layers) {}

 private:
  void LayOut() override {
    MapColumns([this] { return layers_.current(); });
  }

  LayersGrid& layers_;
};

// The two grids beside each other. `Words` also has the label of the page as `kLabel`.
template <std::int32_t dialogTemplate, PageId id, class Words, class LayersGrid, class MapsGrid>
class LayerValuesDlg : public Page<dialogTemplate, id> {
 public:
  using Page<dialogTemplate, id>::Page;

 protected:
  void DoDataExchange(Form& form) override {
    form.Group(Words::kLabel, [&] { form.Grid(Words::kLabel, layers_); });
    form.Group("Data files", [&] { form.Grid("Data files", maps_); }).Beside().Caption([this] {
      return formatted(texts::dataFilesOf, layers_.currentTitle());
    });
  }

 private:
  LayersGrid layers_;
  MapsGrid maps_{layers_};
};

}  // namespace gridbay

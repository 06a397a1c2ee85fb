// Two grids side by side: a row for each layer with format and constant, and the map files of the current
// layer, a row for each area.

#include <gmock/gmock.h>

#include "tests/support/shapes.h"

namespace gridbay {
namespace pages_layer_family_test {

struct Layer {
  std::int32_t format = 0;
  float constant = 0;
  std::vector<UTsbSelection> maps = std::vector<UTsbSelection>(2, UTsbSelection(1));
};

class LayerGrid final : public ColumnGrid {
 public:
  std::vector<Layer> layers{3};
  int current = 0;
  Layer* currentLayer() {
    const bool isThere = current >= 1 && current <= static_cast<int>(layers.size());
    return isThere ? &layers[static_cast<std::size_t>(current) - 1] : nullptr;
  }
  void OnCurrentRow(int row) override {
    current = row;
    host().Refresh();
  }

 private:
  void LayOut() override {
    Rows([this] { return static_cast<int>(layers.size()); });
    const auto layer = [this](GridRow row) { return &layers[static_cast<std::size_t>(row.item) - 1]; };
    List("Format", 80, layer, &Layer::format, Choices::numbered({"Constant", "From file"}));
    Number("Constant", 80, layer, &Layer::constant).EnabledIf([layer](GridRow row) {
      return layer(row)->format == 0;
    });
  }
};

class MapGrid final : public ColumnGrid {
 public:
  explicit MapGrid(LayerGrid& layers) : layers_(layers) {}

 private:
  void LayOut() override {
    Rows([this] { return layers_.currentLayer() == nullptr ? 0 : 2; });
    FileChoice file{.file = [this](GridRow row) -> FileRef {
                      return layers_.currentLayer()->maps[static_cast<std::size_t>(row.item) - 1];
                    },
                    .kind = FileKind{"tsb2", "Map (*.tsb2)|*.tsb2||"}};
    File({.file = file, .width = 180, .enabled = [this](GridRow) {
            return layers_.currentLayer()->format == 1;
          }});
  }
  LayerGrid& layers_;
};

class LayerFamily : public test::ShapeTest {
 protected:
  LayerFamily() {
    open([this](test::OwnPage&, Form& form) {
      form.Grid("Layers", layers);
      form.Grid("Maps", maps).Beside();
      form.Shown("Maps of:", [this] { return "layer " + std::to_string(layers.current); });
    });
  }
  LayerGrid layers;
  MapGrid maps{layers};
};

TEST_F(LayerFamily, TheMapsAreThoseOfTheCurrentLayer) {
  EXPECT_TRUE(control("Maps").beside);
  EXPECT_EQ(maps.GetRowCount(), 0);
  layers.OnCurrentRow(2);
  EXPECT_EQ(text("Maps of:"), "layer 2");
  EXPECT_EQ(maps.GetRowCount(), 2);
  EXPECT_EQ(usableOf(maps, 1), "...");
  EXPECT_EQ(layers.StoreStyleRowCol(2, 1, "From file"), 1);
  EXPECT_EQ(usableOf(maps, 1), "xx.");
  EXPECT_EQ(maps.StoreStyleRowCol(2, 1, "m.tsb2"), 1);
  EXPECT_EQ(layers.layers[1].maps[1].fileName.text(), "m.tsb2");
  layers.OnCurrentRow(3);
  EXPECT_EQ(textIn(maps, 2, 1), "");
}

TEST_F(LayerFamily, ALayerThatGoesTakesItsMapsWithIt) {
  layers.OnCurrentRow(3);
  layers.layers.resize(2);
  page->SetData();
  EXPECT_EQ(maps.GetRowCount(), 0);
  EXPECT_EQ(maps.StoreStyleRowCol(1, 1, "m.tsb2"), 0);
}

}  // namespace pages_layer_family_test
}  // namespace gridbay

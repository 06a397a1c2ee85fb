// Dikes, and the points of the one that is current, with a count of their own; with none current all that is
// off.

#include <gmock/gmock.h>

#include "tests/support/shapes.h"

namespace gridbay {
namespace pages_master_detail_test {

struct Point3 {
  double x = 0;
  double z = 0;
};
struct Dike {
  std::string name;
  bool variesInSpace = false;
  std::vector<Point3> points;

  int GetCount() const { return static_cast<int>(points.size()); }
  void SetCount(int n) { points.resize(static_cast<std::size_t>(n)); }
};

class DikeGrid final : public ColumnGrid {
 public:
  std::vector<Dike> dikes{{"A"}, {"B"}};
  int current = 0;
  Dike* selected() {
    return current >= 1 && current <= static_cast<int>(dikes.size())
               ? &dikes[static_cast<std::size_t>(current) - 1]
               : nullptr;
  }
  void OnCurrentRow(int row) override {
    current = row;
    host().Refresh();
  }

 private:
  void LayOut() override {
    Rows([this] { return static_cast<int>(dikes.size()); });
    const auto dike = [this](GridRow row) { return &dikes[static_cast<std::size_t>(row.item) - 1]; };
    Text("Name", 90, dike, &Dike::name);
    Check("Varies", 60, dike, &Dike::variesInSpace);
  }
};

class PointGrid final : public ColumnGrid {
 public:
  explicit PointGrid(DikeGrid& dikes) : dikes_(dikes) {}

 private:
  void LayOut() override {
    Rows([this] { return dikes_.selected() == nullptr ? 0 : dikes_.selected()->GetCount(); });
    const auto point = [this](GridRow row) {
      return &dikes_.selected()->points[static_cast<std::size_t>(row.item) - 1];
    };
    Number("Easting", 80, point, &Point3::x);
    Number("Z", 80, point, &Point3::z).WidthBy([this] {
      return dikes_.selected() != nullptr && dikes_.selected()->variesInSpace ? 80 : 0;
    });
  }
  DikeGrid& dikes_;
};

class MasterDetail : public test::ShapeTest {
 protected:
  MasterDetail() {
    open([this](test::OwnPage&, Form& form) {
      form.Grid("Dikes", dikes);
      form.Count("Number of points", countOf([this] { return dikes.selected(); }), 1000);
      form.Grid("Points", points);
    });
  }
  DikeGrid dikes;
  PointGrid points{dikes};
};

TEST_F(MasterDetail, TheDetailIsThatOfTheCurrentRow) {
  EXPECT_FALSE(control("Number of points").usable());
  EXPECT_EQ(text("Number of points"), "");
  EXPECT_EQ(points.GetRowCount(), 0);
  spin("Number of points", 1);
  dikes.OnCurrentRow(2);
  EXPECT_EQ(text("Number of points"), "0");
  edit("Number of points", "2");
  spin("Number of points", 1);
  EXPECT_EQ(dikes.dikes[1].points.size(), 3U);
  EXPECT_EQ(dikes.dikes[0].points.size(), 0U);
  EXPECT_EQ(points.StoreStyleRowCol(3, 1, "7.5"), 1);
  EXPECT_EQ(dikes.dikes[1].points[2].x, 7.5);
  dikes.OnCurrentRow(1);
  EXPECT_EQ(points.GetRowCount(), 0);
  dikes.OnCurrentRow(0);
  EXPECT_EQ(text("Number of points"), "");
}

TEST_F(MasterDetail, AnEditAboveShowsAColumnBelow) {
  dikes.OnCurrentRow(1);
  EXPECT_EQ(points.GetColWidth(2), 0);
  dikes.StoreStyleRowCol(1, 2, "1");
  EXPECT_EQ(points.GetColWidth(2), 80);
}

}  // namespace pages_master_detail_test
}  // namespace gridbay

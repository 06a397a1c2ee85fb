#include "platform/units/units.h"

#include <gtest/gtest.h>

#include <algorithm>
#include <cctype>
#include <set>
#include <string>

#include "platform/units/edit_style.h"

namespace gridbay {
namespace platform_units_test {

TEST(Units, EveryQuantityHasUnitsThatConvertThereAndBack) {
  EXPECT_TRUE(std::ranges::is_sorted(qunItems(), {}, &QunItem::code));
  EXPECT_TRUE(std::ranges::is_sorted(qunUnits(), {}, &QunUnit::code));
  for (const QunItem& item : qunItems()) {
    SCOPED_TRACE(item.name);
    EXPECT_FALSE(item.name.empty());
    EXPECT_NE(std::ranges::find(item.units, item.usUnit), item.units.end());
    for (const int code : item.units) {
      const QunUnit* unit = qunFindUnit(code);
      ASSERT_NE(unit, nullptr) << code;
      EXPECT_TRUE(qunIsUnit(unit->text)) << unit->text;
      const auto shown = qunConvertUnit(item.units.front(), code, 12.5);
      ASSERT_TRUE(shown) << unit->text;
      EXPECT_NEAR(*qunConvertUnit(code, item.units.front(), *shown), 12.5, 1e-9);
    }
  }
}

TEST(Units, TheCatalogueHasEveryQuantityOfTheSetup) {
  for (const int code :
       {100000, 100001, 100002, 100003, 100006, 100016, 100024, 100030, 100032, 100061, 100062,
        100069, 100070, 100078, 100079, 100080, 100084, 100085, 100088, 100095, 100097, 100123,
        100127, 100142, 100144, 100153, 100180, 100183, 100191, 100196, 100201, 100212, 100239,
        100242, 100272, 100274, 100280, 100292, 100366, 100369, 100370, 100375, 100377, 100379,
        100403, 100406, 100407, 100408, 100409, 100410, 100427, 100430, 100431, 100432, 100442,
        100450, 100456, 100461, 100504, 100505, 100516, 110025, 110033, 110257}) {
    EXPECT_NE(qunFindItem(code), nullptr) << code;
    EXPECT_NE(qunBaseUnit(code), nullptr) << code;
  }
  EXPECT_EQ(qunFindItem(1), nullptr);
  EXPECT_EQ(qunBaseUnit(1), nullptr);
}

// The formulations of bed resistance, and the coefficients of weirs and discharges with the second.
TEST(Units, ManningAndChezyNumbersHaveTheirOwnCodes) {
  EXPECT_EQ(qunFindItem(100030)->name, "Manning number");
  EXPECT_EQ(qunBaseUnit(100030)->symbol, "m^⅓/s");
  EXPECT_EQ(qunFindItem(100032)->name, "Chezy number");
  EXPECT_EQ(qunBaseUnit(100032)->symbol, "m^½/s");
}

TEST(Units, AQuantityIsKnownByItsNameToo) {
  std::set<std::string> names;
  for (const QunItem& item : qunItems()) {
    std::string small(item.name);
    for (char& c : small) c = static_cast<char>(std::tolower(static_cast<unsigned char>(c)));
    EXPECT_TRUE(names.insert(small).second) << item.name;
  }
}

TEST(Units, Conversions) {
  EXPECT_DOUBLE_EQ(*qunConvertUnit(1400, 1403, 43200), 0.5);
  EXPECT_DOUBLE_EQ(*qunConvertUnit(1010, 1000, 1), 0.3048);
  EXPECT_NEAR(*qunConvertUnit(1600, 1601, 100), 212, 1e-9);
  EXPECT_NEAR(*qunConvertUnit(1610, 1611, 100), 180, 1e-9);
  EXPECT_NEAR(*qunConvertUnit(2001, 2000, 101300), 1013, 1e-9);
  EXPECT_NEAR(*qunConvertUnit(2110, 2111, 0.67295009631617), 1, 1e-9);
  EXPECT_FALSE(qunConvertUnit(1000, 1400, 1));
  EXPECT_FALSE(qunConvertUnit(1000, 1, 1));
  EXPECT_TRUE(qunAreEquivalent("ft", "m"));
  EXPECT_FALSE(qunAreEquivalent("ft", "s"));
  EXPECT_FALSE(qunAreEquivalent("nonsense", "s"));
  const CVdUnitConverter none("m", "nonsense");
  EXPECT_FALSE(none.IsValid());
  EXPECT_EQ(none.Convert(3), 3);
}

TEST(EditStyle, ShowsTheUnitThatTheUserHasChosen) {
  UnitChoices choices;
  CVdEditStyle style = CVdEditStyle(choices).SetQunUnitBaseGroup(100000).SetFormat("%.2lf");
  EXPECT_EQ(style.Text(3.048), "3.05");
  EXPECT_EQ(style.GetQunToolTipText(), "Water level [m]");
  choices.setSystem(UnitSystem::us);
  EXPECT_EQ(style.Text(3.048), "10.00");
  EXPECT_EQ(style.GetQunToolTipText(), "Water level [ft]");
  EXPECT_DOUBLE_EQ(style.UnitConvertFromBase(10, 0), 3.048);
  choices.choose(100000, 1002);
  EXPECT_DOUBLE_EQ(style.UnitConvertFromBase(1, 1), 100);
  EXPECT_EQ(CVdEditStyle(choices).Text(1.5), "1.500000");
  EXPECT_EQ(CVdEditStyle(choices).SetQunUnitBaseGroup(1).GetQunToolTipText(), "");
}

}  // namespace platform_units_test
}  // namespace gridbay

#include "hydrodynamic/eddy_viscosity.h"

#include <gmock/gmock.h>

#include "core/edition.h"
#include "tests/hydrodynamic/area_fixture.h"

namespace gridbay {
namespace hydrodynamic_eddy_viscosity_test {

using test::savedText;
using ::testing::ElementsAre;
using ::testing::IsEmpty;
using ::testing::StartsWith;

class EddyViscosity : public test::AreaTest {
 protected:
  CNhdEddyViscosityKvs& list() { return *root().nhdEddyViscosity; }
  std::vector<std::string> faults(int deep = 1) { return faultsOf(list(), PageId::eddyViscosity, deep); }
};

constexpr std::string_view kAreas =
    "    AREA_1 {\n"
    "        Constant_Value 0.75\n"
    "        Smagorinsky_Format 0.25\n"
    "        File_Name (file)\"e.tsb2\"\n"
    "        Item_Numbers 2\n"
    "    }\n"
    "    AREA_2 {\n"
    "        Constant_Value 0.0\n"
    "        Smagorinsky_Format 0.5\n"
    "        File_Name (file)\"\"\n"
    "        Item_Numbers 1\n"
    "    }\n"
    "}\n";

std::string text(int dataFormat, int formulation) {
  return "EDDY_VISCOSITY {\n    Data_Format " + std::to_string(dataFormat) + "\n    Formulation " +
         std::to_string(formulation) + "\n" + std::string(kAreas);
}

TEST_F(EddyViscosity, ANewOneIsWrittenInFileOrder) {
  test::Model one;
  EXPECT_EQ(savedText(*one.root.nhdEddyViscosity),
            "EDDY_VISCOSITY {\n"
            "    Data_Format 0\n"
            "    Formulation 1\n"
            "    AREA_1 {\n"
            "        Constant_Value 0.0\n"
            "        Smagorinsky_Format 0.5\n"
            "        File_Name (file)\"\"\n"
            "        Item_Numbers 1\n"
            "    }\n"
            "}\n");
}

TEST_F(EddyViscosity, ALoadSwitchesItOffInTheWetlandSweepKit) {
  test::load(list(), text(2, 0));
  EXPECT_EQ(savedText(list()), theEdition.wetlandSweepKit ? text(0, 1) : text(2, 0));
  test::load(list(), "EDDY_VISCOSITY { AREA_1 {}; AREA_2 {} }");
  EXPECT_EQ(savedText(list()), theEdition.wetlandSweepKit ? text(0, 1) : text(2, 0));
}

TEST_F(EddyViscosity, IsWrittenAsHeld) {
  list().dataFormat = 3;
  list().formulation = 0;
  EXPECT_THAT(savedText(list()), StartsWith("EDDY_VISCOSITY {\n    Data_Format 3\n    Formulation 0\n"));
}

TEST_F(EddyViscosity, IsCopied) {
  test::load(list(), text(2, 0));
  list().dataFormat = 3;
  list().formulation = 0;
  test::Model other;
  other.root.nhdEddyViscosity->CopyFrom(list());
  EXPECT_EQ(savedText(*other.root.nhdEddyViscosity), text(3, 0));
}

TEST_F(EddyViscosity, OnlyAConstantThatIsInUseMayNotBeNegative) {
  list().at(2).constantValue = -1;
  list().at(1).smagorinskyConstant = -1;
  for (const std::int32_t format : {0, 3, 7}) {
    list().dataFormat = format;
    EXPECT_THAT(faults(), IsEmpty()) << format;
  }
  list().dataFormat = 1;
  EXPECT_THAT(faults(), ElementsAre("Negative Eddy Viscosity"));
  EXPECT_THAT(faults(0), IsEmpty());
  list().at(2).constantValue = 0;
  EXPECT_THAT(faults(), IsEmpty());
}

TEST_F(EddyViscosity, MapsFitTheirAreas) {
  list().dataFormat = 2;
  const std::vector<TsbItem> items{{"Other", 100079, "m"}, {"Viscosity", 100123, "m2 s-1"}};
  list().at(1).map.fileName = write("1.tsb2", {.items = items});
  list().at(2).map.fileName = write("2.tsb2", {.items = items});
  EXPECT_THAT(faults(), ElementsAre(notValid(folder.file("1.tsb2")), notValid(folder.file("2.tsb2"))));
  list().at(1).map.items = list().at(2).map.items = {2};
  EXPECT_THAT(faults(), ElementsAre(notValid(folder.file("2.tsb2"))));
  write("2.tsb2", {.items = items, .axes = innerAxes()});
  EXPECT_THAT(faults(), IsEmpty());
  EXPECT_THAT(faults(0), IsEmpty());
}

TEST_F(EddyViscosity, TheRequest) {
  CVdFileSelectorDlg selector;
  list().at(1).RequestMap(selector, 1);
  ASSERT_EQ(selector.requests().size(), 1U);
  EXPECT_EQ(selector.requests()[0]->description(), "Eddy viscocity");
  EXPECT_EQ(selector.requests()[0]->types(), std::vector<int>{100123});
  EXPECT_FALSE(selector.pluginEnabled());
}

}  // namespace hydrodynamic_eddy_viscosity_test
}  // namespace gridbay

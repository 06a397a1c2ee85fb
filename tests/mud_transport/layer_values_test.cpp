// What each layer of the bed has: eight lists of one family, which differ in their sections, defaults and
// pages.

#include <gmock/gmock.h>

#include "basic/bathymetry.h"
#include "mud_transport/erosion_for_each_layer.h"
#include "mud_transport/sliding.h"
#include "mud_transport/transition_between_layers.h"
#include "tests/support/grids.h"
#include "tests/support/model.h"
#include "tests/support/temporary_folder.h"

namespace gridbay {
namespace mud_transport_layer_values_test {

using test::savedText;
using Texts = std::vector<std::string>;

// One list of the family, with its types left behind.
struct Family {
  std::string name;
  std::string section;
  std::string before;  // what its section has before the layers
  std::string constant;
  PageId page;

  CKvsBase& (*object)(CGlobalKvs&);
  void (*setCount)(CGlobalKvs&, int);
  void (*setNoAreas)(CGlobalKvs&, int);
  int (*count)(CGlobalKvs&);
  int (*areas)(CGlobalKvs&, int layer);
  void (*setFormat)(CGlobalKvs&, int layer, std::int32_t format);
  void (*setConstant)(CGlobalKvs&, int layer, double constant);
  UTsbSelection& (*file)(CGlobalKvs&, int layer, int area);

  // As it is shown among the names of tests.
  friend void PrintTo(const Family& family, std::ostream* out) { *out << family.name; }
};

template <class Access>
Family family(std::string name, std::string section, std::string constant, PageId page, Access,
              std::string before = {}) {
  return {std::move(name),
          std::move(section),
          std::move(before),
          std::move(constant),
          page,
          [](CGlobalKvs& root) -> CKvsBase& { return Access{}(root); },
          [](CGlobalKvs& root, int n) { Access{}(root).SetCount(n); },
          [](CGlobalKvs& root, int n) { Access{}(root).SetNoAreas(n); },
          [](CGlobalKvs& root) { return Access{}(root).GetCount(); },
          [](CGlobalKvs& root, int layer) { return Access{}(root).at(layer).GetCount(); },
          [](CGlobalKvs& root, int layer, std::int32_t format) { Access{}(root).at(layer).format = format; },
          [](CGlobalKvs& root, int layer, double number) {
            auto& held = Access{}(root).at(layer).constant;
            held = static_cast<std::remove_reference_t<decltype(held)>>(number);
          },
          [](CGlobalKvs& root, int layer, int area) -> UTsbSelection& {
            return Access{}(root).at(layer).at(area).file;
          }};
}

std::vector<Family> families() {
  using G = CGlobalKvs;
  return {
      family(
          "Critical", "CRITICAL_SHEARSTRESS_FOR_EROSION", "0.1", PageId::mtErosionForEachLayerCritical,
          [](G & root) -> auto& { return *root.nmtErosionForEachLayerCritical; }),
      family(
          "Factor", "EROSION_COEFFICIENT_FACTOR", "0.05", PageId::mtErosionForEachLayerFactor,
          [](G & root) -> auto& { return *root.nmtErosionForEachLayerFactor; }),
      family(
          "Factor1", "EROSION_COEFFICIENT_Factor1", "33.0", PageId::mtErosionForEachLayerFactor1,
          [](G & root) -> auto& { return *root.nmtErosionForEachLayerFactor1; }),
      family(
          "Factor2", "EROSION_COEFFICIENT_FACTOR2", "-0.2", PageId::mtErosionForEachLayerFactor2,
          [](G & root) -> auto& { return *root.nmtErosionForEachLayerFactor2; }),
      family(
          "Power", "ALPHA_OR_POWER", "1.0", PageId::mtErosionForEachLayerPower,
          [](G & root) -> auto& { return *root.nmtErosionForEachLayerPower; }),
      family(
          "Density", "DENSITY_OF_BED_MATERIAL", "150000.0", PageId::mtErosionForEachLayerDensity,
          [](G & root) -> auto& { return *root.nmtErosionForEachLayerDensity; }),
      family(
          "ConstantSliding", "CONSTANT_SLIDING_COEFFICIENT", "0.0001", PageId::mtConstantSliding,
          [](G & root) -> auto& { return root.nmtSliding->constant; }),
      family(
          "Transition", "TRANSITION_OF_MUD_BETWEEN_LAYERS", "1.0", PageId::mtTransitionBetweenLayers,
          [](G & root) -> auto& { return *root.nmtTransitionBetweenLayers; },
          "    Include_transition_of_mud_within_layers 0\n"),
  };
}

class BedLayers : public ::testing::TestWithParam<Family> {
 protected:
  const Family& it() const { return GetParam(); }
  CKvsBase& object() { return it().object(root); }
  static std::string layerText(int number, int format, const std::string& constant, const Texts& files) {
    std::string text = "    LAYER_" + std::to_string(number) + " {\n        Data_Format " +
                       std::to_string(format) + "\n        Constant_Value " + constant + "\n";
    for (std::size_t i = 0; i < files.size(); ++i)
      text += "        AREA_" + std::to_string(i + 1) + " {\n            File_Name (file)\"" + files[i] +
              "\"\n            Item_Numbers 1\n        }\n";
    return text + "    }\n";
  }
  std::string textOf(const std::string& layers) const {
    return it().section + " {\n" + it().before + layers + "}\n";
  }
  Texts faults(int deep = 1) {
    const ValidationList messages = test::messagesOf(object(), deep);
    for (const CMessage& message : messages) {
      EXPECT_EQ(message.page, it().page);
      EXPECT_EQ(message.severity, Severity::fault);
    }
    return test::textsOf(messages);
  }

  test::TemporaryFolder folder;
  test::Model model;
  CGlobalKvs& root = model.root;
};

TEST_P(BedLayers, NewLayersInFileOrder) {
  EXPECT_EQ(it().count(root), 0);
  root.bathymetry->SetNoAreas(2);
  it().setCount(root, 2);
  EXPECT_EQ(savedText(object()),
            textOf(layerText(1, 0, it().constant, {"", ""}) + layerText(2, 0, it().constant, {"", ""})));
}

TEST_P(BedLayers, FilledLayersAreReadBackAndCopied) {
  root.bathymetry->SetNoAreas(2);
  it().setCount(root, 2);
  it().setFormat(root, 2, 1);
  it().setConstant(root, 2, 0.75);
  it().file(root, 2, 1).fileName = "/case/m1.tsb2";
  it().file(root, 2, 2).fileName = "/case/m2.tsb2";
  const std::string saved = savedText(object());
  EXPECT_EQ(saved, textOf(layerText(1, 0, it().constant, {"", ""}) +
                          layerText(2, 1, "0.75", {"m1.tsb2", "m2.tsb2"})));

  test::Model other;
  other.root.bathymetry->SetNoAreas(2);
  it().setCount(other.root, 2);
  CKvsBase& read = it().object(other.root);
  test::load(read, saved);
  EXPECT_EQ(savedText(read), saved);

  test::Model third;
  CKvsBase& copy = it().object(third.root);
  copy.CopyFrom(object());
  EXPECT_EQ(savedText(copy), saved);
  EXPECT_TRUE(copy.SameState(object()));
  it().file(root, 1, 2).fileName = "/case/other.tsb2";
  EXPECT_FALSE(copy.SameState(object()));
}

// What stands in no section keeps what it is, and nothing is told.
TEST_P(BedLayers, SectionsThatAFileLacksArePassedOver) {
  root.bathymetry->SetNoAreas(2);
  it().setCount(root, 2);
  test::load(object(), "OTHER {}");
  test::load(object(), it().section +
                           " { LAYER_2 { Constant_Value 0.5; AREA_2 { File_Name (file)\"m.tsb2\"; "
                           "Item_Numbers 4 } }; LAYER_3 { Constant_Value 9.0 } }");
  EXPECT_EQ(it().count(root), 2);
  EXPECT_EQ(it().file(root, 2, 2).items, std::vector<std::uint32_t>{4});
  it().file(root, 2, 2).items = {1};
  EXPECT_EQ(savedText(object()),
            textOf(layerText(1, 0, it().constant, {"", ""}) + layerText(2, 0, "0.5", {"", "m.tsb2"})));
  EXPECT_TRUE(model.host.texts.empty());
}

TEST_P(BedLayers, ValuesOfAWrongKindAreLeft) {
  it().setCount(root, 1);
  test::load(object(), it().section + " { LAYER_1 { Data_Format \"map\"; Constant_Value #true; AREA_1 5 } }");
  EXPECT_EQ(savedText(object()), textOf(layerText(1, 0, it().constant, {""})));
}

TEST_P(BedLayers, FollowsLayersAndAreas) {
  it().setCount(root, 3);
  EXPECT_EQ(it().areas(root, 3), 1);
  it().setConstant(root, 1, 7);
  it().setConstant(root, 3, 7);
  root.bathymetry->SetNoAreas(3);
  for (const int layer : {1, 2, 3}) EXPECT_EQ(it().areas(root, layer), 3);
  root.bathymetry->SetNoAreas(2);
  EXPECT_EQ(it().areas(root, 2), 2);
  it().setCount(root, 2);
  it().setCount(root, 3);
  EXPECT_EQ(it().areas(root, 3), 2);
  it().setNoAreas(root, 1);
  EXPECT_EQ(savedText(object()), textOf(layerText(1, 0, "7.0", {""}) + layerText(2, 0, it().constant, {""}) +
                                        layerText(3, 0, it().constant, {""})));
  it().setCount(root, -1);
  EXPECT_EQ(it().count(root), 3);
}

TEST_P(BedLayers, MapsAreCheckedWhereTheyAreUsed) {
  root.bathymetry->SetNoAreas(2);
  it().setCount(root, 2);
  const std::string fits = folder.file("fits.tsb2");
  test::writeGrid(fits, {.itemType = 100403, .unit = "kg m-3"});
  const std::string none = folder.file("none.tsb2");
  for (const int area : {1, 2}) {
    root.bathymetry->GetArea(area)->noJ = 10;
    root.bathymetry->GetArea(area)->noK = 8;
    root.bathymetry->GetArea(area)->dx = 30;
    root.bathymetry->GetArea(area)->dy = 30;
    it().file(root, 1, area).fileName = fits;
    it().file(root, 2, area).fileName = none;
  }
  EXPECT_TRUE(faults().empty());
  for (const int layer : {1, 2}) it().setFormat(root, layer, 1);
  EXPECT_TRUE(faults(0).empty());
  const std::string fault = "Data file  \" " + none + "\"  is not valid";
  EXPECT_EQ(faults(), (Texts{fault, fault}));
  it().file(root, 2, 1).fileName = fits;
  EXPECT_EQ(faults(), Texts{fault});
  root.bathymetry->GetArea(2)->noK = 9;  // which the file of layer 1 does not fit
  EXPECT_EQ(faults(), (Texts{"Data file  \" " + fits + "\"  is not valid", fault}));
}

INSTANTIATE_TEST_SUITE_P(Of, BedLayers, ::testing::ValuesIn(families()),
                         [](const auto& of) { return of.param.name; });

class PowerOfErosion : public ::testing::Test {
 protected:
  Texts faults(int deep = 1) {
    const ValidationList messages = test::messagesOf(powers, deep);
    for (const CMessage& message : messages) EXPECT_EQ(message.page, PageId::mtErosionForEachLayerPower);
    return test::textsOf(messages);
  }
  test::Model model;
  CNmtErosionForEachLayerPowerKvs& powers = *model.root.nmtErosionForEachLayerPower;
  const std::string differ = "Format must be the same for all layers";
};

TEST_F(PowerOfErosion, FormatsThatDifferAreToldOnce) {
  powers.SetCount(12);
  EXPECT_TRUE(faults().empty());
  for (int layer = 2; layer <= 12; ++layer) {
    powers.at(layer).format = 1;
    powers.at(layer).SetCount(0);  // no maps that are missing
  }
  EXPECT_EQ(faults(), Texts{differ});
  EXPECT_TRUE(faults(0).empty());
  powers.at(1).format = 1;
  powers.at(1).SetCount(0);
  EXPECT_TRUE(faults().empty());
  powers.SetCount(0);
  EXPECT_TRUE(faults().empty());
}

// Each layer's own faults come first, also where another format was told already.
TEST_F(PowerOfErosion, FormatsAreToldBehindTheFilesOfTheirLayer) {
  powers.SetCount(4);
  for (const int layer : {2, 4}) {
    powers.at(layer).format = 1;
    powers.at(layer).at(1).file.fileName = "/case/" + std::to_string(layer) + ".tsb2";
  }
  EXPECT_EQ(faults(), (Texts{"Data file  \" /case/2.tsb2\"  is not valid", differ,
                             "Data file  \" /case/4.tsb2\"  is not valid"}));
}

// Below 0.0001 are more digits than 32 bits hold.
TEST(ConstantSliding, HasConstantsOf64Bits) {
  test::Model model;
  model.root.nmtSliding->SetCount(1);
  test::load(*model.root.nmtSliding,
             "SLIDING { CONSTANT_SLIDING_COEFFICIENT { LAYER_1 { Constant_Value 0.00012345678901 } } }");
  EXPECT_EQ(model.root.nmtSliding->constant.at(1).constant, 0.00012345678901);
  EXPECT_THAT(savedText(*model.root.nmtSliding),
              ::testing::HasSubstr("LAYER_1 {\n            Data_Format 0\n            Constant_Value "
                                   "0.00012345678901\n"));
}

}  // namespace mud_transport_layer_values_test
}  // namespace gridbay

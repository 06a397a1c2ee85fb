// The bed and the water column of expanded mud transport: what each object writes, its defaults and checks.

#include <gmock/gmock.h>

#include "platform/units/units.h"
#include "tests/mud_transport_expanded/bed_fixture.h"
#include "tests/support/grids.h"
#include "tests/support/model.h"
#include "tests/support/temporary_folder.h"

namespace gridbay {
namespace mud_transport_expanded_bed_test {

using test::savedText;
using Texts = std::vector<std::string>;

class ExpandedBed : public ::testing::Test {
 protected:
  ExpandedBed() { test::setFractionsAndLayers(root, 1, 1); }
  // The lines of a value, indented by so many steps.
  static std::string value(int depth, const std::string& constant, const std::string& format = "0",
                           const std::string& file = "", const std::string& items = "1") {
    const std::string indent(static_cast<std::size_t>(depth) * 4, ' ');
    return indent + "Data_Format " + format + "\n" + indent + "Constant_Value " + constant + "\n" + indent +
           "File_Name (file)\"" + file + "\"\n" + indent + "Item_Numbers " + items + "\n";
  }
  // A section with what stands in it.
  static std::string section(int depth, const std::string& name, const std::string& body) {
    const std::string indent(static_cast<std::size_t>(depth) * 4, ' ');
    return body.empty() ? indent + name + " {}\n" : indent + name + " {\n" + body + indent + "}\n";
  }
  template <class Holder>
  static bool set(Holder& holder, std::string_view path, const std::string& line) {
    const std::string documentPath = "/case/setup.v27";
    const KvsHandle file = test::fileOf(line);
    PathAccess access{
        .what = PathAccess::What::set, .in = &file->tree().root(), .documentPath = &documentPath};
    return holder.AccessPath(path, access);
  }
  template <class Holder>
  static std::string get(Holder& holder, std::string_view path) {
    const std::string documentPath = "/case/setup.v27";
    const KvsHandle file = kvsCreate();
    PathAccess access{.what = PathAccess::What::write, .out = file.get(), .documentPath = &documentPath};
    return holder.AccessPath(path, access) ? *file->text() : "none";
  }

  test::TemporaryFolder folder;
  test::Model model;
  CGlobalKvs& root = model.root;
};

// What the lists with a value for each layer, or fraction, and area differ in.
struct ListCase {
  const char* name;
  CKvsBase& (*object)(CGlobalKvs&);
  PageId page;
  const char* section;                // empty for none
  const char* before;                 // the keywords in front of the entries
  const char* inside;                 // the section in that, empty for none
  const char* entry;                  // what an entry is called, without its number
  const char* inEntry;                // the keywords in front of its areas
  std::vector<const char*> defaults;  // by entry
  int entriesLess;                    // than the count
};
void PrintTo(const ListCase& it, std::ostream* out) {
  *out << it.name;
}

template <auto member>
CKvsBase& objectOf(CGlobalKvs& root) {
  return *(root.*member);
}

class ExpandedLists : public ExpandedBed, public ::testing::WithParamInterface<ListCase> {
 protected:
  // The text of n entries with one of the lines in place of the default values.
  std::string text(int n, int areas, int filledEntry = 0) {
    const ListCase& it = GetParam();
    int depth = 0;
    const auto below = [&depth](const char* name) { depth += *name == '\0' ? 0 : 1; };
    below(it.section);
    const int beforeDepth = depth;
    below(it.inside);
    const int at = depth;
    std::string entries;
    for (int entry = 1; entry <= n; ++entry) {
      std::string body = lines(at + 1, it.inEntry);
      if (entry > 1 && std::string(it.inEntry).find("Erosion_Description") == 0)
        body.replace(body.find(" 1\n"), 3, " 0\n");
      for (int area = 1; area <= areas; ++area) {
        const bool isFilled = entry == filledEntry && area == areas;
        body += section(at + 1, "AREA_" + std::to_string(area),
                        isFilled ? value(at + 2, "2.5", "1", "m.tsb2", "3")
                                 : value(at + 2, it.defaults[static_cast<std::size_t>(entry) - 1]));
      }
      entries += section(at, it.entry + std::to_string(entry), body);
    }
    if (*it.inside != '\0') entries = section(beforeDepth, it.inside, entries);
    entries = lines(beforeDepth, it.before) + entries;
    return *it.section == '\0' ? entries : section(0, it.section, entries);
  }
  // Lines with an indent.
  static std::string lines(int depth, const std::string& text) {
    std::string indented;
    for (std::size_t at = 0; at < text.size();) {
      const std::size_t end = text.find('\n', at) + 1;
      indented += std::string(static_cast<std::size_t>(depth) * 4, ' ') + text.substr(at, end - at);
      at = end;
    }
    return indented;
  }
  CKvsBase& object() { return GetParam().object(root); }
  static int entries(int count) { return count - GetParam().entriesLess; }
};

TEST_P(ExpandedLists, FollowTheirCountsWithTheDefaultsOfTheirPlaces) {
  EXPECT_EQ(savedText(object()), text(entries(1), 1));
  test::setFractionsAndLayers(root, 5, 5);
  EXPECT_EQ(savedText(object()), text(entries(5), 1));
  root.bathymetry->SetNoAreas(3);
  EXPECT_EQ(savedText(object()), text(entries(5), 3));
  root.bathymetry->SetNoAreas(2);
  test::setFractionsAndLayers(root, 2, 2);
  EXPECT_EQ(savedText(object()), text(entries(2), 2));
}

TEST_P(ExpandedLists, AreReadBackAndCopied) {
  root.bathymetry->SetNoAreas(2);
  test::setFractionsAndLayers(root, 3, 3);
  const std::string filled = text(entries(3), 2, 2);
  test::load(object(), filled);
  EXPECT_TRUE(model.host.texts.empty());
  EXPECT_EQ(savedText(object()), filled);
  test::Model other;
  other.root.AssignState(root);
  EXPECT_EQ(savedText(GetParam().object(other.root)), filled);
  test::Model copy;
  copy.root.bathymetry->SetNoAreas(2);
  test::setFractionsAndLayers(copy.root, 3, 3);
  GetParam().object(copy.root).CopyFrom(object());
  EXPECT_EQ(savedText(GetParam().object(copy.root)), filled);
}

TEST_P(ExpandedLists, MissingSectionsArePassedOver) {
  test::setFractionsAndLayers(root, 2, 2);
  const ListCase& it = GetParam();
  test::load(object(), "");
  test::load(object(), *it.section == '\0' ? "Other 1" : std::string(it.section) + " {}");
  EXPECT_TRUE(model.host.texts.empty());
  EXPECT_EQ(savedText(object()), text(entries(2), 1));
}

TEST_P(ExpandedLists, AMapFitsItsAreaAndHasOneItemOfAnyQuantity) {
  root.bathymetry->SetNoAreas(2);
  test::setFractionsAndLayers(root, 3, 3);
  CBathymetryObjectKvs& area = root.bathymetry->at(2);
  area.noJ = 7;
  area.noK = 4;
  area.dx = area.dy = 10;
  test::load(object(), text(entries(3), 2, 2), folder.file("setup.v27"));
  const std::string path = folder.file("m.tsb2");
  const auto write = [&](int noJ, int steps, double step) {
    TsbDefinition definition;
    definition.time.step = step;
    definition.time.count = static_cast<std::size_t>(steps);
    definition.axes = {{static_cast<std::size_t>(noJ), 0, 10, "m"}, {4, 0, 10, "m"}};
    for (const int quantity : {item::kWaterLevel, item::kSalinity, item::kRoughnessHeight})
      definition.items.push_back({"Item", quantity, std::string(qunBaseUnit(quantity)->text)});
    test::writeFile(path, definition);
  };
  const auto check = [&](int deep = 1) {
    const ValidationList messages = test::messagesOf(object(), deep);
    for (const CMessage& message : messages) {
      EXPECT_EQ(message.page, GetParam().page);
      EXPECT_EQ(message.severity, Severity::fault);
    }
    return test::textsOf(messages);
  };
  const Texts invalid{"Data file  \" m.tsb2\"  is not valid"};
  EXPECT_EQ(check(), invalid);
  EXPECT_TRUE(check(0).empty());
  write(7, 1, 3000);
  EXPECT_TRUE(check().empty());
  write(6, 1, 3000);
  EXPECT_EQ(check(), invalid);
  write(7, 2, 10);  // varies, and ends before the simulation
  EXPECT_EQ(check(), invalid);
  write(7, 2, 3000);
  EXPECT_TRUE(check().empty());
}

constexpr const char* kSettlingKeywords =
    "RhoSed 2650.0\nGelPoint 50.0\nCHinder 10.0\nC1Salt -0.33\nC2Salt 0.01\nCfloc 0.0\n";

INSTANTIATE_TEST_SUITE_P(
    All, ExpandedLists,
    ::testing::Values(ListCase{"Deposition", objectOf<&CGlobalKvs::nmtExpDeposition>, PageId::mtExpDeposition,
                               "DEPOSITION_PARAMETERS",
                               "Sediment_Profile_Description 1\nCentroidHeight 0.3\n",
                               "CRITICAL_SHEAR_STRESS_DEPOSITION", "SEDIMENT_FRACTION_", "",
                               std::vector<const char*>(5, "0.07"), 0},
                      ListCase{"SettlingPar", objectOf<&CGlobalKvs::nmtExpSettlingPar>,
                               PageId::mtExpSettlingPar, "", kSettlingKeywords, "", "SEDIMENT_FRACTION_",
                               "Gamma 1.0\nWsn 1.0\n", std::vector<const char*>(5, "0.0005"), 0},
                      ListCase{"ErosionCoefficient", objectOf<&CGlobalKvs::nmtExpErosionCoefficient>,
                               PageId::mtExpErosionCoefficient, "", "", "", "BED_LAYER_",
                               "Erosion_Description 1\nEm 1.0\n", std::vector<const char*>(5, "5e-05"), 0},
                      ListCase{"CriticalShearStress",
                               objectOf<&CGlobalKvs::nmtExpCriticalShearStress>,
                               PageId::mtExpCriticalShearStress,
                               "CRITICAL_SHEAR_STRESS_EROSION",
                               "",
                               "",
                               "BED_LAYER_",
                               "",
                               {"0.1", "0.25", "0.4", "0.55", "0.7"},
                               0},
                      ListCase{"BedDensity",
                               objectOf<&CGlobalKvs::nmtExpBedDensity>,
                               PageId::mtExpBedDensity,
                               "DENSITY_OF_BED_MATERIAL",
                               "",
                               "",
                               "BED_LAYER_",
                               "",
                               {"180.0", "300.0", "450.0", "600.0", "750.0"},
                               0},
                      ListCase{"ConstFrictionCoef", objectOf<&CGlobalKvs::nmtExpConstFrictionCoef>,
                               PageId::mtExpConstFrictionCoef, "Constant_sliding_coefficient", "", "",
                               "BED_LAYER_", "", std::vector<const char*>(5, "0.0001"), 0},
                      ListCase{"Transition", objectOf<&CGlobalKvs::nmtExpTransition>, PageId::mtExpTransition,
                               "TRANSITION_OF_MUD_BETWEEN_LAYERS",
                               "Include_transition_of_mud_within_layers 0\n", "", "Layer_", "",
                               std::vector<const char*>(5, "1.0"), 1}),
    [](const auto& it) { return it.param.name; });

TEST_F(ExpandedBed, ALayerThatComesBackHasTheDefaultsOfItsPlace) {
  test::setFractionsAndLayers(root, 1, 3);
  root.nmtExpBedDensity->at(3).at(1).value = 7;
  root.nmtExpErosionLayer->at(2).description = 5;
  test::setFractionsAndLayers(root, 1, 1);
  test::setFractionsAndLayers(root, 1, 3);
  EXPECT_EQ(root.nmtExpBedDensity->at(3).at(1).value, 450);
  EXPECT_EQ(root.nmtExpErosionLayer->at(2).description, 0);
  root.nmtExpBedDensity->at(2).at(1).value = 8;  // what stays is kept
  root.bathymetry->SetNoAreas(2);
  EXPECT_EQ(root.nmtExpBedDensity->at(2).at(1).value, 8);
  EXPECT_EQ(root.nmtExpBedDensity->at(2).at(2).value, 300);
}

TEST_F(ExpandedBed, AModelOfNoLayersHasNoTransitions) {
  test::setFractionsAndLayers(root, 1, 0);
  EXPECT_EQ(root.nmtExpTransition->GetCount(), 0);
  EXPECT_EQ(savedText(*root.nmtExpErosionCoefficient), "");
}

TEST_F(ExpandedBed, ListsByAreaInFileOrder) {
  root.bathymetry->SetNoAreas(2);
  EXPECT_EQ(savedText(*root.nmtExpBedRoughness),
            section(0, "BED_ROUGHNESS",
                    section(1, "AREA_1", value(2, "0.001")) + section(1, "AREA_2", value(2, "0.001"))));
  EXPECT_EQ(savedText(*root.nmtExpVarFrictionCoef),
            section(0, "Variable_sliding_coefficient",
                    "    Solid_Density 2650.0\n" + section(1, "AREA_1", value(2, "0.0001")) +
                        section(1, "AREA_2", value(2, "0.0001"))));
  const std::string filled = section(0, "Variable_sliding_coefficient",
                                     "    Solid_Density 2600.0\n" + section(1, "AREA_1", value(2, "0.5")) +
                                         section(1, "AREA_2", value(2, "0.25", "1", "none.tsb2", "2")));
  test::load(*root.nmtExpVarFrictionCoef, filled);
  EXPECT_EQ(savedText(*root.nmtExpVarFrictionCoef), filled);
  test::load(*root.nmtExpBedRoughness, "BED_ROUGHNESS { AREA_2 { Data_Format 1; Constant_Value 2.0 } }");
  EXPECT_EQ(savedText(*root.nmtExpBedRoughness),
            section(0, "BED_ROUGHNESS",
                    section(1, "AREA_1", value(2, "0.001")) + section(1, "AREA_2", value(2, "2.0", "1"))));
  EXPECT_TRUE(model.host.texts.empty());
  const auto check = [](CKvsBase& object, PageId page) {
    const ValidationList messages = test::messagesOf(object);
    for (const CMessage& message : messages) EXPECT_EQ(message.page, page);
    return test::textsOf(messages);
  };
  EXPECT_EQ(check(*root.nmtExpVarFrictionCoef, PageId::mtExpVarFrictionCoef),
            Texts{"Data file  \" none.tsb2\"  is not valid"});
  EXPECT_EQ(check(*root.nmtExpBedRoughness, PageId::mtExpBedRoughness),
            Texts{"Data file  \" \"  is not valid"});
  root.bathymetry->SetNoAreas(1);
  EXPECT_EQ(root.nmtExpBedRoughness->GetCount(), 1);
  EXPECT_TRUE(check(*root.nmtExpVarFrictionCoef, PageId::mtExpVarFrictionCoef).empty());
}

TEST_F(ExpandedBed, SwitchesOfTheBedInFileOrder) {
  EXPECT_EQ(savedText(*root.nmtExpSliding), "Include_sliding 0\nInclude_variable_sliding_coefficient 0\n");
  EXPECT_EQ(savedText(*root.nmtExpMorphology),
            "MORPHOLOGY {\n    Include_Morphology 0\n    Include_Speedup_Factor 0\n    Speedup_Factor "
            "1.0\n}\n");
  EXPECT_EQ(savedText(*root.nmtExpErosionLayer), "CMax 50.0\n");
  EXPECT_EQ(savedText(*root.nmtExpPowerOfErosion), "");
  const std::string sliding = "Include_sliding 1\nInclude_variable_sliding_coefficient 2\n";
  test::load(*root.nmtExpSliding, sliding);
  EXPECT_EQ(savedText(*root.nmtExpSliding), sliding);
  const std::string morphology =
      "MORPHOLOGY {\n    Include_Morphology 1\n    Include_Speedup_Factor 1\n    Speedup_Factor 12.5\n}\n";
  test::load(*root.nmtExpMorphology, morphology);
  EXPECT_EQ(savedText(*root.nmtExpMorphology), morphology);
  test::load(*root.nmtExpErosionLayer, "CMax 80.0");
  EXPECT_EQ(savedText(*root.nmtExpErosionLayer), "CMax 80.0\n");
}

TEST_F(ExpandedBed, DescriptionAndPowerOfALayerStandWithItsErosionCoefficient) {
  test::setFractionsAndLayers(root, 1, 2);
  const std::string text =
      section(0, "BED_LAYER_1",
              "    Erosion_Description 0\n    Em 2.5\n" + section(1, "AREA_1", value(2, "5e-05"))) +
      section(0, "BED_LAYER_2",
              "    Erosion_Description 1\n    Em 1.0\n" + section(1, "AREA_1", value(2, "0.25")));
  test::load(*root.nmtExpErosionCoefficient, text);
  EXPECT_EQ(root.nmtExpErosionLayer->at(1).description, CNmtExpErosionDescriptionObjectKvs::kDense);
  EXPECT_EQ(root.nmtExpErosionLayer->at(2).description, CNmtExpErosionDescriptionObjectKvs::kSoft);
  EXPECT_EQ(root.nmtExpPowerOfErosion->at(1).power, 2.5F);
  EXPECT_EQ(savedText(*root.nmtExpErosionCoefficient), text);

  test::Model twin;
  twin.root.AssignState(root);
  EXPECT_EQ(savedText(*twin.root.nmtExpErosionCoefficient), text);
  EXPECT_TRUE(set(*root.nmtExpErosionCoefficient, "BED_LAYER_2/Em", "Em 3.5"));
  EXPECT_EQ(root.nmtExpPowerOfErosion->at(2).power, 3.5F);
  EXPECT_EQ(get(*root.nmtExpErosionCoefficient, "BED_LAYER_2/Em"), "Em 3.5\n");
  EXPECT_TRUE(
      set(*root.nmtExpErosionCoefficient, "BED_LAYER_1/Erosion_Description", "Erosion_Description 7"));
  EXPECT_EQ(root.nmtExpErosionLayer->at(1).description, 7);
  const auto change = root.nmtExpPowerOfErosion->TakeChange(*twin.root.nmtExpPowerOfErosion);
  ASSERT_NE(change, nullptr);
  EXPECT_EQ(twin.root.nmtExpPowerOfErosion->at(2).power, 3.5F);
  change->apply(*twin.root.nmtExpPowerOfErosion, false);
  EXPECT_EQ(twin.root.nmtExpPowerOfErosion->at(2).power, 1);
  twin.root.nmtExpErosionLayer->CopyFrom(*root.nmtExpErosionLayer);
  EXPECT_EQ(twin.root.nmtExpErosionLayer->at(1).description, 7);

  CNmtExpErosionCoefficientKvs apart(nullptr);  // of no model: what stands elsewhere is missing
  apart.SetCount(1);
  EXPECT_EQ(savedText(apart), "BED_LAYER_1 {}\n");
}

TEST_F(ExpandedBed, TransitionIsHeldInverted) {
  CNmtExpTransitionKvs& transition = *root.nmtExpTransition;
  EXPECT_EQ(transition.isExcluded, 1);
  const auto saved = [&] { return savedText(transition).substr(39, 41); };
  EXPECT_EQ(saved(), "Include_transition_of_mud_within_layers 0");
  test::load(transition, "TRANSITION_OF_MUD_BETWEEN_LAYERS { Include_transition_of_mud_within_layers 1 }");
  EXPECT_EQ(transition.isExcluded, 0);
  EXPECT_EQ(saved(), "Include_transition_of_mud_within_layers 1");
  test::load(transition, "TRANSITION_OF_MUD_BETWEEN_LAYERS {}");
  EXPECT_EQ(transition.isExcluded, 0);
  test::load(transition, "TRANSITION_OF_MUD_BETWEEN_LAYERS { Include_transition_of_mud_within_layers 0 }");
  EXPECT_EQ(transition.isExcluded, 1);
}

TEST_F(ExpandedBed, ViscosityIsKeptAndNotWritten) {
  CNmtExpWaterColParametersKvs& water = *root.nmtExpWaterColParameters;
  EXPECT_EQ(water.c1Visc, 10);
  EXPECT_EQ(water.c2Visc, 600);
  water.c1Visc = 11;
  EXPECT_EQ(savedText(water), "VISCOSITY_PARAMETERS {}\n");
  test::load(water, "VISCOSITY_PARAMETERS { C1Visc 5.0 }");
  EXPECT_EQ(water.c1Visc, 11);
  CNmtExpWaterColParametersKvs copy(nullptr);
  EXPECT_FALSE(copy.SameState(water));
  copy.CopyFrom(water);
  EXPECT_TRUE(copy.SameState(water));
}

TEST_F(ExpandedBed, SandFractionsInFileOrder) {
  test::setFractionsAndLayers(root, 2, 1);
  CNmtExpSandFractionsKvs& sand = *root.nmtExpSandFractions;
  EXPECT_EQ(savedText(sand),
            "SAND_FRACTIONS {\n    Sand_Fraction_Description 0\n    Sand_fraction_1 1\n"
            "    Mean_Fall_Velocity_Fraction_1 0.001\n    Sand_fraction_2 1\n"
            "    Mean_Fall_Velocity_Fraction_2 0.001\n}\n");
  const std::string filled =
      "SAND_FRACTIONS {\n    Sand_Fraction_Description 1\n    Sand_fraction_1 0\n"
      "    Mean_Fall_Velocity_Fraction_1 0.02\n    Sand_fraction_2 1\n"
      "    Mean_Fall_Velocity_Fraction_2 0.5\n}\n";
  test::load(sand, filled);
  EXPECT_EQ(savedText(sand), filled);
  CNmtExpSandFractionsKvs copy(nullptr);
  copy.CopyFrom(sand);
  EXPECT_EQ(savedText(copy), filled);
  test::load(sand, "SAND_FRACTIONS { Sand_fraction_2 0; Sand_fraction_3 1 }");  // the rest stays
  EXPECT_EQ(sand.at(1).meanFallVelocity, 0.02F);
  EXPECT_EQ(sand.at(2).isSand, 0);
  EXPECT_EQ(sand.GetCount(), 2);

  EXPECT_TRUE(set(sand, "SAND_FRACTIONS/Sand_fraction_2", "Sand_fraction_2 1"));
  EXPECT_EQ(sand.at(2).isSand, 1);
  EXPECT_TRUE(set(sand, "SAND_FRACTIONS/mean_fall_velocity_fraction_2", "Mean_Fall_Velocity_Fraction_2 3.5"));
  EXPECT_EQ(sand.at(2).meanFallVelocity, 3.5F);
  EXPECT_EQ(get(sand, "SAND_FRACTIONS/Sand_fraction_1"), "Sand_fraction_1 0\n");
  EXPECT_EQ(get(sand, "SAND_FRACTIONS/Sand_Fraction_Description"), "Sand_Fraction_Description 1\n");
  EXPECT_EQ(get(sand, "SAND_FRACTIONS/Sand_fraction_3"), "none");
  test::Model twin;
  twin.root.AssignState(root);
  sand.at(1).isSand = 1;
  const auto change = sand.TakeChange(*twin.root.nmtExpSandFractions);
  ASSERT_NE(change, nullptr);
  change->apply(sand, false);
  EXPECT_EQ(sand.at(1).isSand, 0);
}

TEST_F(ExpandedBed, SettlingIsReadByOtherNamesThanItIsWritten) {
  CNmtExpSettlingsKvs& settlings = *root.nmtExpSettlings;
  const auto text = [](int flocculation, int hindered) {
    return "Flocculation_Description " + std::to_string(flocculation) + "\nHindered_Settling_Description " +
           std::to_string(hindered) + "\n";
  };
  EXPECT_EQ(settlings.noFlocculation, 1);
  EXPECT_EQ(settlings.formulation, 1);
  EXPECT_EQ(savedText(settlings), text(0, 0));
  settlings.hinderedSettling = 1;
  EXPECT_EQ(savedText(settlings), text(0, 2));
  settlings.formulation = 0;
  EXPECT_EQ(savedText(settlings), text(0, 1));
  settlings.noFlocculation = 0;
  EXPECT_EQ(savedText(settlings), text(1, 1));

  CNmtExpSettlingsKvs loaded(nullptr);
  test::load(loaded, text(1, 1));  // hindered settling does not come back
  EXPECT_EQ(savedText(loaded), text(1, 0));
  test::load(loaded, "Settling_Description 1");
  EXPECT_EQ(loaded.hinderedSettling, 1);
  EXPECT_EQ(savedText(loaded), text(1, 2));
  test::load(loaded, "Flocculation_Description 0");
  EXPECT_EQ(loaded.noFlocculation, 1);
  loaded.formulation = 0;
  test::load(loaded, "Flocculation_Description 1");
  EXPECT_EQ(loaded.noFlocculation, 0);
  EXPECT_EQ(loaded.formulation, 0);
  loaded.noFlocculation = 1;
  test::load(loaded, "Flocculation_Description 2");
  EXPECT_EQ(loaded.noFlocculation, 0);
  EXPECT_EQ(loaded.formulation, 1);
  for (const char* other : {"Flocculation_Description 3", "Flocculation_Description -1", ""}) {
    test::load(loaded, other);
    EXPECT_EQ(loaded.noFlocculation, 0) << other;
  }

  EXPECT_TRUE(set(loaded, "Hindered_Settling_Description", "Hindered_Settling_Description 1"));
  EXPECT_EQ(savedText(loaded), text(1, 1));
  EXPECT_TRUE(set(loaded, "Hindered_Settling_Description", "Hindered_Settling_Description 3"));
  EXPECT_EQ(savedText(loaded), text(1, 1));
  EXPECT_TRUE(set(loaded, "Hindered_Settling_Description", "Hindered_Settling_Description 0"));
  EXPECT_EQ(savedText(loaded), text(1, 0));
  settlings.hinderedSettling = 1;
  loaded.CopyFrom(settlings);
  EXPECT_TRUE(loaded.SameState(settlings));
}

TEST_F(ExpandedBed, ANewFallVelocityIsTheCoefficientWithFlocculation) {
  root.nmtExpSettlings->noFlocculation = 0;
  test::setFractionsAndLayers(root, 2, 1);
  EXPECT_EQ(root.nmtExpSettlingPar->at(1).at(1).value, 0.0005F);
  EXPECT_EQ(root.nmtExpSettlingPar->at(2).at(1).value, 5);
  root.nmtExpSettlings->noFlocculation = 1;
  root.bathymetry->SetNoAreas(2);
  EXPECT_EQ(root.nmtExpSettlingPar->at(2).at(2).value, 0.0005F);
}

TEST_F(ExpandedBed, SettlingParametersAreReadBack) {
  const std::string text =
      "RhoSed 2600.0\nGelPoint 60.0\nCHinder 12.5\nC1Salt -0.5\nC2Salt 0.25\nCfloc 0.125\n" +
      section(0, "SEDIMENT_FRACTION_1",
              "    Gamma 1.5\n    Wsn 4.5\n" + section(1, "AREA_1", value(2, "0.25")));
  test::load(*root.nmtExpSettlingPar, text);
  EXPECT_EQ(savedText(*root.nmtExpSettlingPar), text);
  test::load(*root.nmtExpDeposition,
             "DEPOSITION_PARAMETERS { Sediment_Profile_Description 0; CentroidHeight 0.5 }");
  EXPECT_EQ(root.nmtExpDeposition->sedimentProfile, CNmtExpDepositionKvs::kRouse);
  EXPECT_EQ(root.nmtExpDeposition->centroidHeight, 0.5F);
}

class ExpandedDredging : public ExpandedBed {
 protected:
  static Texts faults(CKvsBase& object) {
    Texts texts;
    for (const CMessage& message : test::messagesOf(object)) {
      const bool isFile = message.text.find("Data file") == 0;
      EXPECT_EQ(message.page, isFile ? PageId::mtExpStartingConditions : PageId::mtExpDredgings);
      EXPECT_EQ(message.severity, isFile ? Severity::dependedUpon : Severity::fault);
      texts.push_back(message.text);
    }
    return texts;
  }
  void write(std::vector<int> quantities, bool covers = true) {
    TsbDefinition definition;
    definition.time.step = covers ? 3000 : 10;
    definition.time.count = 2;
    for (const int quantity : quantities)
      definition.items.push_back({"Item", quantity, std::string(qunBaseUnit(quantity)->text)});
    test::writeFile(path, definition);
  }

  CNmtExpDredgingsKvs& dredgers = *root.nmtExpDredgings;
  std::string path = folder.file("d.tsb0");
};

TEST_F(ExpandedDredging, InFileOrder) {
  EXPECT_EQ(savedText(dredgers), "Number_of_active_dredgers 0\nUpdate_bed #false\n");
  test::setFractionsAndLayers(root, 4, 1);
  root.bathymetry->SetNoAreas(3);
  dredgers.SetCount(1);
  EXPECT_EQ(savedText(dredgers),
            "Number_of_active_dredgers 1\nUpdate_bed #false\nDredger_Nr_1 {\n    Fraction_1 0.25\n"
            "    Fraction_2 0.25\n    Fraction_3 0.25\n    Fraction_4 0.25\n    coordinate_type \"UTM-32\"\n"
            "    File_Name (file)\"\"\n    Item_Numbers 1 2 3 4\n    Nesting_for_dredging 3\n}\n");
  root.bathymetry->projection = "UTM-56S";
  dredgers.SetCount(2);
  EXPECT_EQ(dredgers.at(2).coordinateType, "UTM-56S");
  const std::string filled =
      "Number_of_active_dredgers 1\nUpdate_bed #true\nDredger_Nr_1 {\n    Fraction_1 0.5\n"
      "    Fraction_2 0.125\n    Fraction_3 0.25\n    Fraction_4 0.125\n    coordinate_type \"mine\"\n"
      "    File_Name (file)\"d.tsb0\"\n    Item_Numbers 2 3 4 5\n    Nesting_for_dredging 2\n}\n";
  test::load(dredgers, filled);
  EXPECT_EQ(savedText(dredgers), filled);
  CNmtExpDredgingItemKvs copy(nullptr);
  copy.CopyFrom(dredgers.at(1));
  EXPECT_TRUE(copy.SameState(dredgers.at(1)));
  test::load(dredgers, "Update_bed #false");  // a count that is missing is none
  EXPECT_EQ(dredgers.GetCount(), 0);
  test::load(dredgers, "Number_of_active_dredgers 2");
  EXPECT_EQ(dredgers.at(2).weights[3], 0.25F);
  EXPECT_TRUE(model.host.texts.empty());
}

TEST_F(ExpandedDredging, WeightsByFraction) {
  test::setFractionsAndLayers(root, 2, 1);
  dredgers.SetCount(1);
  EXPECT_TRUE(set(dredgers, "Dredger_Nr_1/Fraction_2", "Fraction_2 0.75"));
  EXPECT_EQ(dredgers.at(1).weights[1], 0.75F);
  EXPECT_EQ(get(dredgers, "Dredger_Nr_1/Fraction_1"), "Fraction_1 0.5\n");
  for (const char* none : {"Dredger_Nr_1/Fraction_3", "Dredger_Nr_1/Fraction_0", "Dredger_Nr_2/Fraction_1"})
    EXPECT_EQ(get(dredgers, none), "none") << none;
  test::setFractionsAndLayers(root, 9, 1);  // eight at most
  EXPECT_EQ(dredgers.at(1).WeightCount(), 8);
  dredgers.SetCount(2);
  EXPECT_EQ(get(dredgers, "Dredger_Nr_2/Fraction_8"), "Fraction_8 0.11111111\n");
  EXPECT_EQ(get(dredgers, "Dredger_Nr_2/Fraction_9"), "none");
  test::setFractionsAndLayers(root, 0, 1);
  dredgers.SetCount(3);
  EXPECT_EQ(dredgers.at(3).weights[0], 1);
}

TEST_F(ExpandedDredging, WeightsAddUpToOne) {
  test::setFractionsAndLayers(root, 4, 1);
  dredgers.SetCount(1);
  write({100183, 100183, 100504, 100505});
  dredgers.at(1).file.fileName = path;
  const auto passes = [this](float weight) {
    std::ranges::fill_n(dredgers.at(1).weights.begin(), 4, weight);
    const Texts texts = faults(dredgers);
    if (!texts.empty()) EXPECT_EQ(texts, Texts{"Total Predefined Weights different from 1.00"});
    return texts.empty();
  };
  EXPECT_TRUE(passes(0.25F));
  EXPECT_FALSE(passes(0.24F));
  EXPECT_TRUE(passes(0.2525F));
  EXPECT_TRUE(passes(0.2475F));
  EXPECT_FALSE(passes(0.253F));
  EXPECT_FALSE(passes(0));
  EXPECT_FALSE(passes(-0.25F));
  EXPECT_TRUE(test::messagesOf(dredgers, 0).empty());
}

TEST_F(ExpandedDredging, AFileTellsPlaceMassAndSpill) {
  dredgers.SetCount(2);
  dredgers.at(1).file.fileName = path;
  dredgers.at(2).file.fileName = path;
  const std::string invalid = "Data file  \" " + path + "\"  is not valid";
  EXPECT_EQ(faults(dredgers), (Texts{invalid, invalid}));
  write({100183, 100183, 100504, 100505});
  EXPECT_TRUE(faults(dredgers).empty());
  write({100183, 100183, 100504, 100505}, false);
  EXPECT_EQ(faults(dredgers), (Texts{invalid, invalid}));
  write({100183, 100183, 100505, 100504});
  EXPECT_EQ(faults(dredgers), (Texts{invalid, invalid}));
  write({100183, 100183, 100504});
  EXPECT_EQ(faults(dredgers), (Texts{invalid, invalid}));
  write({100000, 100183, 100183, 100504, 100505});
  dredgers.at(1).file.items = {2, 3, 4, 5};
  EXPECT_EQ(faults(dredgers), Texts{invalid});
  test::writeGrid(path);
  EXPECT_EQ(faults(dredgers), (Texts{invalid, invalid}));
  dredgers.at(1).weights.fill(2);
  EXPECT_EQ(faults(dredgers), (Texts{"Total Predefined Weights different from 1.00", invalid, invalid}));
}

TEST_F(ExpandedDredging, FewerThanFourItemsAreNone) {
  test::load(dredgers, "Number_of_active_dredgers 1; Dredger_Nr_1 { Item_Numbers 5 6 7 }");
  const std::vector<std::uint32_t> all{1, 2, 3, 4};
  EXPECT_EQ(dredgers.at(1).file.items, all);
  dredgers.at(1).file.items = {3};
  CVdFileSelectorDlg selector;
  dredgers.at(1).RequestDataFile(selector, 1);
  EXPECT_EQ(dredgers.at(1).file.items, all);
  std::vector<int> types;
  Texts labels;
  for (const auto& request : selector.requests()) {
    types.push_back(request->types().front());
    labels.push_back(request->description());
  }
  EXPECT_EQ(labels, (Texts{"X coordinate of dredger", "Y coordinate of dredger", "Dredged mass rate",
                           "Dredging spill"}));
  EXPECT_EQ(types, (std::vector<int>{100183, 100183, 100504, 100505}));
}

}  // namespace mud_transport_expanded_bed_test
}  // namespace gridbay

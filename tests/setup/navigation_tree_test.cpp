#include "setup/navigation_tree.h"

#include <gtest/gtest.h>

#include "advection_dispersion/component.h"
#include "advection_dispersion/starting_conditions.h"
#include "basic/bathymetry.h"
#include "basic/mass_budget.h"
#include "basic/module_selection.h"
#include "core/edition.h"
#include "ecology/starting_conditions.h"
#include "hydrodynamic/infiltration.h"
#include "hydrodynamic/resistance.h"
#include "hydrodynamic/source_sink.h"
#include "mud_transport/erosion_characteristics.h"
#include "mud_transport/sliding.h"
#include "mud_transport/starting_conditions.h"
#include "mud_transport/task_selection.h"
#include "mud_transport_expanded/forcings.h"
#include "mud_transport_expanded/sand_fractions.h"
#include "mud_transport_expanded/sliding.h"
#include "mud_transport_expanded/starting_conditions.h"
#include "mud_transport_expanded/task_selection.h"
#include "mud_transport_expanded/waves.h"
#include "tests/support/model.h"

namespace gridbay {
namespace setup_navigation_tree_test {

class NavigationTree : public ::testing::Test {
 protected:
  NavigationTree() { tree.OnInitialUpdate(&model.root); }
  // The roots that are seen with a module code, in the order of the screen.
  std::vector<std::int32_t> rootsWith(std::int32_t code) {
    model.root.moduleSelection->simulationType = code;
    tree.OnUpdate(&model.root);
    std::vector<std::int32_t> roots;
    for (const TreeItem& item : tree.items()) {
      if (item.parent < 0 && tree.IsVisible(item)) roots.push_back(item.id);
    }
    return roots;
  }
  std::vector<std::int32_t> childrenOf(std::int32_t id) {
    std::vector<std::int32_t> children;
    for (const TreeItem& item : tree.items()) {
      if (item.parent >= 0 && tree.items()[static_cast<std::size_t>(item.parent)].id == id)
        children.push_back(item.id);
    }
    return children;
  }
  using Ids = std::vector<std::int32_t>;
  test::Model model;
  CDlgEnumerator enumerator;
  CNavigationView tree{enumerator};
};

TEST_F(NavigationTree, OrderAndCaptions) {
  const bool sweep = theEdition.wetlandSweepKit;
  EXPECT_EQ(tree.items().size(), sweep ? 134U + 8 - 5 : 134U + 8);
  EXPECT_EQ(tree.items()[0].caption, sweep ? "VANE 27 WSK" : "VANE 27 Flow Model");
  EXPECT_EQ(childrenOf(2), sweep ? (Ids{27, 39, 28, 40, 26}) : (Ids{35, 27, 39, 28, 40, 26}));
  EXPECT_EQ(childrenOf(4), sweep ? (Ids{43, 29, 41, 143, 37, 142, 42, 38})
                                 : (Ids{34, 43, 29, 41, 143, 46, 32, 37, 44, 142, 42, 38}));
  EXPECT_EQ(childrenOf(42), (Ids{45, 30, 31}));
  EXPECT_EQ(childrenOf(92), (Ids{88, 64, 91}));
  EXPECT_EQ(childrenOf(59), (Ids{53, 55, 56, 57, 54, 58}));
  EXPECT_EQ(childrenOf(1), Ids{});
  for (const TreeItem& item : tree.items()) {
    EXPECT_FALSE(item.caption.empty()) << item.id;
    if (item.depth > 0) EXPECT_EQ(item.caption, enumerator.GetCaption(item.id));
  }
}

TEST_F(NavigationTree, RootsByModuleCode) {
  EXPECT_EQ(rootsWith(0), (Ids{1, 2, 4}));
  EXPECT_EQ(rootsWith(2), (Ids{1, 2, 4, 3}));
  EXPECT_EQ(rootsWith(3), (Ids{1, 2, 4, 6}));
  EXPECT_EQ(rootsWith(8), (Ids{1, 2, 4, 5}));
  EXPECT_EQ(rootsWith(9), (Ids{1, 2, 4, 7}));
  EXPECT_EQ(rootsWith(11), (Ids{1, 2, 4}));
}

TEST_F(NavigationTree, AnotherCodeLeavesTheRootsAndRunsTheOtherRules) {
  rootsWith(3);
  model.root.bathymetry->hotStart = 1;
  EXPECT_EQ(rootsWith(1), (Ids{1, 2, 4, 6}));
  EXPECT_FALSE(tree.IsVisible(26));
}

TEST_F(NavigationTree, WavesShowWhereTheyInduceTheResistance) {
  for (const std::int32_t formulation : {0, 2, 1, 2, 3}) {
    model.root.nhdResistance->formulation = formulation;
    tree.OnUpdate(&model.root);
    EXPECT_EQ(tree.IsVisible(142), formulation == 2) << formulation;
  }
}

TEST_F(NavigationTree, AHotStartHidesAndShowsTwoPages) {
  EXPECT_TRUE(tree.IsVisible(26));
  model.root.bathymetry->hotStart = 1;
  tree.OnUpdate(&model.root);
  EXPECT_FALSE(tree.IsVisible(26));
  EXPECT_FALSE(tree.IsVisible(43));
  model.root.bathymetry->hotStart = 0;
  tree.OnUpdate(&model.root);
  EXPECT_TRUE(tree.IsVisible(26));
  EXPECT_TRUE(tree.IsVisible(43));
}

TEST_F(NavigationTree, RainAndEvaporationHaveConcentrationsWhileTheyAreOn) {
  CNhdSourceSinkKvs& flows = *model.root.nhdSourceSink;
  // Rain of both modules, then evaporation of both.
  const auto shown = [this] {
    tree.OnUpdate(&model.root);
    std::string all;
    for (const std::int32_t id : {22, 113, 15, 112}) all += tree.IsShown(id) ? 'x' : '.';
    return all;
  };
  EXPECT_EQ(shown(), "....");
  flows.netPrecipitation = true;
  EXPECT_EQ(shown(), "....");
  flows.precipitation = 0.5F;
  EXPECT_EQ(shown(), "xxxx");
  flows.netPrecipitation = false;
  EXPECT_EQ(shown(), "xx..");
  flows.precipitation = -1;
  EXPECT_EQ(shown(), "....");
  flows.precipitationKind = CNhdSourceSinkKvs::kMap;
  EXPECT_EQ(shown(), "xx..");
  flows.precipitationKind = CNhdSourceSinkKvs::kConstant;
  flows.evaporation = 1;
  EXPECT_EQ(shown(), "..xx");
  flows.evaporation = 0;
  flows.evaporationKind = CNhdSourceSinkKvs::kTimeSeries;
  EXPECT_EQ(shown(), "..xx");
  rootsWith(2);
  EXPECT_TRUE(tree.IsVisible(15));
  EXPECT_FALSE(tree.IsVisible(112));
}

TEST_F(NavigationTree, InfiltrationHasConcentrationsWithAType) {
  for (const std::int32_t type : {0, 1, 2, 0}) {
    model.root.nhdInfiltration->infiltrationType = type;
    tree.OnUpdate(&model.root);
    EXPECT_EQ(tree.IsShown(145), type != 0);
    EXPECT_EQ(tree.IsShown(146), type != 0);
  }
  model.root.nhdInfiltration->infiltrationType = 1;
  rootsWith(9);
  EXPECT_TRUE(tree.IsVisible(146));
  EXPECT_FALSE(tree.IsVisible(145));
}

TEST_F(NavigationTree, AHotStartOfTheTransportHidesItsInitialConcentrationsForGood) {
  rootsWith(2);
  EXPECT_TRUE(tree.IsVisible(19));
  model.root.nadStartingConditions->hotStart = true;
  tree.OnUpdate(&model.root);
  EXPECT_FALSE(tree.IsVisible(19));
  model.root.nadStartingConditions->hotStart = false;
  tree.OnUpdate(&model.root);
  EXPECT_FALSE(tree.IsVisible(19));
  tree.OnInitialUpdate(&model.root);
  EXPECT_TRUE(tree.IsVisible(19));
}

TEST_F(NavigationTree, AHotStartOfTheEcologicalModelHidesItsInitialConditionsForGood) {
  rootsWith(9);
  EXPECT_TRUE(tree.IsVisible(118));
  model.root.wqsStartingConditions->hotStart = true;
  tree.OnUpdate(&model.root);
  EXPECT_FALSE(tree.IsVisible(118));
  model.root.wqsStartingConditions->hotStart = false;
  tree.OnUpdate(&model.root);
  EXPECT_FALSE(tree.IsVisible(118));
  tree.OnInitialUpdate(&model.root);
  EXPECT_TRUE(tree.IsVisible(118));
}

TEST_F(NavigationTree, PagesForTheTypesOfComponents) {
  CNadComponentKvs& components = *model.root.nadComponent;
  components.SetCount(3);
  // Decay, heat dissipation and heat exchange, as "x.x".
  const auto shown = [&](int first, int second) {
    components.at(2).type = first;
    components.at(3).type = second;
    rootsWith(2);
    std::string all;
    for (const int id : {12, 17, 18}) all += tree.IsVisible(id) ? 'x' : '.';
    return all;
  };
  EXPECT_EQ(shown(0, 0), "...");
  EXPECT_EQ(shown(1, 0), "x..");
  EXPECT_EQ(shown(1, 1), "x..");
  EXPECT_EQ(shown(2, 0), ".x.");
  EXPECT_EQ(shown(-2, 0), "..x");
  EXPECT_EQ(shown(-2, -2), "...");  // just one may be
  EXPECT_EQ(shown(1, 2), "xx.");
  EXPECT_EQ(shown(3, -1), "...");
}

TEST_F(NavigationTree, MassBudgetPagesNeedModuleSchemeAndPolygon) {
  const auto visible = [this](std::int32_t code, std::int32_t scheme, int polygons, std::int32_t id) {
    model.root.moduleSelection->simulationType = code;
    model.root.moduleSelection->adScheme = scheme;
    model.root.massBudget->SetNoPolygons(polygons);
    tree.OnUpdate(&model.root);
    return tree.IsVisible(id);
  };
  for (const auto& [code, id] : {std::pair{2, 21}, {8, 76}, {9, 119}}) {
    EXPECT_TRUE(visible(code, 1, 1, id));
    EXPECT_TRUE(visible(code, -1, 1, id));
    EXPECT_FALSE(visible(code, 5, 1, id));
    EXPECT_FALSE(visible(code, 1, 0, id));
  }
  visible(3, 1, 1, 21);
  EXPECT_FALSE(tree.IsShown(21));
}

TEST_F(NavigationTree, TheErosionOfLayersByOneFactorOrTwo) {
  const auto shown = [this] {
    tree.OnUpdate(&model.root);
    std::string all;
    for (const std::int32_t id : {55, 56, 57}) all += tree.IsShown(id) ? 'x' : '.';
    return all;
  };
  EXPECT_EQ(shown(), "x..");
  model.root.nmtMlErosionCharacteristics->useConstantErosionCoefficient = 0;
  EXPECT_EQ(shown(), ".xx");
  model.root.nmtMlErosionCharacteristics->useConstantErosionCoefficient = 1;
  EXPECT_EQ(shown(), "x..");
}

TEST_F(NavigationTree, FrictionOfSlidingLayers) {
  CNmtSlidingKvs& sliding = *model.root.nmtSliding;
  const auto shown = [&](std::int32_t included, std::int32_t variable) {
    sliding.includeSliding = included;
    sliding.includeVariableSlidingCoefficient = variable;
    tree.OnUpdate(&model.root);
    std::string all;
    for (const std::int32_t id : {51, 107}) all += tree.IsShown(id) ? 'x' : '.';
    return all;
  };
  EXPECT_EQ(shown(0, 0), "..");
  EXPECT_EQ(shown(0, 1), "..");
  EXPECT_EQ(shown(1, 0), "x.");
  EXPECT_EQ(shown(1, 1), "xx");
}

TEST_F(NavigationTree, ExpandedSlidingIsForOneArea) {
  rootsWith(8);
  EXPECT_TRUE(tree.IsVisible(83));
  EXPECT_FALSE(tree.IsShown(8));
  model.root.bathymetry->SetNoAreas(2);
  tree.OnUpdate(&model.root);
  EXPECT_FALSE(tree.IsVisible(83));
  model.root.bathymetry->SetNoAreas(1);
  tree.OnUpdate(&model.root);
  EXPECT_TRUE(tree.IsVisible(83));
}

TEST_F(NavigationTree, XenobioticsAreAnOptionOfExpandedMudTransport) {
  model.root.nmtExpTaskSelection->includeXenobiotics = true;
  EXPECT_EQ(rootsWith(8), (Ids{1, 2, 4, 5, 8}));
  EXPECT_EQ(rootsWith(3), (Ids{1, 2, 4, 6}));
  EXPECT_EQ(rootsWith(8), (Ids{1, 2, 4, 5, 8}));
  model.root.nmtExpTaskSelection->includeXenobiotics = false;
  EXPECT_EQ(rootsWith(8), (Ids{1, 2, 4, 5}));
}

TEST_F(NavigationTree, AHotStartOfExpandedMudTransportHidesTwoPagesForGood) {
  rootsWith(8);
  EXPECT_TRUE(tree.IsVisible(86) && tree.IsVisible(74));
  model.root.nmtExpStartingConditions->hotStart = true;
  tree.OnUpdate(&model.root);
  EXPECT_FALSE(tree.IsVisible(86) || tree.IsVisible(74));
  model.root.nmtExpStartingConditions->hotStart = false;
  tree.OnUpdate(&model.root);
  EXPECT_FALSE(tree.IsVisible(86) || tree.IsVisible(74));
  tree.OnInitialUpdate(&model.root);
  EXPECT_TRUE(tree.IsVisible(86) && tree.IsVisible(74));
}

TEST_F(NavigationTree, ExpandedWavesShowThePageOfTheirType) {
  rootsWith(8);
  const auto shown = [this](int included, int type) {
    model.root.nmtExpForcings->includeWaves = included;
    model.root.nmtExpWaves->typeOfWaveVariation = type;
    tree.OnUpdate(&model.root);
    std::string all;
    for (const std::int32_t id : {92, 64, 88, 91}) all += tree.IsShown(id) ? 'x' : '.';
    return all;
  };
  EXPECT_EQ(shown(0, 1), "....");
  EXPECT_EQ(shown(1, 1), "xx..");
  EXPECT_EQ(shown(1, 2), "x.x.");
  EXPECT_EQ(shown(1, 3), "x..x");
  EXPECT_EQ(shown(1, 4), "x...");
  EXPECT_EQ(shown(2, 3), "....");
}

TEST_F(NavigationTree, ExpandedDredgingWhereItIsIncluded) {
  rootsWith(8);
  EXPECT_FALSE(tree.IsVisible(70));
  model.root.nmtExpForcings->includeDredging = 1;
  tree.OnUpdate(&model.root);
  EXPECT_TRUE(tree.IsVisible(70));
}

TEST_F(NavigationTree, ExpandedSandFractionsWhereThereAreSome) {
  rootsWith(8);
  EXPECT_FALSE(tree.IsVisible(80));
  model.root.nmtExpSandFractions->sandFractionDescription = 1;
  tree.OnUpdate(&model.root);
  EXPECT_TRUE(tree.IsVisible(80));
  model.root.nmtExpSandFractions->sandFractionDescription = 2;
  tree.OnUpdate(&model.root);
  EXPECT_FALSE(tree.IsVisible(80));
}

TEST_F(NavigationTree, ExpandedSlidingHasThePagesOfItsCoefficients) {
  rootsWith(8);
  const auto shown = [this](int sliding, int variable, int layers) {
    model.root.nmtExpSliding->includeSliding = sliding;
    model.root.nmtExpSliding->includeVariableCoefficient = variable;
    model.root.nmtExpTaskSelection->SetCounts(layers, 1, false);
    tree.OnUpdate(&model.root);
    return std::string(tree.IsVisible(65) ? "constant " : "") + (tree.IsVisible(89) ? "variable" : "");
  };
  EXPECT_EQ(shown(0, 0, 2), "");
  EXPECT_EQ(shown(0, 1, 2), "");
  EXPECT_EQ(shown(2, 1, 2), "");
  EXPECT_EQ(shown(1, 0, 1), "constant ");
  EXPECT_EQ(shown(1, 0, 2), "constant ");
  EXPECT_EQ(shown(1, 1, 1), "variable");
  EXPECT_EQ(shown(1, 2, 2), "constant variable");
  model.root.bathymetry->SetNoAreas(2);  // their parent is gone
  EXPECT_EQ(shown(1, 1, 2), "");
}

TEST_F(NavigationTree, AHiddenParentHidesItsChildrenAndKeepsTheirFlags) {
  model.root.nmtTaskSelection->SetLayers(1);
  rootsWith(3);
  EXPECT_TRUE(tree.IsVisible(53));
  tree.Show(59, false);
  EXPECT_FALSE(tree.IsVisible(53));
  EXPECT_TRUE(tree.IsShown(53));
  tree.Show(59, true);
  EXPECT_TRUE(tree.IsVisible(53));
  tree.Show(9999, true);
  EXPECT_FALSE(tree.IsVisible(9999));
}

TEST_F(NavigationTree, WithoutADocumentNothingHappens) {
  tree.Show(27, false);
  tree.OnUpdate(nullptr);
  EXPECT_FALSE(tree.IsShown(27));
}

TEST_F(NavigationTree, AHotStartOfMudHidesWhatItsFileTells) {
  for (const bool isHot : {true, false}) {
    model.root.nmtStartingConditions->hotStart = isHot;
    rootsWith(3);
    EXPECT_EQ(tree.IsVisible(93), !isHot);
    EXPECT_EQ(tree.IsVisible(105), !isHot);
    EXPECT_TRUE(tree.IsVisible(104));
  }
}

TEST_F(NavigationTree, TheTaskOfMudHasItsPages) {
  for (const bool isMultiFraction : {true, false, true}) {
    if (isMultiFraction) {
      model.root.nmtTaskSelection->SetFractions(2);
    } else {
      model.root.nmtTaskSelection->SetLayers(2);
    }
    rootsWith(3);
    for (const std::int32_t id : {96, 95, 101, 100}) EXPECT_EQ(tree.IsVisible(id), isMultiFraction) << id;
    for (const std::int32_t id : {98, 97, 59, 102, 106, 50, 47, 108, 53})
      EXPECT_EQ(tree.IsVisible(id), !isMultiFraction) << id;
    EXPECT_TRUE(tree.IsVisible(48));
  }
}

}  // namespace setup_navigation_tree_test
}  // namespace gridbay

#include "setup/navigation_tree.h"

#include <algorithm>
#include <array>
#include <initializer_list>

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

namespace gridbay {
namespace {

constexpr std::string_view kFlowModelRoot = "VANE 27 Flow Model";
constexpr std::string_view kWetlandSweepKitRoot = "VANE 27 WSK";

struct Row {
  int depth;
  std::int32_t id;
  std::string_view caption = {};
  bool onlyFlowModel = false;
};

constexpr Row root(std::int32_t id, std::string_view caption) {
  return {0, id, caption};
}
constexpr Row page(int depth, std::int32_t id) {
  return {depth, id};
}
constexpr Row flowModelPage(int depth, std::int32_t id) {
  return {depth, id, {}, true};
}

// The order on screen, depth first.
constexpr Row kTree[] = {
    root(1, {}),  // the edition's own caption
    root(2, "Basic Parameters"),
    flowModelPage(1, 35),
    page(1, 27),
    page(1, 39),
    page(1, 28),
    page(1, 40),
    page(1, 26),
    root(4, "Hydrodynamic Parameters"),
    flowModelPage(1, 34),
    page(1, 43),
    page(1, 29),
    page(1, 41),
    page(1, 143),
    flowModelPage(1, 46),
    flowModelPage(1, 32),
    page(1, 37),
    flowModelPage(1, 44),
    page(1, 142),
    page(1, 42),
    page(2, 45),
    page(2, 30),
    page(2, 31),
    page(1, 38),
    root(3, "Advection Dispersion Parameters"),
    page(1, 25),
    page(1, 11),
    page(1, 19),
    page(1, 9),
    page(1, 24),
    page(1, 13),
    page(1, 18),
    page(1, 12),
    page(1, 17),
    page(1, 14),
    page(1, 22),
    page(1, 15),
    page(1, 145),
    page(1, 16),
    page(1, 20),
    page(1, 10),
    page(1, 21),
    page(1, 23),
    root(6, "Mud Transport Parameters"),
    page(1, 104),
    page(1, 105),
    page(1, 93),
    page(1, 48),
    page(1, 103),
    page(1, 52),
    page(1, 96),
    page(2, 101),
    page(2, 100),
    page(1, 98),
    page(1, 95),
    page(1, 97),
    page(1, 59),
    page(2, 53),
    page(2, 55),
    page(2, 56),
    page(2, 57),
    page(2, 54),
    page(2, 58),
    page(1, 102),
    page(2, 51),
    page(2, 107),
    page(1, 106),
    page(1, 50),
    page(1, 47),
    page(1, 108),
    page(1, 94),
    page(1, 49),
    page(1, 99),
    root(5, "Mud Transport Parameters"),
    page(1, 85),
    page(1, 86),
    page(1, 74),
    page(1, 68),
    page(1, 63),
    page(1, 84),
    page(1, 73),
    page(2, 92),
    page(3, 88),
    page(3, 64),
    page(3, 91),
    page(2, 70),
    page(1, 90),
    page(2, 80),
    page(2, 82),
    page(3, 81),
    page(2, 67),
    page(1, 61),
    page(2, 72),
    page(3, 78),
    page(3, 71),
    page(3, 66),
    page(2, 60),
    page(2, 83),
    page(3, 65),
    page(3, 89),
    page(2, 77),
    page(2, 62),
    page(2, 87),
    page(1, 76),
    page(1, 75),
    page(1, 79),
    root(8, "Xenobiotics Parameters"),
    page(1, 140),
    page(1, 132),
    page(1, 127),
    page(1, 139),
    page(1, 129),
    page(1, 130),
    page(1, 134),
    page(2, 133),
    page(2, 124),
    page(2, 128),
    page(1, 131),
    page(1, 141),
    page(1, 135),
    page(1, 125),
    page(1, 136),
    page(1, 126),
    page(1, 138),
    page(1, 137),
    root(7, "BIO Rig Parameters"),
    page(1, 120),
    page(1, 122),
    page(1, 123),
    page(1, 118),
    page(1, 115),
    page(2, 109),
    page(2, 111),
    page(2, 114),
    page(2, 113),
    page(2, 112),
    page(2, 146),
    page(2, 110),
    page(1, 116),
    page(1, 117),
    page(1, 119),
    page(1, 121),
};

void showAll(CNavigationView& tree, bool shown, std::initializer_list<std::int32_t> ids) {
  for (const std::int32_t id : ids) tree.Show(id, shown);
}

// The root item of a module beside those that every model has.
struct ModuleRoots {
  std::int32_t code;
  std::int32_t ownRoot;  // 0 for hydrodynamics alone
};

constexpr ModuleRoots kModuleRoots[] = {
    {module::kHydrodynamic, 0}, {module::kHydrodynamicToo, 0},      {module::kAdvectionDispersion, 3},
    {module::kMudTransport, 6}, {module::kMudTransportExpanded, 5}, {module::kEcological, 7},
};

// The rules by their numbers.

void rule1ModuleRoots(CNavigationView& tree, CGlobalKvs& model) {
  const auto* found =
      std::ranges::find(kModuleRoots, model.moduleSelection->simulationType, &ModuleRoots::code);
  if (found == std::end(kModuleRoots)) return;
  showAll(tree, true, {2, 4});
  for (const std::int32_t root : {3, 6, 5, 7}) tree.Show(root, root == found->ownRoot);
  tree.Show(8, found->code == module::kMudTransportExpanded && model.nmtExpTaskSelection->includeXenobiotics);
}

void rule2HotStart(CNavigationView& tree, CGlobalKvs& model) {
  showAll(tree, model.bathymetry->hotStart == 0, {26, 43});
}

void rule3Precipitation(CNavigationView& tree, CGlobalKvs& model) {
  showAll(tree, model.nhdSourceSink->HasPrecipitation(), {22, 113});
}

void rule4Evaporation(CNavigationView& tree, CGlobalKvs& model) {
  showAll(tree, model.nhdSourceSink->HasEvaporation(), {15, 112});
}

// Only hides: the page comes back with the tree.
void rule5AdHotStart(CNavigationView& tree, CGlobalKvs& model) {
  if (model.nadStartingConditions->hotStart) tree.Show(19, false);
}

void rule6WaveInducedResistance(CNavigationView& tree, CGlobalKvs& model) {
  tree.Show(142, model.nhdResistance->formulation == CNhdResistanceKvs::kWaveInduced);
}

void rule7Decay(CNavigationView& tree, CGlobalKvs& model) {
  tree.Show(12, model.nadComponent->CountOfType(CNadComponentObjectKvs::kDecaying) > 0);
}

void rule8HeatDissipation(CNavigationView& tree, CGlobalKvs& model) {
  tree.Show(17, model.nadComponent->CountOfType(CNadComponentObjectKvs::kHeatDissipating) > 0);
}

void rule9Infiltration(CNavigationView& tree, CGlobalKvs& model) {
  showAll(tree, model.nhdInfiltration->infiltrationType != CNhdInfiltrationKvs::kNone, {145, 146});
}

void rule10HeatExchange(CNavigationView& tree, CGlobalKvs& model) {
  tree.Show(18, model.nadComponent->CountOfType(CNadComponentObjectKvs::kHeatExchange) == 1);
}

void rule11MassBudget(CNavigationView& tree, CGlobalKvs& model) {
  showAll(tree, model.moduleSelection->HasMassBudget() && model.massBudget->GetCount() > 0, {21, 76, 119});
}

void rule12MudHotStart(CNavigationView& tree, CGlobalKvs& model) {
  showAll(tree, !model.nmtStartingConditions->hotStart, {93, 105});
}

void rule13MudTask(CNavigationView& tree, CGlobalKvs& model) {
  const bool isMultiFraction = model.nmtTaskSelection->multiFraction;
  showAll(tree, isMultiFraction, {96, 95});
  showAll(tree, !isMultiFraction, {98, 97, 59, 102, 106, 50, 47, 108});
}

void rule14ErosionCoefficients(CNavigationView& tree, CGlobalKvs& model) {
  const bool byFactor = model.nmtMlErosionCharacteristics->useConstantErosionCoefficient != 0;
  tree.Show(55, byFactor);
  showAll(tree, !byFactor, {56, 57});
}

void rule15Sliding(CNavigationView& tree, CGlobalKvs& model) {
  const CNmtSlidingKvs& sliding = *model.nmtSliding;
  tree.Show(51, sliding.includeSliding != 0);
  tree.Show(107, sliding.includeSliding != 0 && sliding.includeVariableSlidingCoefficient != 0);
}

// Only hides, as rule 5.
void rule16ExpandedMudHotStart(CNavigationView& tree, CGlobalKvs& model) {
  if (model.nmtExpStartingConditions->hotStart) showAll(tree, false, {86, 74});
}

void rule17Waves(CNavigationView& tree, CGlobalKvs& model) {
  using Waves = CNmtExpWavesKvs;
  const bool hasWaves = model.nmtExpForcings->includeWaves == 1;
  const std::int32_t type = hasWaves ? model.nmtExpWaves->typeOfWaveVariation : 0;
  tree.Show(92, hasWaves);
  tree.Show(64, type == Waves::kConstant);
  tree.Show(88, type == Waves::kVarying);
  tree.Show(91, type == Waves::kDatabase);
}

void rule18Dredging(CNavigationView& tree, CGlobalKvs& model) {
  tree.Show(70, model.nmtExpForcings->includeDredging == 1);
}

void rule19SandFractions(CNavigationView& tree, CGlobalKvs& model) {
  tree.Show(80, model.nmtExpSandFractions->hasSand());
}

void rule20Sliding(CNavigationView& tree, CGlobalKvs& model) {
  tree.Show(83, model.bathymetry->GetCount() < 2);
}

void rule21SlidingCoefficients(CNavigationView& tree, CGlobalKvs& model) {
  const CNmtExpSlidingKvs& sliding = *model.nmtExpSliding;
  const bool isOn = sliding.includeSliding == 1;
  const bool varies = sliding.includeVariableCoefficient != 0;
  tree.Show(89, isOn && varies);
  tree.Show(65, isOn && (!varies || model.nmtExpTaskSelection->layers >= 2));
}

// Only hides, as rule 5.
void rule22EcologyHotStart(CNavigationView& tree, CGlobalKvs& model) {
  if (model.wqsStartingConditions->hotStart) tree.Show(118, false);
}

// In this order. Nothing is remembered between runs.
constexpr void (*kRules[])(CNavigationView&, CGlobalKvs&) = {
    rule1ModuleRoots,            //
    rule2HotStart,               //
    rule3Precipitation,          //
    rule4Evaporation,            //
    rule5AdHotStart,             //
    rule6WaveInducedResistance,  //
    rule7Decay,                  //
    rule8HeatDissipation,        //
    rule9Infiltration,           //
    rule10HeatExchange,          //
    rule11MassBudget,            //
    rule12MudHotStart,           //
    rule13MudTask,               //
    rule14ErosionCoefficients,   //
    rule15Sliding,               //
    rule16ExpandedMudHotStart,   //
    rule17Waves,                 //
    rule18Dredging,              //
    rule19SandFractions,         //
    rule20Sliding,               //
    rule21SlidingCoefficients,   //
    rule22EcologyHotStart,       //
};

}  // namespace

void CNavigationView::OnInitialUpdate(CGlobalKvs* model) {
  items_.clear();
  std::vector<int> path;
  for (const Row& row : kTree) {
    if (row.onlyFlowModel && theEdition.wetlandSweepKit) continue;
    path.resize(static_cast<std::size_t>(row.depth));
    if (row.depth > 0) {
      path.push_back(AddTreeItem(path.back(), row.id));
    } else if (!row.caption.empty()) {
      path.push_back(AddRootItem(row.caption, row.id));
    } else {
      path.push_back(AddRootItem(theEdition.wetlandSweepKit ? kWetlandSweepKitRoot : kFlowModelRoot, row.id));
    }
  }
  OnUpdate(model);
}

void CNavigationView::OnUpdate(CGlobalKvs* model) {
  if (model == nullptr) return;
  for (const auto rule : kRules) rule(*this, *model);
}

int CNavigationView::AddRootItem(std::string_view caption, std::int32_t id) {
  items_.push_back({id, std::string(caption), -1, 0});
  return static_cast<int>(items_.size()) - 1;
}

int CNavigationView::AddTreeItem(int parent, std::int32_t id) {
  const int depth = items_[static_cast<std::size_t>(parent)].depth + 1;
  items_.push_back({id, std::string(enumerator_.GetCaption(id)), parent, depth});
  return static_cast<int>(items_.size()) - 1;
}

void CNavigationView::Show(std::int32_t id, bool shown) {
  const auto found = std::ranges::find(items_, id, &TreeItem::id);
  if (found != items_.end()) found->shown = shown;
}

const TreeItem* CNavigationView::find(std::int32_t id) const {
  const auto found = std::ranges::find(items_, id, &TreeItem::id);
  return found == items_.end() ? nullptr : &*found;
}

bool CNavigationView::IsShown(std::int32_t id) const {
  const TreeItem* item = find(id);
  return item != nullptr && item->shown;
}

bool CNavigationView::IsVisible(std::int32_t id) const {
  const TreeItem* item = find(id);
  return item != nullptr && IsVisible(*item);
}

bool CNavigationView::IsVisible(const TreeItem& item) const {
  for (const TreeItem* at = &item;; at = &items_[static_cast<std::size_t>(at->parent)]) {
    if (!at->shown) return false;
    if (at->parent < 0) return true;
  }
}

}  // namespace gridbay

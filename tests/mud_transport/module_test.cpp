// The whole module as it stands on file, in both tasks.

#include <gmock/gmock.h>

#include "basic/bathymetry.h"
#include "basic/boundary.h"
#include "basic/source_sink.h"
#include "mud_transport/bed_roughness.h"
#include "mud_transport/boundary.h"
#include "mud_transport/box_summation.h"
#include "mud_transport/consolidation.h"
#include "mud_transport/dispersion_coef.h"
#include "mud_transport/erosion_characteristics.h"
#include "mud_transport/erosion_for_each_layer.h"
#include "mud_transport/initial_concentration.h"
#include "mud_transport/line_discharge.h"
#include "mud_transport/ml_settling_and_deposition.h"
#include "mud_transport/result.h"
#include "mud_transport/settling_and_desposition.h"
#include "mud_transport/sliding.h"
#include "mud_transport/source_sink.h"
#include "mud_transport/starting_conditions.h"
#include "mud_transport/task_selection.h"
#include "mud_transport/transition_between_layers.h"
#include "mud_transport/wave_data.h"
#include "tests/support/model.h"

namespace gridbay {
namespace mud_transport_module_test {

using test::savedText;

// The lines of texts, one level deeper.
std::string indented(const std::vector<std::string>& texts) {
  std::string all;
  for (const std::string& text : texts) {
    for (std::size_t start = 0; start < text.size();) {
      const std::size_t end = text.find('\n', start) + 1;
      all += "    " + text.substr(start, end - start);
      start = end;
    }
  }
  return all;
}

// The same in a section of their own.
std::string in(const std::string& section, const std::vector<std::string>& texts) {
  return section + " {\n" + indented(texts) + "}\n";
}

class MudModule : public ::testing::Test {
 protected:
  MudModule() { root.moduleSelection->simulationType = module::kMudTransport; }
  static std::string whole(CGlobalKvs& model) { return savedText(model); }
  // The module's section of the whole file.
  std::string section() {
    const std::string text = whole(root);
    const std::size_t start = text.find("    MUD_TRANSPORT_MODULE {\n");
    const std::size_t end = text.find("    MUD_TRANSPORT_EXPANDED_MODULE {\n");
    return text.substr(start, end - start);
  }
  std::vector<std::string> water() {
    return {"OPTION_PARAMETERS {}\n",           savedText(*root.nmtStartingConditions),
            savedText(*root.nmtTaskSelection),  savedText(*root.nmtInitialConcentration),
            savedText(*root.nmtDispersionCoef), savedText(*root.nmtBoundary),
            savedText(*root.nmtSourceSink)};
  }
  std::string expected(const std::vector<std::string>& bed) {
    std::vector<std::string> all = water();
    all.insert(all.end(), bed.begin(), bed.end());
    for (CKvsBase* results :
         {static_cast<CKvsBase*>(root.nmtLineDischarge.get()),
          static_cast<CKvsBase*>(root.nmtBoxSummation.get()), static_cast<CKvsBase*>(root.nmtResult.get())})
      all.push_back(savedText(*results));
    return indented({in("MUD_TRANSPORT_MODULE", all)});
  }
  std::string ofFractions() {
    return expected({in("MT_PARAMETERS", {savedText(*root.nmtSettlingAndDesposition),
                                          savedText(*root.nmtMfErosionCharacteristics)})});
  }
  std::string ofLayers(const std::vector<std::string>& factors) {
    std::vector<std::string> layers{savedText(*root.nmtErosionLayer),
                                    savedText(*root.nmtErosionForEachLayerCritical)};
    layers.insert(layers.end(), factors.begin(), factors.end());
    layers.push_back(savedText(*root.nmtErosionForEachLayerPower));
    layers.push_back(savedText(*root.nmtErosionForEachLayerDensity));
    return expected(
        {in("MT_PARAMETERS",
            {savedText(*root.nmtMlSettlingAndDeposition), savedText(*root.nmtMlErosionCharacteristics),
             in("EROSION_CHARACTERISTICS_FOR_EACH_LAYER", layers)}),
         in("FORCING_FUNCTIONS", {savedText(*root.nmtWaveData), savedText(*root.nmtBedRoughness)}),
         savedText(*root.nmtSliding), savedText(*root.nmtTransitionBetweenLayers),
         savedText(*root.nmtConsolidation)});
  }
  // Something of each object of the water.
  void fill() {
    root.bathymetry->SetNoAreas(2);
    root.bathymetry->hotStart = 1;
    root.boundary->SetNoBoundaries(1);
    root.boundary->GetItem(1)->Set(0, 5, 0, 9);
    root.sourceSink->SetNoSources(1);
    root.nmtStartingConditions->hotStart = true;
    root.nmtStartingConditions->GetItem(2)->file = "/case/h.tsb2";
    root.nmtStartingConditions->integrationEnd = 50;
    root.nmtStartingConditions->maximumDecrease = 0.5F;
    for (int entry = 1; entry <= root.nmtInitialConcentration->GetCount(); ++entry) {
      root.nmtInitialConcentration->at(entry).at(1).value = static_cast<float>(entry);
      root.nmtInitialConcentration->at(entry).at(2).file.fileName = "/case/i.tsb2";
    }
    root.nmtDispersionCoef->constantX = 3;
    for (std::size_t i = 0; i < root.nmtBoundary->at(1).constants.size(); ++i)
      root.nmtBoundary->at(1).constants[i] = static_cast<float>(i) + 10;
    for (std::size_t i = 0; i < root.nmtSourceSink->at(1).constants.size(); ++i)
      root.nmtSourceSink->at(1).constants[i] = static_cast<float>(i) + 20;
    // Those that were there keep the flags of the other task, which a load does not.
    root.nmtLineDischarge->SetCount(0);
    root.nmtBoxSummation->SetCount(0);
    root.nmtLineDischarge->SetCount(1);
    root.nmtLineDischarge->at(1).title = "line";
    root.nmtBoxSummation->SetCount(1);
    root.nmtBoxSummation->at(1).title = "box";
    root.nmtResult->outputs.SetCount(1);
    root.nmtResult->outputs.at(1).title = "bay";
    root.nmtResult->netSedimentationInMm = 0;
  }
  void comesBack() {
    const std::string text = whole(root);
    test::Model other;
    test::load(other.root, text);
    EXPECT_TRUE(other.host.texts.empty()) << other.host.texts.front();
    EXPECT_EQ(whole(other.root), text);
  }

  test::Model model;
  CGlobalKvs& root = model.root;
};

TEST_F(MudModule, OfFractionsInFileOrder) {
  EXPECT_EQ(section(), ofFractions());
  fill();
  EXPECT_EQ(section(), ofFractions());
}

TEST_F(MudModule, OfLayersInFileOrder) {
  root.nmtTaskSelection->SetLayers(2);
  EXPECT_EQ(section(), ofLayers({savedText(*root.nmtErosionForEachLayerFactor)}));
  root.nmtTaskSelection->SetSalinity(true);
  root.nmtMlErosionCharacteristics->useConstantErosionCoefficient = 0;
  fill();
  EXPECT_EQ(section(), ofLayers({savedText(*root.nmtErosionForEachLayerFactor1),
                                 savedText(*root.nmtErosionForEachLayerFactor2)}));
}

TEST_F(MudModule, ComesBackInTheFlowModel) {
  if (theEdition.wetlandSweepKit) GTEST_SKIP() << "it has no modules on file";
  fill();
  comesBack();
  root.nmtTaskSelection->SetLayers(2);
  root.nmtTaskSelection->SetSalinity(true);
  fill();
  comesBack();
}

TEST_F(MudModule, TheHeadOfSalinityIsThatOfAllLists) {
  root.nmtSettlingAndDesposition->at(1).meanSettlingVelocity = 7;
  root.nmtTaskSelection->SetSalinity(true);
  EXPECT_EQ(root.nmtSettlingAndDesposition->GetCount(), 4);
  EXPECT_EQ(root.nmtSettlingAndDesposition->at(2).meanSettlingVelocity, 7);
  root.nmtTaskSelection->SetLayers(3);
  EXPECT_EQ(root.nmtSettlingAndDesposition->GetCount(), 2);
  EXPECT_EQ(root.nmtErosionForEachLayerCritical->GetCount(), 3);
  EXPECT_EQ(root.nmtErosionForEachLayerFactor->GetCount(), 3);
  EXPECT_EQ(root.nmtErosionForEachLayerFactor1->GetCount(), 3);
  EXPECT_EQ(root.nmtErosionForEachLayerFactor2->GetCount(), 3);
  EXPECT_EQ(root.nmtErosionForEachLayerPower->GetCount(), 3);
  EXPECT_EQ(root.nmtErosionForEachLayerDensity->GetCount(), 3);
  EXPECT_EQ(root.nmtTransitionBetweenLayers->GetCount(), 3);
  EXPECT_EQ(root.nmtErosionLayer->GetCount(), 3);
  root.nmtTaskSelection->SetFractions(2);
  EXPECT_EQ(root.nmtErosionLayer->GetCount(), 3);  // the layers stay
  EXPECT_EQ(root.nmtSettlingAndDesposition->GetCount(), 3);
}

}  // namespace mud_transport_module_test
}  // namespace gridbay

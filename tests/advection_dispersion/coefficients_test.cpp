// Dispersion, decay and heat dissipation.

#include <gmock/gmock.h>

#include "advection_dispersion/component.h"
#include "advection_dispersion/decay_specification.h"
#include "advection_dispersion/dispersion_coef.h"
#include "advection_dispersion/heat_dissipation.h"
#include "basic/bathymetry.h"
#include "basic/simulation_period.h"
#include "platform/units/units.h"
#include "tests/support/grids.h"
#include "tests/support/model.h"
#include "tests/support/temporary_folder.h"

namespace gridbay {
namespace advection_dispersion_coefficients_test {

using test::savedText;
using Texts = std::vector<std::string>;

class Coefficients : public ::testing::Test {
 protected:
  static Texts faults(CKvsBase& object, PageId page, int deep = 1) {
    const ValidationList messages = test::messagesOf(object, deep);
    for (const CMessage& message : messages) {
      EXPECT_EQ(message.page, page);
      EXPECT_EQ(message.severity, Severity::fault);
    }
    return test::textsOf(messages);
  }
  Texts dispersionFaults(int deep = 1) { return faults(dispersion, PageId::adDispersionCoef, deep); }
  void knowGrid(int area, float dx, float dy) {
    root.bathymetry->GetArea(area)->dx = dx;
    root.bathymetry->GetArea(area)->dy = dy;
  }

  test::TemporaryFolder folder;
  test::Model model;
  CGlobalKvs& root = model.root;
  CNadDispersionCoefKvs& dispersion = *root.nadDispersionCoef;
};

TEST_F(Coefficients, OfDispersionInFileOrder) {
  dispersion.filesY.at(1).file.fileName = "/case/y.tsb2";
  EXPECT_EQ(savedText(dispersion),
            "DISPERSION_CONDITIONS {\n"
            "    Dispersion_Prop_to_Current 0\n"
            "    Proportionality_Factor_Xdir 1.0\n"
            "    Proportionality_Factor_Ydir 1.0\n"
            "    Min_Dispersion_Coefficient 0.0\n"
            "    Max_Dispersion_Coefficient 0.0\n"
            "    X_DIRECTION_COEFFICIENTS {\n"
            "        Data_Format 0\n"
            "        Constant_Value 0.0\n"
            "        AREA_1 {\n"
            "            File_Name (file)\"\"\n"
            "            Item_Numbers 1\n"
            "        }\n"
            "    }\n"
            "    Y_DIRECTION_COEFFICIENTS {\n"
            "        Data_Format 0\n"
            "        Constant_Value 0.0\n"
            "        AREA_1 {\n"
            "            File_Name (file)\"y.tsb2\"\n"
            "            Item_Numbers 1\n"
            "        }\n"
            "    }\n"
            "}\n");
}

TEST_F(Coefficients, OfDispersionAreReadBackAndCopied) {
  root.bathymetry->SetNoAreas(2);
  dispersion.proportional = 1;
  dispersion.factorX = 2;
  dispersion.factorY = 3;
  dispersion.minimum = 4;
  dispersion.maximum = 5;
  dispersion.formatX = 1;
  dispersion.constantX = 6;
  dispersion.formatY = 1;
  dispersion.constantY = 7;
  dispersion.filesX.at(2).file.fileName = "/case/x2.tsb2";
  test::Model other;
  other.root.bathymetry->SetNoAreas(2);
  test::load(*other.root.nadDispersionCoef, savedText(dispersion));
  EXPECT_EQ(savedText(*other.root.nadDispersionCoef), savedText(dispersion));
  EXPECT_EQ(other.root.nadDispersionCoef->constantY, 7.0F);
  CNadDispersionCoefKvs copy(nullptr);
  copy.CopyFrom(dispersion);
  EXPECT_EQ(savedText(copy), savedText(dispersion));
}

TEST_F(Coefficients, OfDispersionThatAFileLacks) {
  root.bathymetry->SetNoAreas(2);
  test::load(dispersion, "DISPERSION_CONDITIONS { Dispersion_Prop_to_Current 1 }");
  EXPECT_EQ(dispersion.proportional, 1);
  EXPECT_EQ(dispersion.factorX, 1.0F);
  EXPECT_TRUE(model.host.texts.empty());
  test::load(dispersion,
             "DISPERSION_CONDITIONS { X_DIRECTION_COEFFICIENTS { AREA_2 {} }; Y_DIRECTION_COEFFICIENTS {} }");
  const std::string missing =
      "Error in the KVS-FILE\nThe number of AD Dispertion coefficient sections does not correspond to the "
      "number of sub domaines";
  EXPECT_EQ(model.host.texts, (Texts{missing, missing, missing}));
}

TEST_F(Coefficients, OfDispersionFollowTheAreas) {
  root.bathymetry->SetNoAreas(3);
  EXPECT_EQ(dispersion.filesX.GetCount(), 3);
  EXPECT_EQ(dispersion.filesY.GetCount(), 3);
  root.bathymetry->SetNoAreas(1);
  EXPECT_EQ(dispersion.filesX.GetCount(), 1);
}

TEST_F(Coefficients, TooMuchDispersion) {
  const Texts tooMuch{"Dispersion Coefficients : Too much Dispersion"};
  root.bathymetry->SetNoAreas(2);
  root.simulationPeriod->timeStepInterval = 16;
  dispersion.proportional = 1;
  dispersion.factorX = 128;
  dispersion.factorY = 384;
  EXPECT_TRUE(dispersionFaults().empty());  // no grid is known
  knowGrid(1, 128, 128);
  EXPECT_EQ(dispersionFaults(), tooMuch);  // exactly 0.5
  EXPECT_EQ(dispersionFaults(0), tooMuch);
  dispersion.factorY = 383.9F;
  EXPECT_TRUE(dispersionFaults().empty());
  knowGrid(2, 64, 200);  // the smallest dx of the one, dy of the other
  EXPECT_EQ(dispersionFaults(), tooMuch);
  dispersion.factorX = 1;
  EXPECT_TRUE(dispersionFaults().empty());
  dispersion.factorX = 1000;
  dispersion.formatX = 1;
  EXPECT_TRUE(dispersionFaults().empty());
  dispersion.formatX = 0;
  dispersion.formatY = 1;
  EXPECT_TRUE(dispersionFaults().empty());
  dispersion.formatY = 0;
  dispersion.proportional = 0;
  EXPECT_TRUE(dispersionFaults().empty());
}

// 1/3 and the like do not come out the same in 32 and in 64 bits.
TEST_F(Coefficients, StabilityIsTestedInThePrecisionOfTheValues) {
  int differing = 0;
  for (int i = 1; i <= 2000; ++i) {
    const float dt = 0.1F * static_cast<float>(i);
    const float dx = 33.3F;
    const float factor = 0.25F * (dx * dx) / dt;
    const bool in32 = isTooMuchDispersion<float>(dt, dx, dx, factor, factor);
    const float sum = dt / (dx * dx) * factor + dt / (dx * dx) * factor;
    EXPECT_EQ(in32, sum >= 0.5F) << i;
    if (in32 != isTooMuchDispersion<double>(dt, dx, dx, factor, factor)) ++differing;
  }
  EXPECT_GT(differing, 0);
}

TEST_F(Coefficients, LimitsOfProportionalDispersion) {
  dispersion.minimum = 2;
  dispersion.maximum = 1;
  EXPECT_TRUE(dispersionFaults().empty());
  dispersion.proportional = 1;
  dispersion.formatX = 1;
  EXPECT_EQ(dispersionFaults(), Texts{"Maximum value must be larger than minimum value"});
  dispersion.maximum = 2;
  EXPECT_TRUE(dispersionFaults().empty());
}

TEST_F(Coefficients, MapsOfDispersion) {
  root.bathymetry->SetNoAreas(2);
  const std::string path = folder.file("d.tsb2");
  test::GridSpec map{.land = {}, .itemType = item::kDispersionCoefficient, .unit = "m2 s-1"};
  test::writeGrid(path, map);
  dispersion.formatX = 1;
  for (CNadDispersionCoefObjectKvs* file : {&dispersion.filesX.at(1), &dispersion.filesY.at(2)})
    file->file.fileName = path;
  const std::string none = "Data file  \" \"  is not valid";
  EXPECT_EQ(dispersionFaults(), Texts{none});
  dispersion.formatY = 1;
  EXPECT_EQ(dispersionFaults(), (Texts{none, none}));
  EXPECT_TRUE(dispersionFaults(0).empty());
  CBathymetryObjectKvs& area = *root.bathymetry->GetArea(2);
  area.noJ = map.noJ + 1;
  area.noK = map.noK;
  area.dx = area.dy = 30;
  EXPECT_EQ(dispersionFaults(), (Texts{none, none, "Data file  \" " + path + "\"  is not valid"}));
  dispersion.proportional = 1;
  EXPECT_TRUE(dispersionFaults().empty());
}

TEST_F(Coefficients, OfDecayInFileOrder) {
  root.nadComponent->SetCount(2);
  root.nadDecaySpecification->at(2).format = 1;
  root.nadDecaySpecification->at(2).value = 0.5F;
  const std::string rows =
      "    COMPONENT_1 {\n"
      "        Data_Format 0\n"
      "        Constant_Value 0.0\n"
      "        File_Name (file)\"\"\n"
      "        Item_Numbers 1\n"
      "    }\n";
  EXPECT_EQ(savedText(*root.nadDecaySpecification), "DECAY_COEFFICIENTS {\n" + rows +
                                                        "    COMPONENT_2 {\n"
                                                        "        Data_Format 1\n"
                                                        "        Constant_Value 0.5\n"
                                                        "        File_Name (file)\"\"\n"
                                                        "        Item_Numbers 1\n"
                                                        "    }\n"
                                                        "}\n");
  root.nadComponent->SetCount(1);
  EXPECT_EQ(savedText(*root.nadHeatDissipation), "HEAT_DISSIPATION {\n" + rows + "}\n");
}

TEST_F(Coefficients, SectionsThatAreMissing) {
  test::load(*root.nadDecaySpecification, "DECAY_COEFFICIENTS {}");
  test::load(*root.nadHeatDissipation, "HEAT_DISSIPATION {}");
  test::load(*root.nadHeatDissipation, "OTHER {}");
  EXPECT_EQ(model.host.texts,
            (Texts{"Error in the KVS-FILE\nThe number of Decay coefficient sections does not correspond to "
                   "the number AD Components",
                   "Error in the KVS-FILE\nThe number of Heat Dissipation sections does not correspond to "
                   "the number AD Components"}));
}

TEST_F(Coefficients, OnlyThoseOfTheirTypeAreAskedFor) {
  root.nadComponent->SetCount(4);
  for (int number = 1; number <= 4; ++number) {
    root.nadComponent->at(number).type = std::array{0, 1, 2, -2}[static_cast<std::size_t>(number) - 1];
    const std::string name = "/" + std::to_string(number) + ".tsb0";
    root.nadDecaySpecification->at(number).format = 1;
    root.nadDecaySpecification->at(number).file.fileName = name;
    root.nadHeatDissipation->at(number).format = 1;
    root.nadHeatDissipation->at(number).file.fileName = name;
  }
  const auto decay = [this](int deep) {
    return faults(*root.nadDecaySpecification, PageId::adDecaySpecification, deep);
  };
  EXPECT_EQ(decay(1), Texts{"Data file  \" /2.tsb0\"  is not valid"});
  EXPECT_TRUE(decay(0).empty());
  EXPECT_EQ(faults(*root.nadHeatDissipation, PageId::adHeatDissipation),
            Texts{"Data file  \" /3.tsb0\"  is not valid"});
  root.nadDecaySpecification->at(2).format = 0;
  EXPECT_TRUE(decay(1).empty());
  root.nadComponent->itemList().SetCount(3);  // and nobody is told
  EXPECT_EQ(decay(1), Texts{"No component corresponding to no. 4 found"});
}

TEST_F(Coefficients, TimeSeriesOfTheirQuantity) {
  root.nadComponent->SetCount(2);
  root.nadComponent->at(1).type = 1;
  root.nadComponent->at(2).type = 2;
  const std::string path = folder.file("c.tsb0");
  root.nadDecaySpecification->at(1).format = 1;
  root.nadDecaySpecification->at(1).file.fileName = path;
  root.nadHeatDissipation->at(2).format = 1;
  root.nadHeatDissipation->at(2).file.fileName = path;
  const auto counts = [&](int quantity, double step) {
    TsbTimeAxis time;
    time.step = step;
    time.count = 2;
    test::writeSeries(path, time, quantity, std::string(qunBaseUnit(quantity)->text));
    return std::pair(faults(*root.nadDecaySpecification, PageId::adDecaySpecification).size(),
                     faults(*root.nadHeatDissipation, PageId::adHeatDissipation).size());
  };
  EXPECT_EQ(counts(item::kDecayCoefficient, 3000), std::pair(0UL, 1UL));
  EXPECT_EQ(counts(item::kTemperature, 3000), std::pair(1UL, 0UL));
  EXPECT_EQ(counts(item::kDecayCoefficient, 10), std::pair(1UL, 1UL));
}

TEST_F(Coefficients, AComponentThatDecaysAgainHasWhatItHad) {
  root.nadDecaySpecification->at(1).value = 4;
  EXPECT_EQ(root.nadDecaySpecification->MeantCount(), 0);
  EXPECT_EQ(root.nadDecaySpecification->MeantItem(1), nullptr);
  root.nadComponent->at(1).type = 1;
  EXPECT_EQ(root.nadDecaySpecification->MeantCount(), 1);
  EXPECT_EQ(root.nadDecaySpecification->MeantItem(1)->value, 4);
  EXPECT_EQ(root.nadHeatDissipation->MeantCount(), 0);
}

}  // namespace advection_dispersion_coefficients_test
}  // namespace gridbay

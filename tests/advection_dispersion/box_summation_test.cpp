#include "advection_dispersion/box_summation.h"

#include <gtest/gtest.h>

#include "advection_dispersion/component.h"
#include "basic/bathymetry.h"
#include "basic/simulation_period.h"
#include "tests/support/model.h"

namespace gridbay {
namespace advection_dispersion_box_summation_test {

using test::load;
using test::Model;
using test::savedText;

class AdBoxSummation : public ::testing::Test {
 protected:
  AdBoxSummation() {
    model.root.bathymetry->GetArea(1)->noJ = 12;
    model.root.bathymetry->GetArea(1)->noK = 10;
    model.root.nadComponent->SetCount(2);
    list.SetCount(1);
    box().file = "b.tsb0";
  }
  LineOrBox& box() { return *list.GetItem(1); }
  Model model;
  CNadBoxSummationKvs& list = *model.root.nadBoxSummation;
};

TEST_F(AdBoxSummation, IsWrittenInFileOrder) {
  box().entries = {0, 1};
  box().file.Set("out/b.tsb0", "/case/setup.v27");
  EXPECT_EQ(savedText(list),
            "BOXES_FOR_MASS_SUMMATION {\n"
            "    No_Of_AD_Mass_Boxes 1\n"
            "    AD_MASS_BOX_1 {\n"
            "        Area_Number 1\n"
            "        Start_Coordinate 0 0\n"
            "        End_Coordinate 11 9\n"
            "        Start_Time_Step 0\n"
            "        End_Time_Step 100\n"
            "        File_Name (result)\"out/b.tsb0\"\n"
            "        Title \"\"\n"
            "        Component_Numbers 2\n"
            "        No_of_Components_in_Calc 1\n"
            "    }\n"
            "}\n");
  list.SetCount(0);
  EXPECT_EQ(savedText(list), "BOXES_FOR_MASS_SUMMATION {\n    No_Of_AD_Mass_Boxes 0\n}\n");
}

TEST_F(AdBoxSummation, ASavedPeriodIsReadBack) {
  box().steps = {5, 6, 1};
  box().entries = {0, 1};
  Model other;
  other.root.nadComponent->SetCount(2);
  load(*other.root.nadBoxSummation, savedText(list));
  EXPECT_EQ(savedText(*other.root.nadBoxSummation), savedText(list));
  EXPECT_EQ(other.root.nadBoxSummation->GetItem(1)->steps, (USubLine{5, 6, 1}));
}

TEST_F(AdBoxSummation, FlagsFollowTheComponents) {
  box().entries = {0, 1};
  model.root.nadComponent->SetCount(3);
  EXPECT_EQ(box().entries, (EntryFlags{0, 1, 1}));
}

TEST_F(AdBoxSummation, ThreeValuesOfAComponentInAStep) {
  model.root.simulationPeriod->timeStepInterval = 50;
  EXPECT_FLOAT_EQ(list.size(), static_cast<float>(3 * 2 * 3 * 4 / 1048576.0));
  list.SetCount(2);
  EXPECT_FLOAT_EQ(list.size(), static_cast<float>((3 * 2 * 3 + 3 * 4 * 3) * 4 / 1048576.0));
}

TEST_F(AdBoxSummation, ChecksInTheirOrder) {
  using Texts = std::vector<std::string>;
  const std::string negative = "First point coordinates can not be negative";
  const std::string behind = "The first point is greater than the last";
  EXPECT_TRUE(test::messagesOf(list).empty());
  box().file = "";
  box().first = {12, 11};
  box().last = {11, 10};
  box().steps = {300, 200, 1};
  const ValidationList messages = test::messagesOf(list);
  EXPECT_EQ(test::textsOf(messages), (Texts{"Grid point out of range", negative, negative, behind, behind,
                                            "The first time step is greater than the last",
                                            "Last timestep out of range", "Data file  \" \"  is not valid"}));
  for (const CMessage& message : messages) EXPECT_EQ(message.page, PageId::adBoxSummation);
}

TEST_F(AdBoxSummation, AMissingAreaIsToldOnTheLinesPage) {
  box().areaNumber = 2;
  box().steps.last = 101;
  EXPECT_EQ(test::messagesOf(list),
            (ValidationList{{PageId::adLineDischarge, "Box is not embedded in a valid area"},
                            {PageId::adBoxSummation, "Last timestep out of range"}}));
}

TEST_F(AdBoxSummation, MoreThanTenAreToldOnTheResultPage) {
  list.SetCount(10);
  EXPECT_TRUE(test::messagesOf(list, 0).empty());
  list.SetCount(11);
  EXPECT_EQ(test::messagesOf(list, 0),
            (ValidationList{
                {PageId::adResult, "Illegal number of box summation boxes, should be between 0 and 10"}}));
}

}  // namespace advection_dispersion_box_summation_test
}  // namespace gridbay

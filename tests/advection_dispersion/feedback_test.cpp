#include "advection_dispersion/feedback.h"

#include <gmock/gmock.h>

#include "advection_dispersion/component.h"
#include "tests/support/model.h"

namespace gridbay {
namespace advection_dispersion_feedback_test {

using test::Model;
using test::savedText;
using ::testing::IsEmpty;
using Texts = std::vector<std::string>;

constexpr const char* kNothingVaries = "Either salinity or tempiture should be varying.";
constexpr const char* kSame = "Same item can not be selected for both salinity and temperature";
constexpr const char* kSalinity = "Invalid salinity component selected";
constexpr const char* kTemperature = "Invalid tempeture component selected";

class Feedback : public ::testing::Test {
 protected:
  CNadFeedbackKvs& feedback() { return *model.root.nadFeedback; }
  Texts faults() {
    ValidationList messages;
    const unsigned counted = feedback().Validate(messages, 1);
    EXPECT_EQ(counted, messages.size());
    for (const CMessage& message : messages) {
      EXPECT_EQ(message.page, PageId::adFeedback);
      EXPECT_EQ(message.severity, Severity::fault);
    }
    return test::textsOf(messages);
  }
  // Salinity and temperature by description and component.
  Texts at(int salinity, int salinityComponent, int temperature, int temperatureComponent) {
    feedback().isIncluded = true;
    feedback().salinityDescription = salinity;
    feedback().salinityComponent = salinityComponent;
    feedback().temperatureDescription = temperature;
    feedback().temperatureComponent = temperatureComponent;
    return faults();
  }
  Model model;
};

TEST_F(Feedback, ANewOneIsWrittenInFileOrder) {
  EXPECT_EQ(savedText(feedback()),
            "AD_FEED_BACK_ON_HD_CALCULATIONS {\n"
            "    Include_AD_Feed_Back #false\n"
            "    Salinity_Description 1\n"
            "    Constant_Salinity 7.0\n"
            "    Salinity_Item_Number 1\n"
            "    Temperature_Description 0\n"
            "    Constant_Temperature 10.0\n"
            "    Temperature_Item_Number 1\n"
            "}\n");
}

TEST_F(Feedback, IsReadBack) {
  const std::string text =
      "AD_FEED_BACK_ON_HD_CALCULATIONS {\n"
      "    Include_AD_Feed_Back #true\n"
      "    Salinity_Description 0\n"
      "    Constant_Salinity 30.5\n"
      "    Salinity_Item_Number 2\n"
      "    Temperature_Description 1\n"
      "    Constant_Temperature 4.25\n"
      "    Temperature_Item_Number 3\n"
      "}\n";
  test::load(feedback(), text);
  EXPECT_EQ(savedText(feedback()), text);
  Model other;
  other.root.nadFeedback->CopyFrom(feedback());
  EXPECT_EQ(savedText(*other.root.nadFeedback), text);
  test::load(feedback(), "AD_FEED_BACK_ON_HD_CALCULATIONS { Constant_Salinity 1.0 }");
  EXPECT_EQ(feedback().temperatureComponent, 3);
  test::load(feedback(), "OTHER {}");
  EXPECT_EQ(feedback().constantSalinity, 1.0F);
  EXPECT_TRUE(feedback().isIncluded);
}

TEST_F(Feedback, NothingIsCheckedWhileItIsExcluded) {
  at(1, 0, 1, 0);
  feedback().isIncluded = false;
  EXPECT_THAT(faults(), IsEmpty());
}

TEST_F(Feedback, SomethingMustVary) {
  EXPECT_EQ(at(0, 9, 0, 9), Texts{kNothingVaries});
  EXPECT_THAT(at(1, 1, 0, 9), IsEmpty());
  EXPECT_THAT(at(0, 9, 1, 1), IsEmpty());
}

TEST_F(Feedback, NotBothByTheSameComponent) {
  EXPECT_EQ(at(1, 1, 1, 1), Texts{kSame});
  EXPECT_EQ(at(1, 2, 1, 2), (Texts{kSame, kSalinity, kTemperature}));
  model.root.nadComponent->SetCount(2);
  EXPECT_EQ(at(1, 2, 1, 2), Texts{kSame});
  EXPECT_THAT(at(1, 2, 1, 1), IsEmpty());
  EXPECT_THAT(at(1, 1, 0, 1), IsEmpty());
}

TEST_F(Feedback, OnlyComponentsThatThereAre) {
  model.root.nadComponent->SetCount(3);
  EXPECT_THAT(at(1, 3, 1, 1), IsEmpty());
  for (const int none : {0, -1, 4, 2147483647, -2147483647 - 1}) {
    EXPECT_EQ(at(1, none, 0, 1), Texts{kSalinity}) << none;
    EXPECT_EQ(at(0, 1, 1, none), Texts{kTemperature}) << none;
  }
  EXPECT_EQ(at(1, 0, 1, 4), (Texts{kSalinity, kTemperature}));
}

TEST_F(Feedback, AComponentThatIsGoneIsAFaultAndStays) {
  model.root.nadComponent->SetCount(2);
  EXPECT_THAT(at(1, 1, 1, 2), IsEmpty());
  model.root.nadComponent->SetCount(1);
  EXPECT_EQ(feedback().temperatureComponent, 2);
  EXPECT_EQ(faults(), Texts{kTemperature});
}

}  // namespace advection_dispersion_feedback_test
}  // namespace gridbay

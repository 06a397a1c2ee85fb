#include "advection_dispersion/feedback_page.h"

#include <gmock/gmock.h>

#include "advection_dispersion/component.h"
#include "advection_dispersion/feedback.h"
#include "tests/support/pages.h"

namespace gridbay {
namespace advection_dispersion_feedback_page_test {

class FeedbackPage : public test::PageTest {
 protected:
  FeedbackPage() {
    root().nadComponent->SetCount(3);
    root().nadComponent->at(1).name = "Salt";
    root().nadComponent->at(2).name = "";
    root().nadComponent->at(3).name = "Salt";
    open("CNadFeedbackDlg");
  }
  CNadFeedbackKvs& feedback() { return *root().nadFeedback; }
  // Radio buttons, constant and component of a term, 1 salinity and 2 temperature, as "xx."
  std::string usable(int n) {
    std::string all;
    for (const char* label : {"Given as", "Constant", "Varying"})
      all += control(label, n).usable() ? 'x' : '.';
    return all;
  }
  void chooseNth(std::string_view label, int n, int index) {
    Control& it = control(label, n);
    EXPECT_TRUE(it.usable());
    it.index = index;
    page->form().act(it);
  }
};

TEST_F(FeedbackPage, Controls) {
  EXPECT_EQ(labels(), (Labels{"HD Density Terms", "Salinity", "Given as", "Constant", "Varying",
                              "Temperature", "Given as", "Constant", "Varying"}));
  EXPECT_EQ(page->templateId(), 18725);
  EXPECT_EQ(static_cast<int>(page->pageId()), 16);
  EXPECT_EQ(control("HD Density Terms").choices, (Labels{"Exclude", "Include"}));
  EXPECT_EQ(control("HD Density Terms").index, 0);
  EXPECT_EQ(control("Given as").choices, (Labels{"Constant", "Varying"}));
  EXPECT_EQ(control("Given as", 1).index, 1);
  EXPECT_EQ(control("Given as", 2).index, 0);
  EXPECT_EQ(text("Constant", 1), "7");
  EXPECT_EQ(text("Constant", 2), "10");
  EXPECT_EQ(control("Constant", 1).unit, "PSU");
  EXPECT_EQ(control("Constant", 2).unit, "°C");
}

TEST_F(FeedbackPage, WhatIsIncludedCanBeEdited) {
  EXPECT_EQ(usable(1), "...");
  EXPECT_EQ(usable(2), "...");
  choose("HD Density Terms", 1);
  EXPECT_TRUE(feedback().isIncluded);
  EXPECT_EQ(usable(1), "x.x");
  EXPECT_EQ(usable(2), "xx.");
  chooseNth("Given as", 1, 0);
  EXPECT_EQ(feedback().salinityDescription, 0);
  EXPECT_EQ(usable(1), "xx.");
  edit("Constant", "31.5", 1);
  EXPECT_EQ(feedback().constantSalinity, 31.5F);
  edit("Constant", "4", 2);
  EXPECT_EQ(feedback().constantTemperature, 4.0F);
  chooseNth("Given as", 2, 1);
  EXPECT_EQ(feedback().temperatureDescription, 1);
  EXPECT_EQ(usable(2), "x.x");
  choose("HD Density Terms", 0);
  EXPECT_FALSE(feedback().isIncluded);
  EXPECT_EQ(usable(2), "...");
}

TEST_F(FeedbackPage, AComponentIsChosenByItsPlace) {
  choose("HD Density Terms", 1);
  chooseNth("Given as", 2, 1);
  // One that has no name is shown by that of a new one.
  EXPECT_EQ(control("Varying", 1).choices, (Labels{"Salt", "Component 2", "Salt"}));
  EXPECT_EQ(control("Varying", 1).index, 0);
  chooseNth("Varying", 1, 2);
  EXPECT_EQ(feedback().salinityComponent, 3);
  EXPECT_EQ(control("Varying", 1).index, 2);
  chooseNth("Varying", 2, 1);
  EXPECT_EQ(feedback().temperatureComponent, 2);
  EXPECT_EQ(feedback().salinityComponent, 3);
}

TEST_F(FeedbackPage, TheListFollowsTheComponentsAndANumberBeyondItStays) {
  choose("HD Density Terms", 1);
  feedback().salinityComponent = 3;
  root().nadComponent->SetCount(2);
  page->OnUpdate();
  EXPECT_EQ(control("Varying", 1).choices, (Labels{"Salt", "Component 2"}));
  EXPECT_EQ(control("Varying", 1).index, -1);
  page->UpdateDoc();
  EXPECT_EQ(feedback().salinityComponent, 3);
  chooseNth("Varying", 1, 0);
  EXPECT_EQ(feedback().salinityComponent, 1);
  root().nadComponent->SetCount(0);
  page->OnUpdate();
  EXPECT_EQ(control("Varying", 1).choices, Labels{});
}

}  // namespace advection_dispersion_feedback_page_test
}  // namespace gridbay

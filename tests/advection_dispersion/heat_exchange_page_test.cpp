#include "advection_dispersion/heat_exchange_page.h"

#include <gmock/gmock.h>

#include "advection_dispersion/heat_exchange.h"
#include "tests/support/pages.h"
#include "tests/support/temporary_folder.h"

namespace gridbay {
namespace advection_dispersion_heat_exchange_page_test {

class HeatExchangePage : public test::PageTest {
 protected:
  HeatExchangePage() { open("CNadHeatExchangeDlg"); }
  CNadHeatExchangeKvs& heat() { return *root().nadHeatExchange; }
  // The n-th control of a label: 1 air, 2 humidity, 3 clearness where there is one each.
  void chooseNth(std::string_view label, int n, int index) {
    Control& it = control(label, n);
    EXPECT_TRUE(it.usable());
    it.index = index;
    page->form().act(it);
  }
  void pressNth(std::string_view label, int n) {
    EXPECT_TRUE(control(label, n).usable());
    page->form().act(control(label, n));
  }
  test::TemporaryFolder folder;
};

TEST_F(HeatExchangePage, Controls) {
  EXPECT_EQ(labels(), (Labels{"Integration method",
                              "Evaporation/precipitation temperature from latent heat flux",
                              "Sun constant, a in Ångstrøm's law:",
                              "Sun constant, b in Ångstrøm's law:",
                              "Constant in Dalton's law:",
                              "Wind coefficient in Dalton's law:",
                              "Standard meridian for time zone:",
                              "Displacement (summer time):",
                              "Air temperature",
                              "Type",
                              "Value",
                              "File",
                              "...",
                              "View...",
                              "Relative humidity",
                              "Type",
                              "Constant Value",
                              "File",
                              "...",
                              "View...",
                              "Clearness coefficient",
                              "Type",
                              "Constant Value",
                              "File",
                              "...",
                              "View..."}));
  EXPECT_EQ(page->templateId(), 18726);
  EXPECT_EQ(static_cast<int>(page->pageId()), 18);
  EXPECT_EQ(control("Integration method").choices,
            (Labels{"1st order Euler", "2nd order Runge-Kutta", "4th order Runge-Kutta"}));
  EXPECT_EQ(control("Type", 1).choices, (Labels{"Constant", "Type 0 data", "Type 2 data"}));
  EXPECT_EQ(control("Type", 2).choices, (Labels{"Constant", "Type 0 data"}));
  EXPECT_EQ(control("Type", 3).choices, (Labels{"Constant", "Type 0 data"}));
  EXPECT_EQ(text("Sun constant, a in Ångstrøm's law:"), "0.295");
  EXPECT_EQ(text("Value"), "20");
  EXPECT_EQ(control("Value").unit, "°C");
  EXPECT_EQ(text("Constant Value", 1), "88");
  EXPECT_EQ(text("Constant Value", 2), "70");
  EXPECT_EQ(control("Constant Value").unit, "[%]");
}

TEST_F(HeatExchangePage, EveryFieldIsStored) {
  choose("Evaporation/precipitation temperature from latent heat flux", 1);
  edit("Sun constant, a in Ångstrøm's law:", "0.1");
  edit("Sun constant, b in Ångstrøm's law:", "0.2");
  edit("Constant in Dalton's law:", "0.3");
  edit("Wind coefficient in Dalton's law:", "0.4");
  edit("Standard meridian for time zone:", "-15");
  edit("Displacement (summer time):", "1");
  edit("Value", "8.5");
  edit("Constant Value", "60", 1);
  edit("Constant Value", "40", 2);
  EXPECT_TRUE(heat().latentHeatTemperature);
  EXPECT_EQ(heat().angstromA, 0.1F);
  EXPECT_EQ(heat().angstromB, 0.2F);
  EXPECT_EQ(heat().daltonA, 0.3F);
  EXPECT_EQ(heat().daltonB, 0.4F);
  EXPECT_EQ(heat().standardMeridian, -15.0F);
  EXPECT_EQ(heat().displacementHours, 1.0F);
  EXPECT_EQ(heat().airTemperature, 8.5F);
  EXPECT_EQ(heat().relativeHumidity, 60);
  EXPECT_EQ(heat().clearness, 40);
  edit("Constant Value", "40.5", 2);
  EXPECT_EQ(heat().clearness, 40);
  document.units().setSystem(UnitSystem::us);
  page->SetData();
  edit("Value", "50");
  EXPECT_FLOAT_EQ(heat().airTemperature, 10.0F);
}

TEST_F(HeatExchangePage, TheOrderOfIntegration) {
  for (const auto& [place, order] : {std::pair{1, 2}, {2, 4}, {0, 1}}) {
    choose("Integration method", place);
    EXPECT_EQ(heat().integrationOrder, order);
    page->SetData();
    EXPECT_EQ(control("Integration method").index, place);
  }
  for (const int unknown : {3, 0, -1, 2147483647}) {
    heat().integrationOrder = unknown;
    page->SetData();
    EXPECT_EQ(control("Integration method").index, 0);
    EXPECT_EQ(heat().integrationOrder, unknown);
    page->UpdateDoc();
    EXPECT_EQ(heat().integrationOrder, 1);
  }
}

TEST_F(HeatExchangePage, TheTypeEnablesConstantOrFile) {
  const std::string name = folder.write("f.tsb0", "");
  heat().airFile.fileName = heat().humidityFile.fileName = heat().clearnessFile.fileName = name;
  page->SetData();
  const auto usable = [this](int n) {
    const Control& constant = n == 1 ? control("Value") : control("Constant Value", n - 1);
    std::string all;
    for (const Control* it : std::initializer_list<const Control*>{
             &constant, &control("File", n), &control("...", n), &control("View...", n)})
      all += it->usable() ? 'x' : '.';
    return all;
  };
  for (int n = 1; n <= 3; ++n) {
    EXPECT_EQ(usable(n), "x...") << n;
    chooseNth("Type", n, 1);
    EXPECT_EQ(usable(n), ".xxx") << n;
    for (int other = 1; other <= 3; ++other) {
      if (other != n) EXPECT_EQ(usable(other), "x...") << other;
    }
    chooseNth("Type", n, 0);
    EXPECT_EQ(usable(n), "x...") << n;
  }
  chooseNth("Type", 1, 2);
  EXPECT_EQ(heat().airFormat, 2);
  EXPECT_EQ(usable(1), ".xxx");
  heat().airFormat = 1;  // none of the three
  page->SetData();
  EXPECT_EQ(usable(1), ".xxx");
}

TEST_F(HeatExchangePage, FormatsOfTheChoices) {
  chooseNth("Type", 1, 1);
  EXPECT_EQ(heat().airFormat, 0);
  chooseNth("Type", 2, 1);
  EXPECT_EQ(heat().humidityFormat, 0);
  EXPECT_EQ(heat().clearnessFormat, -1);
  chooseNth("Type", 3, 1);
  EXPECT_EQ(heat().clearnessFormat, 0);
  chooseNth("Type", 3, 0);
  EXPECT_EQ(heat().clearnessFormat, -1);
}

TEST_F(HeatExchangePage, FilesAreChosenByTheirKind) {
  host.chosenFile = folder.write("chosen.tsb0", "");
  host.chosenItems = {3};
  chooseNth("Type", 1, 1);
  pressNth("...", 1);
  chooseNth("Type", 1, 2);
  pressNth("...", 1);
  chooseNth("Type", 2, 1);
  pressNth("...", 2);
  chooseNth("Type", 3, 1);
  pressNth("...", 3);
  EXPECT_EQ(host.filters,
            (Labels{"Air Temperature Files (*.tsb0;*.tb0)|*.tsb0; *.tb0|All Files (*.*)|*.*||",
                    "Air Temperature Files (*.tsb2;*.tb2)|*.tsb2; *.tb2|All Files (*.*)|*.*||",
                    "Relative Humidity Files (*.tsb0;*.tb0)|*.tsb0; *.tb0|All Files (*.*)|*.*||",
                    "Clearness Coeficient Files (*.tsb0;*.tb0)|*.tsb0; *.tb0|All Files (*.*)|*.*||"}));
  for (const UTsbSelection* file : {&heat().airFile, &heat().humidityFile, &heat().clearnessFile}) {
    EXPECT_EQ(file->fileName.text(), *host.chosenFile);
    EXPECT_EQ(file->items, std::vector<std::uint32_t>{3});
  }
  pressNth("View...", 2);
  EXPECT_EQ(host.opened, Labels{*host.chosenFile});
  edit("File", "typed.tsb0", 3);
  EXPECT_EQ(heat().clearnessFile.fileName.text(), "typed.tsb0");
  EXPECT_FALSE(control("View...", 3).enabled);
}

}  // namespace advection_dispersion_heat_exchange_page_test
}  // namespace gridbay

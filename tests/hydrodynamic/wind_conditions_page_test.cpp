#include "hydrodynamic/wind_conditions_page.h"

#include <gmock/gmock.h>

#include "hydrodynamic/wind_conditions.h"
#include "tests/support/pages.h"
#include "tests/support/temporary_folder.h"

namespace gridbay {
namespace hydrodynamic_wind_conditions_page_test {

class WindPage : public test::PageTest {
 protected:
  WindPage() { open("CWindConditionsDlg"); }
  CWindConditionsKvs& wind() { return *root().windConditions; }
  test::TemporaryFolder folder;
};

TEST_F(WindPage, ControlsAndDefaults) {
  EXPECT_EQ(page->templateId(), 18934);
  EXPECT_EQ(page->pageId(), PageId::windConditions);
  EXPECT_EQ(labels(),
            (Labels{"Wind type:", "Wind", "Speed:", "Direction:", "Neutral pressure:", "Data file:", "...",
                    "View...", "Include air pressure correction", "Friction", "Friction type:", "Constant:",
                    "Linear variation using:", "Speed", "Friction", "Speed", "Friction"}));
  EXPECT_EQ(control("Wind type:").choices, (Labels{"No Wind", "Constant in Time and Space",
                                                   "Constant in Space", "Varying in Time and Space"}));
  EXPECT_EQ(control("Friction type:").choices, (Labels{"Constant", "Varying with Wind Speed"}));
  EXPECT_EQ(text("Speed:"), "10");
  EXPECT_EQ(text("Direction:"), "270");
  EXPECT_EQ(text("Neutral pressure:"), "1013");
  EXPECT_EQ(control("Speed:").unit, "m/s");
  EXPECT_EQ(control("Direction:").unit, "°");
  EXPECT_EQ(control("Neutral pressure:").unit, "hPa");
  EXPECT_EQ(text("Constant:"), "0.0026");
  EXPECT_EQ(text("Speed", 1), "0");
  EXPECT_EQ(text("Friction", 2), "0.0016");
  EXPECT_EQ(text("Speed", 2), "24");
  EXPECT_EQ(text("Friction", 3), "0.0026");
}

TEST_F(WindPage, TheTypeDecidesWhatIsAsked) {
  const auto usable = [this] {
    std::string all;
    for (const char* label : {"Speed:", "Direction:", "Neutral pressure:", "Data file:", "...",
                              "Include air pressure correction", "Friction type:", "Constant:", "Speed"})
      all += control(label).enabled ? 'x' : '.';
    return all;
  };
  EXPECT_EQ(usable(), ".........");
  choose("Wind type:", 1);
  EXPECT_EQ(usable(), "xx....xx.");
  choose("Wind type:", 2);
  EXPECT_EQ(usable(), "...xx.xx.");
  choose("Wind type:", 3);
  EXPECT_EQ(usable(), "..xxxxxx.");
  choose("Friction type:", 1);
  EXPECT_EQ(usable(), "..xxxxx.x");
}

TEST_F(WindPage, EveryControlReachesTheModel) {
  choose("Wind type:", 1);
  edit("Speed:", "12");
  edit("Direction:", "90");
  edit("Constant:", "0.002");
  choose("Wind type:", 3);
  edit("Neutral pressure:", "1000");
  choose("Include air pressure correction", 1);
  choose("Friction type:", 1);
  edit("Speed", "1", 1);
  edit("Friction", "0.001", 2);
  edit("Speed", "30", 2);
  edit("Friction", "0.003", 3);
  EXPECT_EQ(wind().dataFormat, 3);
  EXPECT_EQ(wind().constantSpeed, 12);
  EXPECT_EQ(wind().constantDirection, 90);
  EXPECT_EQ(wind().neutralPressure, 1000);
  EXPECT_EQ(wind().airPressureCorrection, 1);
  EXPECT_EQ(wind().frictionType, 1);
  EXPECT_EQ(wind().constantFriction, 0.002F);
  EXPECT_EQ(wind().speed1, 1);
  EXPECT_EQ(wind().friction1, 0.001F);
  EXPECT_EQ(wind().speed2, 30);
  EXPECT_EQ(wind().friction2, 0.003F);
}

TEST_F(WindPage, TheFileHasTheItemsOfItsType) {
  host.chosenFile = folder.write("w.tsb2", "");
  choose("Wind type:", 2);
  EXPECT_EQ(wind().windFile.items.size(), 2U);
  host.chosenItems = {2, 1};
  press("...");
  EXPECT_EQ(wind().windFile.items, (std::vector<std::uint32_t>{2, 1}));
  choose("Wind type:", 3);
  EXPECT_EQ(wind().windFile.items, (std::vector<std::uint32_t>{2, 1, 3}));
  press("...");
  EXPECT_EQ(host.filters, (Labels{"Time series (*.tsb0;*.tb0)|*.tsb0; *.tb0|All Files (*.*)|*.*||",
                                  "Wind Map (*.tsb2;*.tb2)|*.tsb2; *.tb2|All Files (*.*)|*.*||"}));
  press("View...");
  EXPECT_EQ(host.opened, Labels{*host.chosenFile});
}

}  // namespace hydrodynamic_wind_conditions_page_test
}  // namespace gridbay

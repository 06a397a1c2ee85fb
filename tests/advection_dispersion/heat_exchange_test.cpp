#include "advection_dispersion/heat_exchange.h"

#include <gmock/gmock.h>

#include "advection_dispersion/component.h"
#include "basic/bathymetry.h"
#include "tests/support/grids.h"
#include "tests/support/model.h"
#include "tests/support/temporary_folder.h"

namespace gridbay {
namespace advection_dispersion_heat_exchange_test {

using test::Model;
using test::savedText;
using ::testing::HasSubstr;
using ::testing::IsEmpty;
using Texts = std::vector<std::string>;

constexpr const char* kFilled =
    "HEAT_EXCHANGE {\n"
    "    RKorder 4\n"
    "    EvapPrecipTemp #true\n"
    "    AngstromsLawA 0.31\n"
    "    AngstromsLawB 0.4\n"
    "    DaltonsLawA 0.6\n"
    "    DaltonsLawB 1.1\n"
    "    RelativeHumidity 75\n"
    "    StandardMeridian 15.0\n"
    "    DisplacementHours 1.5\n"
    "    AirFormat 2\n"
    "    AirConstantValue 12.5\n"
    "    ClearnessFormat 0\n"
    "    HumidityFormat -1\n"
    "    Clearness 55\n"
    "    AIR_FILE {\n"
    "        File_Name (file)\"air.tsb2\"\n"
    "        Item_Numbers 2\n"
    "    }\n"
    "    HUMIDITY_FILE {\n"
    "        File_Name (file)\"humid.tsb0\"\n"
    "        Item_Numbers 3 1\n"
    "    }\n"
    "    CLEARNESS_FILE {\n"
    "        File_Name (file)\"clear.tsb0\"\n"
    "        Item_Numbers 4\n"
    "    }\n"
    "}\n";

// A model of one area, 12 by 10 points, with one component that exchanges heat.
class HeatExchange : public ::testing::Test {
 protected:
  HeatExchange() {
    model.root.nadComponent->at(1).type = CNadComponentObjectKvs::kHeatExchange;
    CBathymetryObjectKvs& area = *model.root.bathymetry->GetArea(1);
    area.noJ = 12;
    area.noK = 10;
    area.dx = area.dy = 100;
  }
  CNadHeatExchangeKvs& heat() { return *model.root.nadHeatExchange; }
  Texts faults() {
    ValidationList messages;
    const unsigned counted = heat().Validate(messages, 1);
    EXPECT_EQ(counted, messages.size());
    for (const CMessage& message : messages) {
      EXPECT_EQ(message.page, PageId::adHeatExchange);
      EXPECT_EQ(message.severity, Severity::fault);
    }
    return test::textsOf(messages);
  }
  void writeSeries(int itemType, const std::string& unit, double step = 3000) {
    TsbTimeAxis time;
    time.step = step;
    time.count = 2;
    test::writeSeries(path, time, itemType, unit);
  }
  void writeMap(const test::GridSpec& spec) { test::writeGrid(path, spec); }
  test::GridSpec airMap() {
    test::GridSpec spec{
        .noJ = 12, .noK = 10, .dx = 100, .dy = 100, .itemType = 100006, .steps = 2, .unit = "degC"};
    spec.time.step = 3000;
    return spec;
  }
  std::string notValid(const std::string& name) { return "Data file  \" " + name + "\"  is not valid"; }

  test::TemporaryFolder folder;
  Model model;
  std::string path = folder.file("data.tsb");
};

TEST_F(HeatExchange, ANewOneIsWrittenInFileOrder) {
  EXPECT_EQ(savedText(heat()),
            "HEAT_EXCHANGE {\n"
            "    RKorder 1\n"
            "    EvapPrecipTemp #false\n"
            "    AngstromsLawA 0.295\n"
            "    AngstromsLawB 0.371\n"
            "    DaltonsLawA 0.5\n"
            "    DaltonsLawB 0.9\n"
            "    RelativeHumidity 88\n"
            "    StandardMeridian 0.0\n"
            "    DisplacementHours 0.0\n"
            "    AirFormat -1\n"
            "    AirConstantValue 20.0\n"
            "    ClearnessFormat -1\n"
            "    HumidityFormat -1\n"
            "    Clearness 70\n"
            "    AIR_FILE {\n"
            "        File_Name (file)\"\"\n"
            "        Item_Numbers 1\n"
            "    }\n"
            "    HUMIDITY_FILE {\n"
            "        File_Name (file)\"\"\n"
            "        Item_Numbers 1\n"
            "    }\n"
            "    CLEARNESS_FILE {\n"
            "        File_Name (file)\"\"\n"
            "        Item_Numbers 1\n"
            "    }\n"
            "}\n");
}

TEST_F(HeatExchange, IsReadBack) {
  test::load(heat(), kFilled);
  EXPECT_EQ(heat().integrationOrder, 4);
  EXPECT_TRUE(heat().latentHeatTemperature);
  EXPECT_EQ(heat().humidityFile.items, (std::vector<std::uint32_t>{3, 1}));
  EXPECT_EQ(savedText(heat()), kFilled);
}

TEST_F(HeatExchange, WhatTheFileLacksStays) {
  test::load(heat(), kFilled);
  test::load(heat(), "HEAT_EXCHANGE { AIR_FILE { File_Name (file)\"other.tsb0\" } }");
  EXPECT_EQ(heat().airFile.fileName.text(), "other.tsb0");
  EXPECT_EQ(heat().airFile.items, std::vector<std::uint32_t>{2});
  EXPECT_EQ(heat().clearnessFile.fileName.text(), "clear.tsb0");
  EXPECT_EQ(heat().clearness, 55);
  test::load(heat(), "OTHER {}");
  EXPECT_EQ(heat().relativeHumidity, 75);
  EXPECT_TRUE(model.host.texts.empty());
}

TEST_F(HeatExchange, AnOrderThatIsNoneIsKept) {
  test::load(heat(), "HEAT_EXCHANGE { RKorder 3 }");
  EXPECT_THAT(savedText(heat()), HasSubstr("RKorder 3\n"));
}

TEST_F(HeatExchange, Copying) {
  test::load(heat(), kFilled);
  Model other;
  other.root.nadHeatExchange->CopyFrom(heat());
  EXPECT_EQ(savedText(*other.root.nadHeatExchange), savedText(heat()));
}

TEST_F(HeatExchange, OnlyWithJustOneSuchComponentFilesAreChecked) {
  heat().airFormat = heat().clearnessFormat = heat().humidityFormat = 0;
  EXPECT_EQ(faults().size(), 3U);
  model.root.nadComponent->SetCount(2);
  EXPECT_EQ(faults().size(), 3U);
  model.root.nadComponent->at(2).type = CNadComponentObjectKvs::kHeatExchange;
  EXPECT_THAT(faults(), IsEmpty());
  for (const int type : {0, 1, 2}) {
    model.root.nadComponent->at(1).type = model.root.nadComponent->at(2).type = type;
    EXPECT_THAT(faults(), IsEmpty()) << type;
  }
  model.root.nadComponent->SetCount(0);
  EXPECT_THAT(faults(), IsEmpty());
}

TEST_F(HeatExchange, AirThenClearnessThenHumidity) {
  heat().airFile.fileName = "air.tsb0";
  heat().clearnessFile.fileName = "clear.tsb0";
  heat().humidityFile.fileName = "humid.tsb0";
  EXPECT_THAT(faults(), IsEmpty());
  heat().airFormat = 2;
  heat().clearnessFormat = heat().humidityFormat = 0;
  EXPECT_EQ(faults(), (Texts{notValid("air.tsb0"), notValid("clear.tsb0"), notValid("humid.tsb0")}));
  heat().clearnessFormat = -1;
  EXPECT_EQ(faults(), (Texts{notValid("air.tsb0"), notValid("humid.tsb0")}));
}

TEST_F(HeatExchange, ASeriesOfAirTemperature) {
  heat().airFormat = 0;
  heat().airFile.fileName = path;
  writeSeries(100006, "degC");
  EXPECT_THAT(faults(), IsEmpty());
  writeSeries(100006, "degC", 2999);
  EXPECT_EQ(faults().size(), 1U) << "too short";
  writeSeries(100201, "mg l-1");
  EXPECT_EQ(faults().size(), 1U) << "another quantity";
  writeSeries(100006, "degF");
  EXPECT_EQ(faults().size(), 1U) << "another unit";
  writeSeries(100006, "degC");
  heat().airFile.items = {2};
  EXPECT_EQ(faults().size(), 1U) << "no such item";
  heat().airFile.items = {1};
  writeMap(airMap());
  EXPECT_EQ(faults().size(), 1U) << "a map";
  folder.write("data.tsb", "no data file");
  EXPECT_EQ(faults().size(), 1U) << "another kind";
}

TEST_F(HeatExchange, MapsOfAirTemperature) {
  heat().airFormat = 2;
  heat().airFile.fileName = path;
  writeMap(airMap());
  EXPECT_THAT(faults(), IsEmpty());
  test::GridSpec spec = airMap();
  spec.noJ = 11;
  writeMap(spec);
  EXPECT_EQ(faults().size(), 1U) << "another size";
  spec = airMap();
  spec.dy = 50;
  writeMap(spec);
  EXPECT_EQ(faults().size(), 1U) << "another spacing";
  spec = airMap();
  spec.time.step = 10;
  writeMap(spec);
  EXPECT_EQ(faults().size(), 1U) << "too short";
  writeSeries(100006, "degC");
  EXPECT_EQ(faults().size(), 1U) << "a series";
}

TEST_F(HeatExchange, SeriesOfHumidityAndClearness) {
  const auto check = [this](std::int32_t CNadHeatExchangeKvs::*format,
                            UTsbSelection CNadHeatExchangeKvs::*file) {
    heat().*format = 0;
    (heat().*file).fileName = path;
    for (const auto& [type, unit] : {std::pair{100239, "%"}, {100144, "1"}, {999, "1"}}) {
      writeSeries(type, unit);
      EXPECT_THAT(faults(), IsEmpty()) << type;
    }
    writeSeries(100239, "%", 10);
    EXPECT_EQ(faults(), Texts{notValid(path)}) << "too short";
    writeMap(airMap());
    EXPECT_EQ(faults(), Texts{notValid(path)}) << "a map";
    heat().*format = -1;
  };
  check(&CNadHeatExchangeKvs::humidityFormat, &CNadHeatExchangeKvs::humidityFile);
  check(&CNadHeatExchangeKvs::clearnessFormat, &CNadHeatExchangeKvs::clearnessFile);
}

TEST_F(HeatExchange, Requests) {
  const auto describe = [](const CVdFileSelectorDlg& selector) {
    EXPECT_EQ(selector.requests().size(), 1U);
    EXPECT_FALSE(selector.pluginEnabled());
    return selector.requests().front()->description();
  };
  CVdFileSelectorDlg air;
  heat().RequestAirFile(air);
  EXPECT_EQ(describe(air), "Air temperature");
  EXPECT_EQ(air.requests().front()->types(), std::vector{100006});
  CVdFileSelectorDlg humidity;
  heat().RequestHumidityFile(humidity);
  EXPECT_EQ(describe(humidity), "Relative humidity");
  CVdFileSelectorDlg clearness;
  heat().RequestClearnessFile(clearness);
  EXPECT_EQ(describe(clearness), "Clearness coefficient");
}

}  // namespace advection_dispersion_heat_exchange_test
}  // namespace gridbay

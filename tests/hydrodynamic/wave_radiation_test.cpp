#include "hydrodynamic/wave_radiation.h"

#include <gmock/gmock.h>

#include "core/edition.h"
#include "tests/hydrodynamic/area_fixture.h"

namespace gridbay {
namespace hydrodynamic_wave_radiation_test {

using test::savedText;
using ::testing::ElementsAre;
using ::testing::IsEmpty;

class WaveRadiation : public test::AreaTest {
 protected:
  CNhdWaveRadiationKvs& list() { return *root().nhdWaveRadiation; }
  std::vector<std::string> faults(int deep = 1) { return faultsOf(list(), PageId::waveRadiation, deep); }
};

std::string filled(bool included) {
  return std::string("WAVE_RADIATION {\n    AREA_1 {\n        Included ") + (included ? "#true" : "#false") +
         "\n"
         "        FILE_TIME_DESCR 1\n"
         "        DATA_FILE {\n"
         "            FILE_NAME (file)\"waves/1.tsb2\"\n"
         "        }\n"
         "    }\n"
         "    AREA_2 {\n"
         "        Included #false\n"
         "        FILE_TIME_DESCR 0\n"
         "        DATA_FILE {\n"
         "            FILE_NAME (file)\"\"\n"
         "        }\n"
         "    }\n"
         "}\n";
}

TEST_F(WaveRadiation, ANewOneIsWrittenInFileOrder) {
  test::Model one;
  EXPECT_EQ(savedText(*one.root.nhdWaveRadiation),
            "WAVE_RADIATION {\n"
            "    AREA_1 {\n"
            "        Included #false\n"
            "        FILE_TIME_DESCR 0\n"
            "        DATA_FILE {\n"
            "            FILE_NAME (file)\"\"\n"
            "        }\n"
            "    }\n"
            "}\n");
}

TEST_F(WaveRadiation, IsReadBackAndSwitchedOffInTheWetlandSweepKit) {
  test::load(list(), filled(true));
  EXPECT_EQ(list().at(1).included, theEdition.wetlandSweepKit ? 0 : 1);
  EXPECT_EQ(list().at(1).fileName.absolute(), "/case/waves/1.tsb2");
  EXPECT_EQ(savedText(list()), filled(!theEdition.wetlandSweepKit));
  list().at(1).included = 1;
  EXPECT_EQ(savedText(list()), filled(!theEdition.wetlandSweepKit));
}

TEST_F(WaveRadiation, IsCopied) {
  test::load(list(), filled(true));
  list().at(1).included = 1;
  test::Model other;
  other.root.nhdWaveRadiation->CopyFrom(list());
  EXPECT_EQ(other.root.nhdWaveRadiation->at(1).included, 1);
  EXPECT_EQ(savedText(*other.root.nhdWaveRadiation), savedText(list()));
}

TEST_F(WaveRadiation, OnlyWhatIsIncludedIsChecked) {
  list().at(2).fileName = "none.tsb2";
  EXPECT_THAT(faults(), IsEmpty());
  list().at(2).included = 1;
  EXPECT_THAT(faults(), ElementsAre(notValid("none.tsb2")));
  EXPECT_THAT(faults(0), IsEmpty());
  list().at(1).included = 1;
  EXPECT_THAT(faults(), ElementsAre(notValid(""), notValid("none.tsb2")));
}

TEST_F(WaveRadiation, WhatAFileMustBe) {
  list().at(2).included = 1;
  const auto isValid = [this](const Spec& spec) {
    list().at(2).fileName = write("r.tsb2", spec);
    const std::vector<std::string> found = faults();
    if (!found.empty()) EXPECT_THAT(found, ElementsAre(notValid(folder.file("r.tsb2"))));
    return found.empty();
  };
  const std::vector<TsbItem> items{{"Sxx"}, {"Sxy"}, {"Syy"}};
  EXPECT_TRUE(isValid({.items = items, .axes = innerAxes(), .dataType = 930}));
  EXPECT_FALSE(isValid({.items = items, .axes = innerAxes(), .dataType = 0}));
  EXPECT_FALSE(isValid({.items = items, .dataType = 930}));
  EXPECT_TRUE(isValid({.items = items, .axes = innerAxes(), .dataType = 930, .seconds = 1}));
  list().at(2).timeDescription = CNhdWaveRadiationObjectKvs::kQuasiStationary;
  EXPECT_FALSE(isValid({.items = items, .axes = innerAxes(), .dataType = 930, .seconds = 1}));
  EXPECT_TRUE(isValid({.items = items, .axes = innerAxes(), .dataType = 930}));
}

}  // namespace hydrodynamic_wave_radiation_test
}  // namespace gridbay

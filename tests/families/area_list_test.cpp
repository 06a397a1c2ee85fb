#include "families/area_list.h"

#include <gmock/gmock.h>

#include "tests/hydrodynamic/area_fixture.h"

namespace gridbay {
namespace families_area_list_test {

using test::savedText;
using ::testing::ElementsAre;
using ::testing::HasSubstr;
using ::testing::IsEmpty;
using ::testing::Not;

using AreaLists = test::AreaTest;

TEST_F(AreaLists, FollowTheNumberOfAreas) {
  root().nhdSurfaceElevation->at(1).constantValue = 3;
  root().nhdEddyViscosity->at(1).constantValue = 3;
  root().nhdWaveRadiation->at(1).timeDescription = 1;
  root().nhdResistance->at(1).constantValue = 3;
  for (const int areas : {2, 5, 1, 0}) {
    root().bathymetry->SetNoAreas(areas);
    EXPECT_EQ(root().nhdSurfaceElevation->GetCount(), areas);
    EXPECT_EQ(root().nhdEddyViscosity->GetCount(), areas);
    EXPECT_EQ(root().nhdWaveRadiation->GetCount(), areas);
    EXPECT_EQ(root().nhdResistance->GetCount(), areas);
    if (areas == 0) continue;
    EXPECT_EQ(root().nhdSurfaceElevation->at(1).constantValue, 3);
    EXPECT_EQ(root().nhdEddyViscosity->at(1).constantValue, 3);
    EXPECT_EQ(root().nhdWaveRadiation->at(1).timeDescription, 1);
    EXPECT_EQ(root().nhdResistance->at(1).constantValue, 3);
  }
  root().bathymetry->SetNoAreas(1);
  EXPECT_EQ(root().nhdResistance->at(1).constantValue, 32.0F);
}

TEST_F(AreaLists, AnotherLengthThanTheAreasIsTold) {
  for (const int entries : {1, 2, 3}) {
    root().nhdSurfaceElevation->SetCount(entries);
    root().nhdEddyViscosity->SetCount(entries);
    root().nhdWaveRadiation->SetCount(entries);
    for (const int deep : {0, 1}) {
      const auto expected = [entries](const char* text) {
        return entries == 2 ? std::vector<std::string>() : std::vector<std::string>{text};
      };
      EXPECT_EQ(faultsOf(*root().nhdSurfaceElevation, PageId::surfaceElevation, deep),
                expected("Surface Elevation: Number of surface elevation objects does not correspond to "
                         "number of subdomains"));
      EXPECT_EQ(faultsOf(*root().nhdEddyViscosity, PageId::eddyViscosity, deep),
                expected("Eddy Viscocity: Number of eddy viscocity objects does not correspond to number of "
                         "subdomains"));
      EXPECT_EQ(faultsOf(*root().nhdWaveRadiation, PageId::waveRadiation, deep),
                expected("Number of wave radiation objects does not correspond to number of subdomains"));
    }
  }
}

TEST_F(AreaLists, AnEmptyListIsNoFault) {
  root().nhdSurfaceElevation->SetCount(0);
  root().nhdEddyViscosity->SetCount(0);
  root().nhdWaveRadiation->SetCount(0);
  EXPECT_THAT(faultsOf(*root().nhdSurfaceElevation, PageId::surfaceElevation), IsEmpty());
  EXPECT_THAT(faultsOf(*root().nhdEddyViscosity, PageId::eddyViscosity), IsEmpty());
  EXPECT_THAT(faultsOf(*root().nhdWaveRadiation, PageId::waveRadiation), IsEmpty());
}

TEST_F(AreaLists, TheEntriesAreAskedAfterTheLength) {
  root().nhdSurfaceElevation->SetCount(1);
  root().nhdSurfaceElevation->at(1).type = 3;
  EXPECT_THAT(faultsOf(*root().nhdSurfaceElevation, PageId::surfaceElevation),
              ElementsAre(HasSubstr("Number of surface"), HasSubstr("Type of initial")));
  EXPECT_THAT(faultsOf(*root().nhdSurfaceElevation, PageId::surfaceElevation, 0), testing::SizeIs(1));
}

TEST_F(AreaLists, OneAreaAndOneEntryOfEachAreNoFault) {
  test::Model one;
  EXPECT_THAT(faultsOf(*one.root.nhdSurfaceElevation, PageId::surfaceElevation), IsEmpty());
  EXPECT_THAT(faultsOf(*one.root.nhdEddyViscosity, PageId::eddyViscosity), IsEmpty());
  EXPECT_THAT(faultsOf(*one.root.nhdWaveRadiation, PageId::waveRadiation), IsEmpty());
  EXPECT_THAT(faultsOf(*one.root.nhdResistance, PageId::resistance), IsEmpty());
}

TEST_F(AreaLists, ALoadKeepsTheLength) {
  test::load(*root().nhdSurfaceElevation,
             "SURFACE_ELEVATION { AREA_1 { Constant_Value 1.0 }; AREA_2 { Constant_Value 2.0 }; AREA_3 { "
             "Constant_Value 3.0 } }");
  EXPECT_EQ(root().nhdSurfaceElevation->GetCount(), 2);
  EXPECT_EQ(root().nhdSurfaceElevation->at(2).constantValue, 2);
  EXPECT_THAT(savedText(*root().nhdSurfaceElevation), Not(HasSubstr("AREA_3")));
  EXPECT_THAT(model.host.texts, IsEmpty());
}

TEST_F(AreaLists, ASectionThatIsMissingIsToldAndTheLoadGoesOn) {
  const std::string eddy =
      "Error in the KVS-FILE\nThe number of Eddy Viscosity sections does not correspond to the number of "
      "sub domaines";
  const std::string surface =
      "Error in the KVS-FILE\nThe number of Surface Elevation sections does not correspond to the number of "
      "sub domaines";
  const std::string resistance =
      "Error in the Hydrodynamic section of the KVS-FILE\nThe number of Resistance sections does not "
      "correspond to the number of sub domaines";
  test::load(*root().nhdSurfaceElevation, "SURFACE_ELEVATION { AREA_2 { Constant_Value 2.0 } }");
  test::load(*root().nhdEddyViscosity, "EDDY_VISCOSITY { AREA_2 { Constant_Value 2.0 } }");
  test::load(*root().nhdWaveRadiation, "WAVE_RADIATION { AREA_2 { FILE_TIME_DESCR 1 } }");
  test::load(*root().nhdResistance, "RESISTANCE { AREA_2 { Constant_Value 2.0 }; Update_Frequency 7 }");
  EXPECT_THAT(model.host.texts, ElementsAre(surface, eddy, eddy, resistance));
  EXPECT_EQ(root().nhdSurfaceElevation->at(2).constantValue, 2);
  EXPECT_EQ(root().nhdEddyViscosity->at(2).constantValue, 2);
  EXPECT_EQ(root().nhdWaveRadiation->at(2).timeDescription, 1);
  EXPECT_EQ(root().nhdResistance->at(2).constantValue, 2);
  EXPECT_EQ(root().nhdResistance->updateFrequency, 7);
}

TEST_F(AreaLists, WithoutTheirSectionNothingIsReadOrTold) {
  for (CKvsBase* list : std::initializer_list<CKvsBase*>{
           root().nhdSurfaceElevation.get(), root().nhdEddyViscosity.get(), root().nhdWaveRadiation.get(),
           root().nhdResistance.get(), root().windConditions.get()}) {
    const std::string before = savedText(*list);
    test::load(*list, "OTHER { AREA_1 { Constant_Value 5.0 } }");
    EXPECT_EQ(savedText(*list), before);
  }
  EXPECT_THAT(model.host.texts, IsEmpty());
}

}  // namespace families_area_list_test
}  // namespace gridbay

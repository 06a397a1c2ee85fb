#include "setup/dlg_enumerator.h"

#include <gtest/gtest.h>

#include <set>

#include "core/edition.h"

namespace gridbay {
namespace setup_dlg_enumerator_test {

struct Asked {
  std::string pageClass;
  std::string topic;
  std::string local;
};

Asked ask(std::int32_t id) {
  Asked asked;
  asked.pageClass = CDlgEnumerator().GetPageClass(id, &asked.topic, &asked.local);
  return asked;
}

TEST(DlgEnumerator, EveryIdInUseHasOneRow) {
  const CDlgEnumerator enumerator;
  std::set<std::int32_t> ids;
  for (const PageEntry& page : enumerator.pages()) {
    EXPECT_TRUE(ids.insert(page.id).second) << page.id;
    EXPECT_FALSE(page.caption.empty()) << page.id;
    EXPECT_EQ(page.pageClass.empty(), page.templateId == 0) << page.id;
  }
  for (std::int32_t id = 9; id <= CDlgEnumerator::kHighestId; ++id) {
    const bool unused = id == 33 || id == 36 || id == 69 || id == 144;
    EXPECT_EQ(ids.count(id), unused ? 0U : 1U) << id;
  }
  EXPECT_EQ(ids.size(), 134U);
}

TEST(DlgEnumerator, Captions) {
  const CDlgEnumerator enumerator;
  for (const std::int32_t id : {-1, 0, 1, 8, 33, 36, 69, 144, 147})
    EXPECT_EQ(enumerator.GetCaption(id), "") << id;
  EXPECT_EQ(enumerator.GetCaption(9), "Boundary");
  EXPECT_EQ(enumerator.GetCaption(27), "Bathymetry");
  EXPECT_EQ(enumerator.GetCaption(21), enumerator.GetCaption(34));
  EXPECT_EQ(enumerator.GetCaption(143), "Infiltration");
  EXPECT_EQ(enumerator.GetCaption(146), "Infiltration");
  EXPECT_EQ(enumerator.GetCaption(130), "Forcing functions");
}

TEST(DlgEnumerator, PagesWithAClassHaveNoPaths) {
  EXPECT_EQ(ask(146).pageClass, "CWQSADInfiltrationDlg");
  EXPECT_EQ(ask(143).pageClass, "CHDInfiltrationDlg");
  EXPECT_EQ(ask(27).pageClass, "CBathymetryDlg");
  EXPECT_EQ(ask(27).topic, "");
  EXPECT_EQ(ask(27).local, "");
}

TEST(DlgEnumerator, ItemsWithoutAClassHaveTheirHelp) {
  const bool sweep = theEdition.wetlandSweepKit;
  EXPECT_EQ(ask(1).pageClass, "");
  EXPECT_EQ(ask(1).local, sweep ? "res://V27NestedWSK.dll/VANE_27_Wetland_Sweep_Kit.htm"
                                : "res://V27Nested.dll/VANE_27_Flow_Model.htm");
  EXPECT_EQ(ask(1).topic, sweep ? "/v27wsk/V27WSK_Online/Cover_WSK_Online/VANE_27_Wetland_Sweep_Kit.htm"
                                : "/V27Nested/V27Nested/Cover/VANE_27_Flow_Model.htm");
  EXPECT_EQ(ask(2).local, sweep ? "res://V27NestedWSK.dll/Basic_Parameters_WSK.htm"
                                : "res://V27Nested.dll/Basic_Parameters.htm");
  EXPECT_EQ(ask(3).local, "res://V27Nested.dll/Advection-Dispersion_Parameters.htm");
  EXPECT_EQ(ask(5).topic, ask(6).topic);
  EXPECT_EQ(ask(61).topic, "/V27Nested/V27Nested/v27mt_dialogs/Bed_Parameters.htm");
  EXPECT_EQ(ask(115).local, "res://V27Nested.dll/v27dialogoverviewb.htm");
  for (const std::int32_t id : {8, 124, 130, 141, 33, 0, 999}) {
    EXPECT_EQ(ask(id).pageClass, "") << id;
    EXPECT_EQ(ask(id).topic, sweep ? "/v27wsk/index.htm" : "/V27Nested/index.htm") << id;
    EXPECT_EQ(ask(id).local, sweep ? "res://V27NestedWSK.dll/default.htm" : "res://V27Nested.dll/default.htm")
        << id;
  }
}

TEST(DlgEnumerator, HelpTopicNumbers) {
  const CDlgEnumerator enumerator;
  EXPECT_EQ(enumerator.GetHelpTopicNumber(35), 149788);
  EXPECT_EQ(enumerator.GetHelpTopicNumber(46), 150006);
  EXPECT_EQ(enumerator.GetHelpTopicNumber(42), 0);
  EXPECT_EQ(enumerator.GetHelpTopicNumber(1), 0);
}

}  // namespace setup_dlg_enumerator_test
}  // namespace gridbay

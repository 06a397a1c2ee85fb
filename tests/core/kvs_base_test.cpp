#include "core/kvs_base.h"

#include <gtest/gtest.h>

#include "basic/bathymetry.h"
#include "basic/boundary.h"
#include "tests/support/model.h"

namespace gridbay {
namespace core_kvs_base_test {

using test::Model;

class Plain : public CKvsBase {
 public:
  using CKvsBase::CKvsBase;
  void Save(KvsFile&, const std::string&) override {}
  void Load(KvsSection, const std::string&) override {}
};

TEST(KvsBase, ParentAndRoot) {
  Plain root(nullptr);
  Plain child(&root);
  Plain grandchild(&child);
  EXPECT_EQ(root.GetParent(), nullptr);
  EXPECT_EQ(grandchild.GetParent(), &child);
  EXPECT_EQ(grandchild.GetRoot(), &root);
  EXPECT_EQ(root.GetRoot(), &root);
  EXPECT_EQ(root.FindChildKvs(), nullptr);
  Model model;
  model.root.boundary->SetNoBoundaries(1);
  EXPECT_EQ(model.root.boundary->GetItem(1)->GetRoot(), &model.root);
}

TEST(KvsBase, TheEmptyCheckFindsNothing) {
  Plain object(nullptr);
  ValidationList messages;
  EXPECT_EQ(object.Validate(messages, 1), 0U);
  EXPECT_TRUE(messages.empty());
  object.CopyFrom(object);
}

TEST(KvsBase, UsablePathNames) {
  for (const char* good : {"a", "out.tsb0", "/x/out put.tsb2", "../ü.tsb0", "C_drive", "a/.hidden"}) {
    EXPECT_TRUE(CKvsBase::IsValidPathName(good)) << good;
  }
  EXPECT_FALSE(CKvsBase::IsValidPathName(nullptr));
  for (const char* bad : {"", " ", "folder/", ".", "a/..", "a\nb", "\x7F"}) {
    EXPECT_FALSE(CKvsBase::IsValidPathName(bad)) << bad;
  }
  EXPECT_FALSE(CKvsBase::IsValidPathName(std::string(256, 'x').c_str()));
  EXPECT_TRUE(CKvsBase::IsValidPathName(std::string(255, 'x').c_str()));
}

TEST(KvsBase, CopiesASectionWithAllItHolds) {
  constexpr std::string_view kText =
      "S {\n    A 1 2.5 \"t\" (file)\"f\" (result)\"r\" #true\n    a 2\n    Inner {\n        Empty {}\n      "
      "  B\n    }\n"
      "    C -9223372036854775808\n}\n";
  const KvsHandle source = test::fileOf(kText);
  KvsHandle copy = kvsCreate();
  CKvsBase::CopySection(&source->tree().root(), *copy);
  EXPECT_EQ(*copy->text(), kText);
}

TEST(Message, IsFormattedAtOnceAndHasSeverityOneUnlessSaid) {
  ValidationList messages;
  EXPECT_EQ(report(messages, PageId::bathymetry, Severity::dependedUpon, texts::dataFileNotValid,
                   std::string("g.tsb2")),
            1U);
  EXPECT_EQ(messages.back(),
            (CMessage{PageId::bathymetry, "Data file  \" g.tsb2\"  is not valid", Severity::dependedUpon}));
  EXPECT_EQ(CMessage().severity, Severity::fault);
  EXPECT_EQ(static_cast<int>(Severity::fault), 1);
  EXPECT_EQ(static_cast<int>(Severity::dependedUpon), 2);
}

TEST(Message, TheSelectorsBufferJoinsItsLines) {
  CValidationMessageBuffer buffer;
  EXPECT_TRUE(buffer.valid());
  buffer.AddValidationMessage(true, {"one"});
  EXPECT_TRUE(buffer.valid());
  buffer.AddValidationMessage(false, {"two", "three"});
  EXPECT_FALSE(buffer.valid());
  EXPECT_EQ(buffer.text(), "one\ntwo\nthree");
}

}  // namespace core_kvs_base_test
}  // namespace gridbay

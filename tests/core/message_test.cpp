#include "core/message.h"

#include <gtest/gtest.h>

#include "setup/setup_file.h"
#include "tests/support/temporary_folder.h"

namespace gridbay {
namespace core_message_test {

using Texts = std::vector<std::string>;

Texts together(const Texts& texts) {
  CollectingMessageHost host;
  showTogether(host, texts);
  return host.texts;
}

TEST(ShowTogether, ShowsEachTextAsItStands) {
  EXPECT_EQ(together({}), Texts{});
  EXPECT_EQ(together({"Error in the KVS-FILE\nOne"}), Texts{"Error in the KVS-FILE\nOne"});
  EXPECT_EQ(together({"one", "two", "one"}), Texts{"one (2 times)\ntwo"});
  EXPECT_EQ(together({"Error in the KVS-FILE\nOne", "two", "Error in the KVS-FILE\nOne"}),
            Texts{"Error in the KVS-FILE\nOne (2 times)\n\ntwo"});
  EXPECT_EQ(together({"same", "same", "same"}), Texts{"same (3 times)"});
}

TEST(ShowTogether, TheFaultsOfALoadKeepTheirLines) {
  const test::TemporaryFolder folder;
  CollectingMessageHost host;
  const std::string path = folder.write("s.v27",
                                        "VANE27_NESTED_MODEL { NESTED_MODEL_GLOBALS { OPEN_BOUNDARY { "
                                        "Number_Of_Boundaries 2 }; SOURCE_AND_SINK "
                                        "{ Number_Of_Sources 1 } } }");
  ASSERT_TRUE(SetupFile::open(path, &host));
  EXPECT_EQ(
      host.texts,
      Texts{"Error in the KVS-FILE\nThe number of Boundary sections does not correspond to the number of sub "
            "domaines (2 times)\n\nError in the KVS-FILE\nThe number of Source Sink sections does not "
            "correspond to the given number"});
}

TEST(CheckedEntry, TellsTheEntriesFromTheOutside) {
  ValidationList messages;
  report(messages, PageId::weirs, Severity::fault, Text{"before"});
  const auto inner = [&](int number) {
    return checkedEntry(messages, {number, 3}, [&] {
      messages.files.push_back({PageId::weirs, "f", "/f"});
      return number == 2 ? report(messages, PageId::weirs, Severity::fault, Text{"in it"}) : 0U;
    });
  };
  EXPECT_EQ(checkedEntry(messages, {4, 5}, [&] { return inner(1) + inner(2); }), 1U);
  ASSERT_EQ(messages.size(), 2U);
  EXPECT_TRUE(messages[0].entries.empty());
  EXPECT_EQ(messages[1].entries, (std::vector<ListEntry>{{4, 5}, {2, 3}}));
  ASSERT_EQ(messages.files.size(), 2U);
  EXPECT_EQ(messages.files[0].entries, (std::vector<ListEntry>{{4, 5}, {1, 3}}));
  // They stand beside the message, which is the same as without them.
  EXPECT_EQ(messages[1], (CMessage{PageId::weirs, "in it"}));
}

TEST(SetupFile, WithoutItsTargetIsNoSetup) {
  const test::TemporaryFolder folder;
  CollectingMessageHost host;
  for (const char* text : {"", "OTHER_MODEL { A 1 }", "NESTED_MODEL_GLOBALS { A 1 }"}) {
    const std::string path = folder.write("s.v27", text);
    const Result<SetupFile> opened = SetupFile::open(path, &host);
    ASSERT_FALSE(opened) << text;
    EXPECT_EQ(opened.error(), "\"" + path + "\" is not a setup: it has no section VANE27_NESTED_MODEL");
  }
  // The model itself takes such a file as one that says nothing.
  CGlobalKvs model(&host);
  const KvsHandle file = kvsCreate();
  model.Load(&file->tree().root(), "/case/s.v27");
  EXPECT_EQ(host.texts, Texts{});
}

}  // namespace core_message_test
}  // namespace gridbay

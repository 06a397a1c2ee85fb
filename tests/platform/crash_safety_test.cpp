// A save that is interrupted at any point leaves the whole old file or the whole new one.

#include <gmock/gmock.h>
#include <sys/wait.h>
#include <unistd.h>

#include <chrono>
#include <csignal>
#include <filesystem>
#include <random>
#include <thread>

#include "basic/area_description.h"
#include "basic/boundary.h"
#include "platform/files/save_file.h"
#include "setup/setup_file.h"
#include "tests/support/faults.h"
#include "tests/support/temporary_folder.h"

namespace gridbay {
namespace platform_crash_safety_test {

namespace fs = std::filesystem;
using test::Fault;
using test::TemporaryFolder;
using test::textOf;

std::ptrdiff_t filesIn(const fs::path& folder) {
  return std::distance(fs::directory_iterator(folder), {});
}

// A setup large enough to be written in several pieces, and the same with another value.
struct TwoSetups {
  explicit TwoSetups(const std::string& path) {
    SetupFile setup(nullptr);
    setup.model().boundary->SetNoBoundaries(4000);
    EXPECT_TRUE(setup.save(path));
    older = textOf(path);
    setup.model().areaDescription->dryingDepth = 0.04F;
    EXPECT_TRUE(setup.save(path));
    newer = textOf(path);
  }
  Outcome saveNewer(const std::string& path) const {
    SetupFile setup(nullptr);
    setup.model().boundary->SetNoBoundaries(4000);
    setup.model().areaDescription->dryingDepth = 0.04F;
    return setup.save(path);
  }
  std::string older;
  std::string newer;
};

class CrashSafety : public ::testing::TestWithParam<bool> {  // with a file that is there before, or none
 protected:
  void putOlder() {
    for (const fs::directory_entry& entry : fs::directory_iterator(folder.path())) fs::remove(entry.path());
    if (GetParam()) folder.write("s.v27", setups.older);
  }
  std::string before() const { return GetParam() ? setups.older : std::string(); }
  std::string now() const { return fs::exists(path) ? textOf(path) : std::string(); }

  TemporaryFolder folder;
  std::string path = folder.file("s.v27");
  TwoSetups setups{path};
};

TEST_P(CrashSafety, EveryCallThatFailsLeavesTheOldFile) {
  for (const Fault fault : {Fault::error, Fault::shortWrite}) {
    putOlder();
    const int calls = test::withFault(0, fault, [this] { ASSERT_TRUE(setups.saveNewer(path)); });
    ASSERT_GT(calls, 8);
    int failures = 0;
    for (int nth = 1; nth <= calls + 1; ++nth) {
      putOlder();
      std::string error;
      bool saved = false;
      test::withFault(nth, fault, [&] {
        const Outcome outcome = setups.saveNewer(path);
        saved = static_cast<bool>(outcome);
        if (!saved) error = outcome.error();
      });
      EXPECT_EQ(now(), saved ? setups.newer : before()) << nth;
      if (saved) continue;
      ++failures;
      EXPECT_THAT(error, ::testing::HasSubstr("cannot save \"" + path)) << nth;
      EXPECT_EQ(filesIn(folder.path()), GetParam() ? 1 : 0) << nth;
    }
    std::printf("%d calls, %d of them made the save fail\n", calls, failures);
    EXPECT_GT(failures, 5);
  }
}

TEST_P(CrashSafety, AProcessKilledAtAnyCallLeavesAWholeFile) {
  putOlder();
  const int calls = test::withFault(0, Fault::error, [this] { ASSERT_TRUE(setups.saveNewer(path)); });
  int killed = 0;
  int older = 0;
  for (const Fault fault : {Fault::killBefore, Fault::killAfter}) {
    for (int nth = 1; nth <= calls; ++nth) {
      putOlder();
      killed +=
          test::killedWithFault(nth, fault, [this] { static_cast<void>(setups.saveNewer(path)); }) ? 1 : 0;
      const std::string text = now();
      older += text == before() ? 1 : 0;
      ASSERT_TRUE(text == before() || text == setups.newer) << nth;
    }
  }
  std::printf("%d processes killed, %d left the old file\n", killed, older);
  EXPECT_EQ(killed, 2 * calls);
  EXPECT_GT(older, calls);
  EXPECT_LT(older, 2 * calls);
}

INSTANTIATE_TEST_SUITE_P(Files, CrashSafety, ::testing::Bool(),
                         [](const auto& replaces) { return replaces.param ? "Replaced" : "New"; });

TEST(KilledAtRandom, AThousandTimes) {
  const TemporaryFolder folder;
  const std::string path = folder.file("s.v27");
  const TwoSetups setups(path);
  std::mt19937 random(20261121);
  constexpr int kTimes = 1000;
  int older = 0;
  for (int time = 0; time < kTimes; ++time) {
    const pid_t child = ::fork();
    ASSERT_GE(child, 0);
    if (child == 0) {
      for (;;) {
        static_cast<void>(static_cast<bool>(saveFile(path, setups.older)));
        static_cast<void>(static_cast<bool>(saveFile(path, setups.newer)));
      }
    }
    std::this_thread::sleep_for(std::chrono::microseconds(random() % 25000));
    ASSERT_EQ(::kill(child, SIGKILL), 0);
    int status = 0;
    ASSERT_EQ(::waitpid(child, &status, 0), child);
    ASSERT_TRUE(WIFSIGNALED(status));
    const std::string text = textOf(path);
    ASSERT_TRUE(text == setups.older || text == setups.newer) << time << ": " << text.size() << " bytes";
    older += text == setups.older ? 1 : 0;
  }
  // Both came about, so the moments were spread over the saves.
  EXPECT_GT(older, 0);
  EXPECT_LT(older, kTimes);
  std::printf("killed %d times, %d times the one text was left and %d times the other\n", kTimes, older,
              kTimes - older);
}

}  // namespace platform_crash_safety_test
}  // namespace gridbay

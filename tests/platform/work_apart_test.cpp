#include "platform/work_apart.h"

#include <gmock/gmock.h>
#include <poll.h>
#include <sys/stat.h>

#include <atomic>
#include <chrono>
#include <csignal>
#include <filesystem>
#include <thread>

#include "platform/apart.h"
#include "platform/files/unfinished_file.h"
#include "platform/no_copy_now.h"
#include "tests/support/temporary_folder.h"

namespace gridbay {
namespace platform_work_apart_test {

void waitForEnd(WorkApart& work) {
  do {
    pollfd line{work.descriptor(), POLLIN, 0};
    ASSERT_EQ(::poll(&line, 1, 10000), 1);
  } while (work.take());
}

TEST(NoCopyNow, ACopyWaitsForIt) {
  std::atomic<bool> isHeld = false;
  std::atomic<bool> isDone = false;
  const std::jthread library([&] {
    const NoCopyNow now;
    isHeld = true;
    std::this_thread::sleep_for(std::chrono::milliseconds(50));
    isDone = true;
  });
  while (!isHeld) std::this_thread::yield();
  EXPECT_TRUE(NoCopyNow::isHeld());
  EXPECT_TRUE(holdsApart([&] { return isDone.load(); }, 5));
  EXPECT_FALSE(NoCopyNow::isHeld());
  // Copies of a copy are made as ever.
  EXPECT_TRUE(holdsApart([] { return holdsApart([] { return true; }, 5); }, 5));
}

TEST(WorkApart, HandsBackATextAndTellsHowMuchIsDone) {
  const std::string bytes(3 << 20, 'x');
  int here = 0;
  Result<WorkApart> work = WorkApart::begin([&](const WorkApart::Progress& progress) {
    ++here;
    EXPECT_TRUE(progress(0.5));
    return bytes + '\0' + "end";
  });
  ASSERT_TRUE(work);
  EXPECT_FALSE(work->text());
  waitForEnd(*work);
  EXPECT_EQ(work->done(), 0.5);
  EXPECT_EQ(work->text(), bytes + '\0' + "end");
  EXPECT_EQ(here, 0);  // what it does to memory stays with it
}

TEST(WorkApart, ACrashOrAnExceptionEndsTheWorkAlone) {
  for (const bool throws : {false, true}) {
    Result<WorkApart> work = WorkApart::begin([throws](const WorkApart::Progress&) -> std::string {
      if (throws) throw std::runtime_error("no text");
      std::raise(SIGSEGV);
      return "no text";
    });
    ASSERT_TRUE(work);
    waitForEnd(*work);
    EXPECT_FALSE(work->text());
  }
}

TEST(WorkApart, IsStoppedByItsEnd) {
  const test::TemporaryFolder folder;
  const std::string wanted = folder.file("wanted");
  const auto isEmpty = [&] { return std::filesystem::is_empty(std::filesystem::path(wanted).parent_path()); };
  for (const bool heeds : {true, false}) {
    const auto start = std::chrono::steady_clock::now();
    {
      const Result<WorkApart> work = WorkApart::begin(
          [&](const WorkApart::Progress& progress) {
            const UnfinishedFile made(wanted);
            while (progress(0) || !heeds) std::this_thread::sleep_for(std::chrono::milliseconds(5));
            return std::string();
          },
          wanted);
      ASSERT_TRUE(work);
      while (isEmpty()) std::this_thread::yield();
    }
    // It has put away what it had begun; what heeds nothing is ended a while later, and leaves nothing
    // either.
    EXPECT_TRUE(isEmpty());
    EXPECT_LT(std::chrono::steady_clock::now() - start, std::chrono::seconds(heeds ? 10 : 20));
  }
}

TEST(UnfinishedFileTest, TakesNoNameOfAFolderOrAPipe) {
  const test::TemporaryFolder folder;
  const std::string pipe = folder.file("pipe");
  ASSERT_EQ(::mkfifo(pipe.c_str(), 0600), 0);
  EXPECT_EQ(UnfinishedFile(pipe).path(), "");
  EXPECT_TRUE(std::filesystem::is_fifo(pipe));
  EXPECT_EQ(UnfinishedFile(std::filesystem::path(pipe).parent_path().string()).path(), "");
}

}  // namespace platform_work_apart_test
}  // namespace gridbay

#include "platform/apart.h"

#include <gtest/gtest.h>
#include <unistd.h>

#include <atomic>
#include <csignal>
#include <cstdio>
#include <cstdlib>
#include <ctime>
#include <filesystem>
#include <new>
#include <stdexcept>
#include <vector>

#include "platform/large_memory.h"

namespace gridbay {
namespace platform_apart_test {

TEST(Apart, TellsWhetherTheCheckHolds) {
  EXPECT_TRUE(holdsApart([] { return true; }, 10));
  EXPECT_FALSE(holdsApart([] { return false; }, 10));
}

TEST(Apart, WhateverEndsTheCopyTheCheckDoesNotHold) {
  EXPECT_FALSE(holdsApart([]() -> bool { throw std::runtime_error("x"); }, 10));
  EXPECT_FALSE(holdsApart([] { return std::raise(SIGSEGV) == 0; }, 10));
  EXPECT_FALSE(holdsApart([]() -> bool { std::abort(); }, 10));
  EXPECT_FALSE(holdsApart([]() -> bool { ::_exit(3); }, 10));
}

TEST(Apart, OfSeveralChecksEachHasItsAnswerUpToOneThatEndsTheCopy) {
  using Answers = std::vector<bool>;
  EXPECT_EQ(holdApart(
                0, [](std::size_t) { return true; }, 10),
            Answers());
  EXPECT_EQ(holdApart(
                3, [](std::size_t i) { return i != 1; }, 10),
            (Answers{true, false, true}));
  const auto endsAtTheSecond = [](std::size_t i) -> bool { return i != 1 || std::raise(SIGSEGV) == 0; };
  EXPECT_EQ(holdApart(3, endsAtTheSecond, 10), (Answers{true, false, false}));
}

TEST(Apart, EachCheckHasItsOwnTime) {
  const auto computes = [](std::size_t) {
    const std::clock_t start = std::clock();
    while (std::clock() - start < CLOCKS_PER_SEC * 7 / 10) {
    }
    return true;
  };
  EXPECT_EQ(holdApart(3, computes, 1), std::vector<bool>(3, true));
}

TEST(Apart, AlsoWhereChildrenAreIgnored) {
  const auto before = std::signal(SIGCHLD, SIG_IGN);
  EXPECT_TRUE(holdsApart([] { return true; }, 10));
  EXPECT_FALSE(holdsApart([]() -> bool { std::abort(); }, 10));
  std::signal(SIGCHLD, before);
}

TEST(Apart, NoFileIsLeftOpen) {
  const auto openFiles = [] {
    return std::distance(std::filesystem::directory_iterator("/proc/self/fd"), {});
  };
  const auto before = openFiles();
  for (int i = 0; i < 10; ++i) holdsApart([i] { return i % 2 == 0; }, 10);
  EXPECT_EQ(openFiles(), before);
}

TEST(Apart, ACheckThatGoesOnForEverIsEnded) {
  EXPECT_FALSE(holdsApart(
      [] {
        std::atomic<int> rounds = 0;
        while (rounds >= 0) rounds = 1 - rounds;
        return true;
      },
      1));
}

TEST(Apart, MemoryIsBounded) {
  EXPECT_FALSE(holdsApart([] { return allocateBytes(std::size_t{64} << 30) != nullptr; }, 10));
  EXPECT_TRUE(holdsApart([] { return allocateBytes(std::size_t{64} << 20) != nullptr; }, 10));
}

TEST(Apart, NothingThatTheCheckChangesOrSaysIsLeft) {
  int number = 1;
  ::testing::internal::CaptureStderr();
  ::testing::internal::CaptureStdout();
  EXPECT_TRUE(holdsApart(
      [&number] {
        number = 2;
        std::fputs("text\n", stderr);
        std::puts("text");
        return std::fflush(nullptr) == 0;
      },
      10));
  EXPECT_EQ(::testing::internal::GetCapturedStdout(), "");
  EXPECT_EQ(::testing::internal::GetCapturedStderr(), "");
  EXPECT_EQ(number, 1);
}

}  // namespace platform_apart_test
}  // namespace gridbay

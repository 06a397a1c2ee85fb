#include "platform/side_by_side.h"

#include <gtest/gtest.h>
#include <pthread.h>
#include <unistd.h>

#include <csignal>
#include <map>
#include <set>
#include <stdexcept>

namespace gridbay {
namespace platform_side_by_side_test {

using Results = std::map<std::size_t, std::optional<std::string>>;

Results resultsOf(SideBySide task) {
  Results results;
  task.took = [&](std::size_t piece, std::optional<std::string> text) {
    EXPECT_TRUE(results.emplace(piece, std::move(text)).second) << piece << " came twice";
  };
  EXPECT_TRUE(task.run());
  return results;
}

TEST(SideBySide, DoesEachPieceOnceInOtherProcesses) {
  std::set<std::string> processes;
  const Results results = resultsOf(
      {.count = 300,
       .work = [](std::size_t i) { return std::to_string(::getpid()) + " " + std::string(i * 1000, 'x'); },
       .processes = 3});
  ASSERT_EQ(results.size(), 300U);
  for (const auto& [piece, text] : results) {
    const std::size_t blank = text->find(' ');
    EXPECT_EQ(text->size() - blank - 1, piece * 1000);
    processes.insert(text->substr(0, blank));
  }
  EXPECT_FALSE(processes.contains(std::to_string(::getpid())));
  EXPECT_LE(processes.size(), 3U);
}

TEST(SideBySide, OfNothingThereIsNothing) {
  EXPECT_EQ(resultsOf({.count = 0, .work = [](std::size_t) -> std::string { throw 1; }}).size(), 0U);
}

TEST(SideBySide, WhatAPieceDoesToMemoryStaysInItsProcess) {
  int value = 1;
  const Results results =
      resultsOf({.count = 2, .work = [&](std::size_t) { return std::to_string(++value); }, .processes = 1});
  EXPECT_EQ(results, (Results{{0, "2"}, {1, "3"}}));
  EXPECT_EQ(value, 1);
}

TEST(SideBySide, ACrashOrAnExceptionCostsOnePiece) {
  for (const std::size_t processes : {1U, 2U}) {
    const Results results = resultsOf({.count = 6,
                                       .work =
                                           [](std::size_t i) {
                                             if (i == 1) ::raise(SIGKILL);
                                             if (i == 4) throw std::runtime_error("no");
                                             return std::to_string(i);
                                           },
                                       .processes = processes});
    EXPECT_EQ(results, (Results{{0, "0"}, {1, {}}, {2, "2"}, {3, "3"}, {4, {}}, {5, "5"}}));
  }
}

int doomedCopies = 0;
bool isDoomed = false;

TEST(SideBySide, ACopyThatEndsBeforeItBeginsCostsNothing) {
  ASSERT_EQ(::pthread_atfork([] { isDoomed = doomedCopies > 0 && doomedCopies-- > 0; }, nullptr,
                             [] {
                               if (isDoomed) ::_exit(1);
                             }),
            0);
  doomedCopies = 2;
  const Results results =
      resultsOf({.count = 3, .work = [](std::size_t i) { return std::to_string(i); }, .processes = 1});
  EXPECT_EQ(results, (Results{{0, "0"}, {1, "1"}, {2, "2"}}));
  // Those of which none comes to anything have an end.
  doomedCopies = 1000;
  const SideBySide task{.count = 3,
                        .work = [](std::size_t) { return std::string(); },
                        .took = [](std::size_t, const std::optional<std::string>&) {},
                        .processes = 1};
  EXPECT_FALSE(task.run());
  doomedCopies = 0;
}

TEST(SideBySide, AStopFinishesWhatIsBegun) {
  std::size_t taken = 0;
  const SideBySide task{.count = 1'000'000,
                        .work =
                            [](std::size_t) {
                              ::usleep(1000);
                              return std::string("done");
                            },
                        .took =
                            [&](std::size_t, const std::optional<std::string>& text) {
                              EXPECT_EQ(text, "done");
                              ++taken;
                            },
                        .isStopped = [&] { return taken >= 3; },
                        .processes = 2};
  EXPECT_TRUE(task.run());
  EXPECT_GE(taken, 3U);
  EXPECT_LT(taken, 10'000U);
}

TEST(SideBySide, AnExceptionOfWhoTakesEndsTheWork) {
  const SideBySide task{
      .count = 1000,
      .work = [](std::size_t) { return std::string(100'000, 'x'); },
      .took = [](std::size_t, const std::optional<std::string>&) { throw std::runtime_error("enough"); },
      .processes = 2};
  EXPECT_THROW(static_cast<void>(task.run()), std::runtime_error);
}

TEST(SideBySide, ThereIsACoreAtLeast) {
  EXPECT_GE(coreCount(), 1U);
}

}  // namespace platform_side_by_side_test
}  // namespace gridbay

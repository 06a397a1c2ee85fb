#pragma once

#include <gmock/gmock.h>

#include <filesystem>
#include <functional>
#include <string>
#include <vector>

#include "basic/bathymetry.h"
#include "basic/simulation_period.h"
#include "tests/support/grids.h"
#include "tests/support/model.h"
#include "tests/support/temporary_folder.h"

namespace gridbay::test {

// A hot start file of 12 by 10 points with such blocks.
inline GridSpec hotSpec(std::vector<TsbCustomBlock> blocks) {
  return {.noJ = 12,
          .noK = 10,
          .dx = 100,
          .dy = 100,
          .land = {},
          .itemType = 100403,
          .dataType = 2,
          .unit = "kg m-3",
          .blocks = std::move(blocks)};
}

// The starting conditions of a module in a model of one area, 12 by 10 points 100 m apart. `Start` is their
// class, `member` where the root has them, `page` the one that their messages name.
template <class Start, auto member, PageId page>
class StartingConditions : public ::testing::Test {
 protected:
  using Texts = std::vector<std::string>;
  StartingConditions() { setArea(1, 12, 10, 100); }

  void setArea(int number, int noJ, int noK, float spacing) {
    CBathymetryObjectKvs& area = *root.bathymetry->GetArea(number);
    area.noJ = noJ;
    area.noK = noK;
    area.dx = area.dy = spacing;
  }
  // Hot from the file of area 1.
  void begin() {
    start.hotStart = true;
    start.GetItem(1)->file = path;
  }

  ValidationList messages(int deep = 1) {
    ValidationList list;
    const unsigned counted = start.Validate(list, deep);
    EXPECT_EQ(counted, list.size());
    return list;
  }
  Texts faults(int deep = 1) { return textsOf(messages(deep)); }
  static std::string notValid(const std::string& name) {
    return "Data file  \" " + name + "\"  is not valid";
  }
  static ValidationList refusal(const std::string& name) {
    return {{page, notValid(name), Severity::dependedUpon}};
  }

  // What the check says of the steps that the module covers, in a simulation of 100.
  void checkTimeSteps() {
    const auto at = [this](int first, int last) {
      start.firstStep = first;
      start.lastStep = last;
      EXPECT_EQ(faults(0), faults(1));
      for (const CMessage& message : messages()) {
        EXPECT_EQ(message.page, page);
        EXPECT_EQ(message.severity, Severity::fault);
      }
      return faults();
    };
    const std::string negative = "First time step can not be negative";
    const std::string greater = "The first time step is greater than the last";
    const std::string outside = "Last timestep out of range";
    EXPECT_EQ(at(0, 100), Texts{});
    EXPECT_EQ(at(100, 100), Texts{});
    EXPECT_EQ(at(-1, 100), Texts{negative});
    EXPECT_EQ(at(51, 50), Texts{greater});
    EXPECT_EQ(at(0, 101), Texts{outside});
    EXPECT_EQ(at(200, 101), (Texts{greater, outside}));
    EXPECT_EQ(at(-1, -2), (Texts{negative, greater}));
    EXPECT_EQ(at(0, 2147483647), Texts{outside});
    root.simulationPeriod->noPointsInTime = 51;
    EXPECT_EQ(at(0, 100), Texts{outside});
    EXPECT_EQ(at(0, 50), Texts{});
  }

  // Files that area 1 can't start from: each is told of, and changes nothing, as `unchanged` finds. They
  // are made of a good one.
  void checkBadFiles(const GridSpec& good, const std::function<void(const std::string& why)>& unchanged) {
    const auto refused = [&](const std::string& file, const std::string& why) {
      start.hotStart = true;
      start.GetItem(1)->file = file;
      EXPECT_EQ(messages(), refusal(file)) << why;
      unchanged(why);
    };
    refused("", "no name");
    refused(folder.file("none.tsb2"), "not there");
    refused(folder.path().string(), "a folder");
    refused(folder.write("text.tsb2", "no data file"), "of another kind");
    refused(folder.write("empty.tsb2", ""), "empty");
    const auto changed = [&](const char* why, const std::function<void(GridSpec&)>& change) {
      GridSpec spec = good;
      change(spec);
      writeGrid(path, spec);
      refused(path, why);
    };
    changed("another extent", [](GridSpec& spec) { spec.noJ = 11; });
    changed("another extent", [](GridSpec& spec) { spec.noK = 11; });
    changed("another spacing", [](GridSpec& spec) { spec.dx = 50; });
    changed("another data type", [](GridSpec& spec) { spec.dataType = 0; });
    changed("another data type", [](GridSpec& spec) { spec.dataType = 11; });
    writeGrid(path, good);
    const auto size = std::filesystem::file_size(path);
    for (const auto left : {size - 1, size / 2, size / 10, std::uintmax_t{8}}) {
      std::filesystem::resize_file(path, left);
      refused(path, "cut short");
    }
    writeSeries(path, {}, 100201, "mg l-1", 3);
    refused(path, "a time series");
  }

  TemporaryFolder folder;
  Model model;
  CGlobalKvs& root = model.root;
  Start& start = *(root.*member);
  std::string path = folder.file("hot.tsb2");
};

}  // namespace gridbay::test

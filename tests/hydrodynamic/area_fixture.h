#pragma once

#include <gtest/gtest.h>

#include <string>
#include <vector>

#include "basic/bathymetry.h"
#include "basic/simulation_period.h"
#include "hydrodynamic/eddy_viscosity.h"
#include "hydrodynamic/resistance.h"
#include "hydrodynamic/surface_elevation.h"
#include "hydrodynamic/wave_radiation.h"
#include "hydrodynamic/wind_conditions.h"
#include "tests/support/grids.h"
#include "tests/support/model.h"
#include "tests/support/temporary_folder.h"

namespace gridbay::test {

// A model with two areas of 10 x 8 points of 30 m and 7 x 4 points of 10 m, which runs for 3000 s.
class AreaTest : public ::testing::Test {
 protected:
  AreaTest() {
    root().bathymetry->SetNoAreas(2);
    setGrid(1, 10, 8, 30);
    setGrid(2, 7, 4, 10);
  }
  CGlobalKvs& root() { return model.root; }
  void setGrid(int number, int noJ, int noK, float spacing) {
    CBathymetryObjectKvs& area = root().bathymetry->at(number);
    area.noJ = noJ;
    area.noK = noK;
    area.dx = area.dy = spacing;
  }

  // The texts of an object's check, which all lead to one page and are ordinary faults.
  std::vector<std::string> faultsOf(CKvsBase& object, PageId page, int deep = 1) {
    ValidationList messages;
    const unsigned faults = object.Validate(messages, deep);
    EXPECT_EQ(faults, messages.size());
    for (const CMessage& message : messages) {
      EXPECT_EQ(message.page, page) << message.text;
      EXPECT_EQ(message.severity, Severity::fault) << message.text;
    }
    return textsOf(messages);
  }
  static std::string notValid(const std::string& name) {
    return "Data file  \" " + name + "\"  is not valid";
  }

  // A data file of zeros over `seconds` from the start of the simulation, with the items in their order.
  struct Spec {
    std::vector<TsbItem> items;
    std::vector<TsbGridAxis> axes = {{10, 0, 30, "m"}, {8, 0, 30, "m"}};
    int dataType = 0;
    double seconds = 3000;
  };
  std::string write(const std::string& name, const Spec& spec) {
    TsbDefinition definition;
    definition.dataType = spec.dataType;
    definition.time.step = spec.seconds;
    definition.time.count = 2;
    definition.axes = spec.axes;
    definition.items = spec.items;
    const std::string path = folder.file(name);
    writeFile(path, definition);
    return path;
  }
  // Of area 2.
  static std::vector<TsbGridAxis> innerAxes() { return {{7, 0, 10, "m"}, {4, 0, 10, "m"}}; }

  TemporaryFolder folder;
  Model model;
};

}  // namespace gridbay::test

#include "basic/simulation_period.h"

#include <gtest/gtest.h>

#include <limits>

#include "basic/bathymetry.h"
#include "tests/support/grids.h"
#include "tests/support/model.h"
#include "tests/support/temporary_folder.h"

namespace gridbay {
namespace basic_simulation_period_test {

using test::load;
using test::messagesOf;
using test::Model;
using test::savedText;
using test::textsOf;

TEST(SimulationPeriod, DefaultsInFileOrder) {
  CSimulationPeriodKvs period(nullptr);
  EXPECT_EQ(
      savedText(period),
      "SIMULATION_PERIOD {\n    Number_Of_Timesteps 100\n    Time_Step_Interval 30.0\n    Warm_Up_Period 0\n"
      "    Start_Time 1990 1 1 12 0 0\n}\n");
}

TEST(SimulationPeriod, StepsOnFileAreOneLess) {
  CSimulationPeriodKvs period(nullptr);
  load(period,
       "SIMULATION_PERIOD { Number_Of_Timesteps 450; Time_Step_Interval 0.05; Warm_Up_Period 3\n"
       " Start_Time 1993 7 12 13 17 0 }");
  EXPECT_EQ(period.noPointsInTime, 451);
  EXPECT_EQ(period.timeStepInterval, 0.05F);
  EXPECT_EQ(period.warmUpPeriod, 3);
  EXPECT_EQ(dateTimeText(period.start), "1993-07-12 13:17:00");
  CSimulationPeriodKvs copy(nullptr);
  copy.CopyFrom(period);
  EXPECT_EQ(savedText(copy), savedText(period));
}

TEST(SimulationPeriod, AMissingNumberOfStepsStillCountsOneMore) {
  CSimulationPeriodKvs period(nullptr);
  load(period, "SIMULATION_PERIOD { Warm_Up_Period 1 }");
  EXPECT_EQ(period.noPointsInTime, 102);
  EXPECT_EQ(period.timeStepInterval, 30.0F);
  load(period, "OTHER {}");
  EXPECT_EQ(period.noPointsInTime, 102);
}

TEST(SimulationPeriod, ExtremeNumbersOfStepsDoNotWrap) {
  CSimulationPeriodKvs period(nullptr);
  load(period, "SIMULATION_PERIOD { Number_Of_Timesteps 2147483647 }");
  EXPECT_EQ(period.noPointsInTime, std::numeric_limits<std::int32_t>::max());
  period.noPointsInTime = std::numeric_limits<std::int32_t>::min();
  EXPECT_NE(savedText(period).find("Number_Of_Timesteps -2147483648"), std::string::npos);
}

TEST(SimulationPeriod, AnInvalidDateIsSixTimesMinusOne) {
  CSimulationPeriodKvs period(nullptr);
  period.start = DateTime::invalid();
  EXPECT_NE(savedText(period).find("Start_Time -1 -1 -1 -1 -1 -1\n"), std::string::npos);
  load(period, "SIMULATION_PERIOD { Start_Time 1990 2 31 0 0 0 }");
  EXPECT_EQ(period.start.status, 1);
  load(period, "SIMULATION_PERIOD { Start_Time 1990 2 28 0 0 0 }");
  EXPECT_EQ(period.start.status, 0);
}

class SimulationPeriodChecks : public ::testing::Test {
 protected:
  std::vector<std::string> faults() {
    const ValidationList messages = messagesOf(period);
    for (const CMessage& message : messages) {
      EXPECT_EQ(message.page, PageId::simulationPeriod);
      EXPECT_EQ(message.severity, Severity::fault);
    }
    return textsOf(messages);
  }
  Model model;
  CSimulationPeriodKvs& period = *model.root.simulationPeriod;
};

TEST_F(SimulationPeriodChecks, TimeStep) {
  period.timeStepInterval = 0.01F;
  EXPECT_EQ(faults(), std::vector<std::string>{});
  period.timeStepInterval = 0.0099F;
  EXPECT_EQ(faults(), std::vector<std::string>{"Time step interval must be at least 0.01"});
}

TEST_F(SimulationPeriodChecks, NumberOfSteps) {
  load(period, "SIMULATION_PERIOD { Number_Of_Timesteps -1 }");
  EXPECT_EQ(period.noPointsInTime, 0);
  EXPECT_EQ(faults(), std::vector<std::string>{});
  load(period, "SIMULATION_PERIOD { Number_Of_Timesteps -2 }");
  EXPECT_EQ(faults(), std::vector<std::string>{"Number of time steps can not be negative"});
}

TEST_F(SimulationPeriodChecks, WarmUp) {
  period.warmUpPeriod = 1000;
  EXPECT_EQ(faults(), std::vector<std::string>{});
  model.root.bathymetry->hotStart = 1;
  EXPECT_EQ(faults(), std::vector<std::string>{"Warm up period exceeds the simulation period"});
  period.warmUpPeriod = 101;
  EXPECT_EQ(faults(), std::vector<std::string>{});
  period.warmUpPeriod = 102;
  EXPECT_EQ(faults(), std::vector<std::string>{"Warm up period exceeds the simulation period"});
  period.warmUpPeriod = -1;
  EXPECT_EQ(faults(), std::vector<std::string>{"Warm-up period can not be negative"});
}

TEST_F(SimulationPeriodChecks, AllInTheirOrder) {
  model.root.bathymetry->hotStart = 1;
  period.timeStepInterval = 0;
  period.noPointsInTime = -5;
  period.warmUpPeriod = -1;
  EXPECT_EQ(faults(),
            (std::vector<std::string>{
                "Time step interval must be at least 0.01", "Number of time steps can not be negative",
                "Warm-up period can not be negative", "Warm up period exceeds the simulation period"}));
}

TEST(SimulationPeriod, RequiresFilesToCoverIt) {
  const test::TemporaryFolder folder;
  CSimulationPeriodKvs period(nullptr);  // 100 steps of 30 s from 1990-01-01 12:00
  EXPECT_EQ(dateTimeText(period.End()), "1990-01-01 12:50:00");
  const auto errorFor = [&](TsbTimeAxis time) {
    test::writeSeries(folder.file("s.tsb0"), time, 100000, "m");
    CVdFileSelectorDlg selector;
    period.SetRequestPeriod(selector);
    std::string error;
    selector.IsTsbFileValid(folder.file("s.tsb0"), &error);
    return error;
  };
  TsbTimeAxis time;
  time.start = {1990, 1, 1, 12, 0, 0};
  time.step = 3000;
  time.count = 2;
  EXPECT_EQ(errorFor(time), "");
  time.step = 2999;
  EXPECT_EQ(errorFor(time),
            "The file covers 1990-01-01 12:00:00 to 1990-01-01 12:49:59; the simulation needs 1990-01-01 "
            "12:00:00 to "
            "1990-01-01 12:50:00");
  time.start = {1990, 1, 1, 12, 0, 1};
  time.step = 3000;
  EXPECT_NE(errorFor(time), "");
  time.type = TsbTimeAxisType::relativeEquidistant;
  EXPECT_EQ(errorFor(time), "");
  time.unit = "m";
  EXPECT_EQ(errorFor(time), "");
}

}  // namespace basic_simulation_period_test
}  // namespace gridbay

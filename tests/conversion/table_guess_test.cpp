#include "conversion/table_guess.h"

#include <gmock/gmock.h>

#include <cmath>

#include "conversion/series_table.h"
#include "conversion/table_headings.h"
#include "conversion/table_text.h"
#include "core/date_time.h"
#include "platform/units/units.h"

namespace gridbay {
namespace conversion_table_guess_test {

using Role = TableColumn::Role;
using ::testing::ElementsAre;
using ::testing::HasSubstr;
using ::testing::IsEmpty;

// The moments, values and faults that a form reads from a table, in a few letters.
std::string momentOf(const SeriesTable& table, std::size_t step) {
  const double seconds = CVdUnitConverter(table.timeUnit, "s").Convert(table.times.at(step));
  return dateTimeText(DateTime::of(table.start).plusDays(seconds / 86400));
}

struct Case {
  const char* name;
  std::string text;
  char separator;
  bool decimalComma;
  int headerLines;
  const char* second;                // the moment of the second row
  std::vector<double> values;        // of the second row
  std::vector<std::string> columns;  // names of the items
  std::size_t doubts;
};

TEST(TableGuess, RecognisesManyForms) {
  const std::vector<Case> cases{
      {"ISO",
       "Time,Q [m3/s]\n2020-01-01 00:00,1.5\n2020-01-01 01:00,2.5\n",
       ',',
       false,
       1,
       "2020-01-01 01:00:00",
       {2.5},
       {"Q"},
       0},
      {"ISO with T and Z",
       "time,wl\n2020-01-01T00:00:00Z,1\n2020-01-01T00:10:00Z,2\n",
       ',',
       false,
       1,
       "2020-01-01 00:10:00",
       {2},
       {"wl"},
       0},
      {"tabs below a heading of blanks",
       "date     water surface(m)\n2020-01-01\t1\n2020-01-02\t2.5\n",
       '\t',
       false,
       1,
       "2020-01-02 00:00:00",
       {2.5},
       {"water surface"},
       0},
      {"semicolons and commas",
       "Datum;Pegel (m);Q (m³/s)\n01.02.2020 00:00;1,25;10,5\n01.02.2020 06:00;1,5;11\n",
       ';',
       true,
       1,
       "2020-02-01 06:00:00",
       {1.5, 11},
       {"Pegel", "Q"},
       0},
      {"a spreadsheet that is pasted",
       "Date\tLevel\r\n13/01/2020\t1.5\r\n14/01/2020\t1.75\r\n",
       '\t',
       false,
       1,
       "2020-01-14 00:00:00",
       {1.75},
       {"Level"},
       0},
      {"month first by a value above 12",
       "1/30/2020 1:00 PM,1\n1/31/2020 1:00 PM,2\n",
       ',',
       false,
       0,
       "2020-01-31 13:00:00",
       {2},
       {"Column 2"},
       0},
      {"month first as only so it rises",
       "1/11/2020,1\n1/12/2020,2\n2/1/2020,3\n2/2/2020,4\n",
       ',',
       false,
       0,
       "2020-01-12 00:00:00",
       {2},
       {"Column 2"},
       0},
      {"an order that nothing tells",
       "date,Q\n1/2/2020,1\n2/2/2020,2\n",
       ',',
       false,
       1,
       "2020-02-02 00:00:00",
       {2},
       {"Q"},
       1},
      {"names of months",
       "01-Jan-2020 00:00,1\n01-Feb-2020 00:00,2\n",
       ',',
       false,
       0,
       "2020-02-01 00:00:00",
       {2},
       {"Column 2"},
       0},
      {"date and time in two columns",
       "date;time;Q\n31.12.2019;23:30;1\n01.01.2020;00:00:30;2\n",
       ';',
       false,
       1,
       "2020-01-01 00:00:30",
       {2},
       {"Q"},
       0},
      {"between blanks",
       "# gauge 7\n# date      time    stage\n2020-01-01  06:00   1.5\n2020-01-01  07:00  -1.5\n",
       ' ',
       false,
       2,
       "2020-01-01 07:00:00",
       {-1.5},
       {"stage"},
       0},
      {"dates without separators",
       "t,q\n202001010000,1\n202001010030,2\n",
       ',',
       false,
       1,
       "2020-01-01 00:30:00",
       {2},
       {"q"},
       0},
      {"days of a spreadsheet",
       "Time,Q\n43831,1\n43831.0416667,2\n43831.0833333,3\n",
       ',',
       false,
       1,
       "2020-01-01 01:00:00",
       {2},
       {"Q"},
       1},
      {"units on a line of their own",
       "Time;Flow;Stage\nyyyy-mm-dd;m3/s;cm\n2020-01-01;1;100\n2020-01-02;2;200\n",
       ';',
       false,
       2,
       "2020-01-02 00:00:00",
       {2, 200},
       {"Flow", "Stage"},
       0},
      {"missing values",
       "t,Q\n2020-01-01,-9999\n2020-01-02,\n2020-01-03,NaN\n2020-01-04,5\n",
       ',',
       false,
       1,
       "2020-01-02 00:00:00",
       {NAN},
       {"Q"},
       1},
      {"quotes and a byte order mark",
       "\xef\xbb\xbf\"Time\",\"Level, m\"\n\"2020-01-01\",\"1.5\"\n\"2020-01-02\",\"2\"\n",
       ',',
       false,
       1,
       "2020-01-02 00:00:00",
       {2},
       {"Level, m"},
       0},
      {"Latin-1",
       "Zeit;Abflu\xdf [m\xb3/s]\n2020-01-01;1\n2020-01-02;2\n",
       ';',
       false,
       1,
       "2020-01-02 00:00:00",
       {2},
       {"Abfluß"},
       0},
      {"midnight as 24:00",
       "31.12.2020 12:00;1\n31.12.2020 24:00;2\n",
       ';',
       false,
       0,
       "2021-01-01 00:00:00",
       {2},
       {"Column 2"},
       0},
      {"flags are left out",
       "t,Q,flag\n2020-01-01,1,good\n2020-01-02,2,bad\n",
       ',',
       false,
       1,
       "2020-01-02 00:00:00",
       {2},
       {"Q"},
       0},
      {"an offset from UTC",
       "2020-01-01T00:00+02:00;1\n2020-01-01T00:10+02:00;2\n",
       ';',
       false,
       0,
       "2020-01-01 00:10:00",
       {2},
       {"Column 2"},
       1},
      {"thousands perhaps",
       "2020-01-01;1,250\n2020-01-02;2,500\n",
       ';',
       true,
       0,
       "2020-01-02 00:00:00",
       {2.5},
       {"Column 2"},
       1},
  };
  for (const Case& it : cases) {
    SCOPED_TRACE(it.name);
    const Result<std::string> text = tableText(it.text);
    ASSERT_TRUE(text);
    const auto [form, doubts, missingDoubts, dateDoubt] = guessTable(*text);
    EXPECT_EQ(form.separator, it.separator);
    EXPECT_EQ(form.decimalComma, it.decimalComma);
    EXPECT_EQ(form.headerLines, it.headerLines);
    EXPECT_EQ(doubts.size() + missingDoubts.size() + (dateDoubt.empty() ? 0U : 1U), it.doubts)
        << ::testing::PrintToString(doubts) << dateDoubt;
    const Result<SeriesTable> table = readSeriesTable(*text, form);
    ASSERT_TRUE(table) << table.error();
    EXPECT_EQ(table->faultCount, 0U) << table->faults.front().why;
    ASSERT_GT(table->times.size(), 1U);
    EXPECT_EQ(momentOf(*table, 1), it.second);
    ASSERT_EQ(table->items.size(), it.columns.size());
    for (std::size_t i = 0; i < table->items.size(); ++i) {
      EXPECT_EQ(table->items[i].name, it.columns[i]);
      const double value = table->values[i].at(1);
      EXPECT_TRUE(value == it.values[i] || (std::isnan(value) && std::isnan(it.values[i]))) << value;
    }
  }
}

TEST(TableGuess, TimesThatAreNumbersNeedAStart) {
  for (const auto& [heading, unit] : std::vector<std::pair<std::string, std::string>>{
           {"time [h]", "h"}, {"Minutes", "min"}, {"t (sec)", "s"}, {"days", "d"}}) {
    auto [form, doubts, missingDoubts, dateDoubt] = guessTable(heading + ",Q\n0,1\n1,2\n2,4\n");
    EXPECT_EQ(form.columns[0].role, Role::time) << heading;
    EXPECT_EQ(form.timeUnit, unit) << heading;
    EXPECT_THAT(doubts, ElementsAre("The table does not tell the moment of time 0"));
    EXPECT_EQ(dateDoubt, "");
    EXPECT_EQ(faultOf(form), "\"\" is no moment of the form YYYY-MM-DD hh:mm:ss");
    form.start = "2020-01-01 00:00:00";
    EXPECT_EQ(faultOf(form), "");
  }
  EXPECT_THAT(guessTable("t,Q\n0,1\n600,2\n").doubts,
              ElementsAre(HasSubstr("does not tell the unit of \"t\": seconds are meant"),
                          HasSubstr("does not tell the moment of time 0")));
}

TEST(TableGuess, WhatIsAmbiguousIsSaid) {
  EXPECT_EQ(guessTable("d,Q\n1/2/2020,1\n2/2/2020,2\n").dateOrderDoubt,
            "Dates such as \"1/2/2020\" may be day/month/year or month/day/year: the first is meant");
  const TableGuess guess = guessTable("d,Q\n20-01-01,1\n20-01-02,2\n20-01-03,3\n");
  EXPECT_EQ(guess.form.dateOrder, DateOrder::yearMonthDay);
  EXPECT_EQ(guess.dateOrderDoubt,
            "Dates such as \"20-01-01\" may have the year first or last: the first is meant");
  EXPECT_EQ(guessTable("d,Q\n01-02-20,1\n02-02-20,2\n").form.dateOrder, DateOrder::dayMonthYear);
  EXPECT_THAT(guessTable("d;Q\n2020-01-01;1,250\n2020-01-02;2,500\n").doubts,
              ElementsAre("The comma in \"1,250\" may part thousands; it is taken for the decimal one"));
  EXPECT_THAT(guessTable("d,Q\n2020-01-01,-9999\n2020-01-02,-9999\n2020-01-03,1\n").missingDoubts,
              ElementsAre("-9999 stands 2 times for a value: it is taken for a missing one"));
  EXPECT_THAT(guessTable("d,Q [furlongs?]\n2020-01-01,1\n2020-01-02,2\n").doubts,
              ElementsAre("\"furlongs?\" of \"Q\" is no unit that is known"));
  EXPECT_THAT(guessTable("a,b\n3,1\n2,2\n").doubts,
              ElementsAre("No column of times was found: say which one holds them"));
  EXPECT_THAT(guessTable("t,Q\n43831,1\n43832,2\n").doubts,
              ElementsAre("\"t\" is taken for days since 1899-12-30, as spreadsheets count"));
}

TEST(TableNumber, PointsBetweenThousands) {
  EXPECT_EQ(tableNumber("1.150", true), 1150);
  EXPECT_EQ(tableNumber("-12.345.678", true), -12345678);
  EXPECT_EQ(tableNumber("1.050,5", true), 1050.5);
  EXPECT_EQ(tableNumber("0.150", true), 0.15);
  EXPECT_EQ(tableNumber("1.15", true), 1.15);
  EXPECT_EQ(tableNumber("1.150", false), 1.15);
}

TEST(TableGuess, WhatIsKnownBeforeIsKept) {
  const std::string text = "a;b\n1;2020-01-01,5\n2;2020-01-02,6\n";
  EXPECT_EQ(guessTable(text).form.separator, ';');
  const TableForm form = guessTable(text, ',', 1).form;
  EXPECT_EQ(form.separator, ',');
  EXPECT_EQ(guessTable("2020-01-01,1\n2020-01-02,2\n2020-01-03,3\n", 0, 2).form.headerLines, 2);
}

TEST(TableGuess, NoTables) {
  for (const char* text :
       {"", "\n\n", "one line of words\nand another\n", "1\n2\n3\n", "{\"a\": 1}", "a,b\nc,d\n"}) {
    EXPECT_THAT(guessTable(text).form.columns, IsEmpty()) << text;
    EXPECT_EQ(faultOf(guessTable(text).form), "A table of times and values is expected, line by line");
  }
  // Bytes of anything, and many fields.
  std::string bytes;
  for (int i = 0; i < 5000; ++i) bytes += static_cast<char>(i * 7919 % 251);
  guessTable(bytes);
  guessTable(std::string(100'000, ','));
  guessTable(std::string(100'000, '"'));
}

TEST(TableGuess, LinesThatDoNotReadAreToldAndLeftOut) {
  const std::string text =
      "t,Q\n2020-01-01,1\n2020-01-02,x\n2020-01-03\n2020-13-01,2\n2020-01-01,3\n2020-01-05,4\n";
  const Result<SeriesTable> table = readSeriesTable(text, guessTable(text).form);
  ASSERT_TRUE(table);
  EXPECT_THAT(table->values.at(0), ElementsAre(1, 4));
  std::vector<std::string> faults;
  for (const TableFault& fault : table->faults)
    faults.push_back(std::to_string(fault.line) + ": " + fault.why);
  EXPECT_THAT(faults, ElementsAre("3: \"x\" is no number", "4: 1 fields, where the lines before have 2",
                                  "5: \"2020-13-01\" is no date", "6: the time does not rise"));
  EXPECT_EQ(table->faultCount, 4U);
}

TEST(TableForm, WhatItLacks) {
  const auto formOf = [](std::vector<Role> roles) {
    TableForm form;
    for (const Role role : roles) form.columns.push_back({.role = role, .name = {}, .unit = {}});
    return form;
  };
  EXPECT_EQ(faultOf(formOf({Role::item, Role::item})), "There is no column of times");
  EXPECT_EQ(faultOf(formOf({Role::date, Role::dayNumber, Role::item})),
            "There is more than one column of times");
  EXPECT_EQ(faultOf(formOf({Role::date, Role::clock, Role::clock, Role::item})),
            "There is more than one column of times");
  EXPECT_EQ(faultOf(formOf({Role::dayNumber, Role::clock, Role::item})),
            "There is no date for the time of day");
  EXPECT_EQ(faultOf(formOf({Role::date, Role::leftOut})), "There is no column of values");
  TableForm form = formOf({Role::time, Role::item});
  form.start = "2020-01-01";
  form.timeUnit = "m";
  EXPECT_EQ(faultOf(form), "\"m\" is no unit of time (s, min, h, d)");
}

TEST(TableHeadings, UnitsAndItemTypes) {
  for (const auto& [text, unit] : std::vector<std::pair<std::string, std::string>>{{"m³/s", "m3/s"},
                                                                                   {"cumecs", "m3/s"},
                                                                                   {"mm/hr", "mm/h"},
                                                                                   {"°C", "degC"},
                                                                                   {"m", "m"},
                                                                                   {"-", ""},
                                                                                   {"", ""},
                                                                                   {"furlongs?", ""}})
    EXPECT_EQ(unitOfHeading(text), unit) << text;
  for (const auto& [name, unit, type] :
       std::vector<std::tuple<std::string, std::string, int>>{{"Water level", "m", item::kWaterLevel},
                                                              {"gauge 7 stage", "cm", item::kWaterLevel},
                                                              {"Q_in", "", item::kDischarge},
                                                              {"Station 12", "m3/s", item::kDischarge},
                                                              {"flow", "m", item::kWaterLevel},
                                                              {"Rainfall", "mm/h", item::kPrecipitationRate},
                                                              {"Wind speed", "m/s", item::kWindSpeed},
                                                              {"Manning number", "", item::kManningNumber},
                                                              {"Something", "", 0},
                                                              {"Q", "degC", item::kTemperature}})
    EXPECT_EQ(itemTypeOfHeading(name, unit), type) << name << " " << unit;
}

}  // namespace conversion_table_guess_test
}  // namespace gridbay

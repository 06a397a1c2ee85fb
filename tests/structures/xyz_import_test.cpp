#include "structures/xyz_import.h"

#include <gmock/gmock.h>
#include <sys/resource.h>
#include <unistd.h>

#include <cmath>
#include <cstdio>
#include <filesystem>
#include <fstream>

#include "platform/files/line_reader.h"
#include "tests/support/pages.h"
#include "tests/support/temporary_folder.h"

namespace gridbay {

static bool operator==(const DikePoint& a, const DikePoint& b) {
  return a.x == b.x && a.y == b.y && a.z == b.z;
}
static void PrintTo(const DikePoint& point, std::ostream* out) {
  *out << point.x << ' ' << point.y << ' ' << point.z;
}

namespace structures_xyz_import_test {

using Points = std::vector<DikePoint>;

Points listOf(const SharedArray<DikePoint>& points) {
  Points list;
  for (std::size_t i = 0; i < points.size(); ++i) list.push_back(points[i]);
  return list;
}

class XyzImport : public ::testing::Test {
 protected:
  XyzOutcome import(std::string_view text, const XyzScales& scales = {}) {
    return importXyz(folder.write("a.xyz", text), scales, points);
  }
  // The points of a text that is a legal one.
  Points pointsOf(std::string_view text, const XyzScales& scales = {}) {
    points.clear();
    EXPECT_EQ(import(text, scales), XyzOutcome::success) << text;
    return listOf(points);
  }
  // An illegal text leaves the points as they are.
  bool isIllegal(std::string_view text) {
    points.clear();
    points.push_back({1, 2, 3});
    const bool illegal = import(text) == XyzOutcome::illegal;
    return illegal && listOf(points) == Points{{1, 2, 3}};
  }

  test::TemporaryFolder folder;
  SharedArray<DikePoint> points;
};

TEST_F(XyzImport, ALineIsAPoint) {
  EXPECT_EQ(pointsOf("1.5 2.5 3.5\n-4 +5 6e2\n"), (Points{{1.5, 2.5, 3.5}, {-4, 5, 600}}));
  EXPECT_EQ(pointsOf("1 2 3"), (Points{{1, 2, 3}}));
  EXPECT_EQ(pointsOf(" \t 1\t2 \v\f 3  \n"), (Points{{1, 2, 3}}));
  EXPECT_EQ(pointsOf(".5 5. 1.e1\n"), (Points{{0.5, 5, 10}}));
  EXPECT_EQ(pointsOf(""), Points{});
}

TEST_F(XyzImport, WithTwoNumbersTheLevelIsZero) {
  EXPECT_EQ(pointsOf("1 2\n3 4 \n"), (Points{{1, 2, 0}, {3, 4, 0}}));
  EXPECT_EQ(pointsOf("1 2 crest\n"), (Points{{1, 2, 0}}));
  EXPECT_EQ(pointsOf("1 2,3\n"), (Points{{1, 2, 0}}));
}

TEST_F(XyzImport, TheTextBehindIsDropped) {
  EXPECT_EQ(pointsOf("1 2 3 gate 4 5\n6 7 8x\n"), (Points{{1, 2, 3}, {6, 7, 8}}));
}

TEST_F(XyzImport, WithOneNumberTheFileIsIllegal) {
  EXPECT_TRUE(isIllegal("1\n"));
  EXPECT_TRUE(isIllegal("1 2 3\n4\n5 6 7\n"));
  EXPECT_TRUE(isIllegal("1\n2\n3\n"));
  EXPECT_TRUE(isIllegal("1 2 3\n4"));
}

TEST_F(XyzImport, ABlankLineIsIllegalAlsoAtTheEnd) {
  EXPECT_TRUE(isIllegal("\n"));
  EXPECT_TRUE(isIllegal("1 2 3\n\n"));
  EXPECT_TRUE(isIllegal("1 2 3\n  "));
  EXPECT_TRUE(isIllegal("1 2 3\n\n4 5 6\n"));
}

TEST_F(XyzImport, OtherTextsAreIllegal) {
  EXPECT_TRUE(isIllegal("1,2,3\n"));
  EXPECT_TRUE(isIllegal("1,5 2,5 3,5\n"));
  EXPECT_TRUE(isIllegal("1;2;3\n"));
  EXPECT_TRUE(isIllegal("x y z\n1 2 3\n"));
  EXPECT_TRUE(isIllegal("# points\n1 2 3\n"));
  EXPECT_TRUE(isIllegal("+-1 2 3\n"));
  EXPECT_TRUE(isIllegal("--1 2 3\n"));
  EXPECT_TRUE(isIllegal("+ 1 2 3\n"));
  EXPECT_TRUE(
      isIllegal("\xEF\xBB\xBF"
                "1 2 3\n"));
  EXPECT_TRUE(isIllegal(std::string_view("\x89HDF\r\n\x1A\n\0\0\0\0", 12)));
  EXPECT_TRUE(isIllegal(std::string_view("1\0 2 3\n", 7)));
  EXPECT_TRUE(isIllegal(std::string(5000, '\0')));
}

TEST_F(XyzImport, LinesOfOtherSystems) {
  EXPECT_EQ(pointsOf("1 2 3\r\n4 5\r\n"), (Points{{1, 2, 3}, {4, 5, 0}}));
  EXPECT_TRUE(isIllegal("1 2 3\r\n\r\n"));
  // A carriage return alone is white space and ends no line.
  EXPECT_EQ(pointsOf("1 2 3\r4 5 6\r"), (Points{{1, 2, 3}}));
}

// What scanf takes for a number is one here.
TEST_F(XyzImport, NumbersAreThoseOfScanf) {
  const std::vector<std::string> texts{
      "1",   "-0",  "1e3",      "1E+3", "1e-3",  "0x10",   "-0x1.8p1", "0X.8P4",   "inf",       "-INF",
      "nan", "NaN", "infinity", "-nan", "1e400", "-1e400", "1e-400",   "0x1p2000", "0x1p-2000", "00012.50"};
  for (const std::string& text : texts) {
    const std::string line = text + " " + text + " " + text + " behind";
    double expected = 0;
    ASSERT_EQ(std::sscanf(line.c_str(), "%lf", &expected), 1) << text;
    const Points read = pointsOf(line);
    ASSERT_EQ(read.size(), 1U) << text;
    for (const double value : {read[0].x, read[0].y, read[0].z}) {
      if (std::isnan(expected)) {
        EXPECT_TRUE(std::isnan(value)) << text;
      } else {
        EXPECT_EQ(value, expected) << text;
      }
    }
  }
  for (const std::string text : {"0x", "0xg", "0xinf", "e5", ".", "-", "in", "na"}) {
    double none = 0;
    ASSERT_LT(std::sscanf((text + " 2 3").c_str(), "%lf", &none), 1) << text;
    EXPECT_TRUE(isIllegal(text + " 2 3\n")) << text;
  }
}

TEST_F(XyzImport, AFileThatIsCutShortEndsInWhatIsLeft) {
  EXPECT_EQ(pointsOf("1 2 3\n4 5"), (Points{{1, 2, 3}, {4, 5, 0}}));
  EXPECT_TRUE(isIllegal("1 2 3\n4 "));
}

TEST_F(XyzImport, VeryLongLines) {
  const std::string blanks(LineReader::kLongestLine, ' ');
  EXPECT_EQ(pointsOf("1 2 3 " + blanks + "x\n4 5 6\n"), (Points{{1, 2, 3}, {4, 5, 6}}));
  EXPECT_EQ(pointsOf("1 2 3 " + std::string(5'000'000, 'x') + "\n4 5 6 " + std::string(3'000'000, '9')),
            (Points{{1, 2, 3}, {4, 5, 6}}));
  // Whether a third number comes is not seen.
  EXPECT_TRUE(isIllegal("1 2" + blanks + "3\n"));
  EXPECT_TRUE(isIllegal(blanks + "1 2 3\n"));
  EXPECT_TRUE(isIllegal("1 2 " + std::string(2 * LineReader::kLongestLine, '3')));
  EXPECT_TRUE(isIllegal(std::string(3'000'000, '1')));
}

TEST_F(XyzImport, ValuesAreScaled) {
  EXPECT_EQ(pointsOf("1 2 3\n4 5\n", {{10, 1}, {2, 0.5}}), (Points{{11, 21, 6.5}, {41, 51, 0.5}}));
}

TEST_F(XyzImport, ScalesGoFromTheUnitsOfTheFileToTheBaseUnits) {
  constexpr int kKilometre = 1001;
  constexpr int kMillimetre = 1003;
  constexpr int kFoot = 1010;
  EXPECT_EQ(pointsOf("1.5 2 3\n", xyzScales(unit::kMetre, unit::kMetre)), (Points{{1.5, 2, 3}}));
  EXPECT_EQ(pointsOf("1.5 2 3\n", xyzScales(kKilometre, kFoot)), (Points{{1500, 2000, 3 * 0.3048}}));
  EXPECT_DOUBLE_EQ(pointsOf("1 2 2500\n", xyzScales(kFoot, kMillimetre))[0].z, 2.5);
  EXPECT_DOUBLE_EQ(points[0].y, 0.6096);
}

TEST_F(XyzImport, AppendsToWhatIsThere) {
  ASSERT_EQ(import("1 2 3\n4 5 6\n"), XyzOutcome::success);
  ASSERT_EQ(import("1 2 3\n4 5 6\n"), XyzOutcome::success);
  EXPECT_EQ(listOf(points), (Points{{1, 2, 3}, {4, 5, 6}, {1, 2, 3}, {4, 5, 6}}));
}

TEST_F(XyzImport, AFileThatCannotBeOpenedIsASuccessWithNoPoints) {
  points.push_back({1, 2, 3});
  EXPECT_EQ(importXyz(folder.file("none.xyz"), {}, points), XyzOutcome::success);
  EXPECT_EQ(importXyz("", {}, points), XyzOutcome::success);
  EXPECT_EQ(importXyz(folder.path().string(), {}, points), XyzOutcome::success);
  const std::string closed = folder.write("closed.xyz", "4 5 6\n");
  std::filesystem::permissions(closed, std::filesystem::perms::none);
  if (::geteuid() != 0) {
    EXPECT_EQ(importXyz(closed, {}, points), XyzOutcome::success);
  }
  EXPECT_EQ(listOf(points), (Points{{1, 2, 3}}));
}

TEST_F(XyzImport, CanBeStopped) {
  std::string text;
  while (text.size() < 3 * LineReader::kLongestLine) text += "100000.25 200000.5 3.125\n";
  const std::string path = folder.write("a.xyz", text);
  points.push_back({1, 2, 3});
  std::vector<double> done;
  EXPECT_EQ(importXyz(path, {}, points,
                      [&done](double part) {
                        done.push_back(part);
                        return part < 0.5;
                      }),
            XyzOutcome::stopped);
  EXPECT_EQ(listOf(points), (Points{{1, 2, 3}}));
  EXPECT_EQ(done.size(), 2U);
  EXPECT_EQ(importXyz(path, {}, points, [](double) { return true; }), XyzOutcome::success);
  EXPECT_EQ(points.size(), 1 + text.size() / 25);
}

// A gigabyte in which there is no line end, on disk only as its size: next to nothing of it is in memory.
TEST_F(XyzImport, AHugeFileWithNoLinesTakesNoMemory) {
  const auto peak = [] {
    std::ifstream status("/proc/self/status");
    for (std::string word; status >> word;) {
      long kilobytes = 0;
      if (word == "VmHWM:" && status >> kilobytes) return kilobytes;
    }
    return 0L;
  };
  const std::string path = folder.write("a.xyz", "1 2 3 ");
  std::filesystem::resize_file(path, 1'000'000'000);
  std::ofstream("/proc/self/clear_refs") << "5";
  const long before = peak();
  EXPECT_EQ(importXyz(path, {}, points), XyzOutcome::success);
  EXPECT_EQ(listOf(points), (Points{{1, 2, 3}}));
  EXPECT_LT(peak() - before, 50'000);
}

class XyzPanel : public ::testing::Test {
 protected:
  test::TestHost host;
  UnitChoices units;
};

TEST_F(XyzPanel, ListsTheUnitsWithThoseOfTheUser) {
  constexpr int kKilometre = 1001;
  units.choose(item::kGeographicalCoordinate, kKilometre);
  units.choose(item::kBathymetry, 1010);
  CXyzGeoConvertDlg dialog(units);
  host.chosenFile = "/data/a.xyz";
  host.fillForm = [](Form& form) {
    EXPECT_EQ(form.controls().size(), 2U);
    const Control& xy = *form.find("Unit of X and Y:");
    const Control& z = *form.find("Unit of Z:");
    EXPECT_EQ(xy.choices, (std::vector<std::string>{"metre (m)", "kilometre (km)", "foot (ft)", "mile (mi)",
                                                    "US survey foot (ftUS)"}));
    EXPECT_EQ(z.choices,
              (std::vector<std::string>{"metre (m)", "kilometre (km)", "centimetre (cm)", "millimetre (mm)",
                                        "foot (ft)", "inch (in)", "yard (yd)", "US survey foot (ftUS)"}));
    EXPECT_EQ(xy.index, 1);
    EXPECT_EQ(z.index, 4);
    return true;
  };
  EXPECT_EQ(dialog.DoModal(host), 1);
  EXPECT_EQ(dialog.fileName(), "/data/a.xyz");
  EXPECT_EQ(dialog.scales().xy.factor, 1000);
  EXPECT_EQ(dialog.scales().z.factor, 0.3048);
  EXPECT_EQ(host.titles, std::vector<std::string>{"Select XYZ Import File"});
  EXPECT_EQ(host.filters, std::vector<std::string>{"Xyz files (*.xyz) |*.xyz|All Files (*.*) |*.*||"});
  EXPECT_EQ(host.extensions, std::vector<std::string>{"xyz"});
}

TEST_F(XyzPanel, AnotherUnitIsChosen) {
  CXyzGeoConvertDlg dialog(units);
  host.chosenFile = "/data/a.xyz";
  host.fillForm = [](Form& form) {
    EXPECT_EQ(form.find("Unit of Z:")->index, 0);
    form.find("Unit of Z:")->index = 3;
    form.act(*form.find("Unit of Z:"));
    return true;
  };
  EXPECT_EQ(dialog.DoModal(host), 1);
  EXPECT_EQ(dialog.scales().xy.factor, 1);
  EXPECT_EQ(dialog.scales().z.factor, 0.001);
  host.fillForm = [](Form&) { return false; };
  EXPECT_EQ(dialog.DoModal(host), 0);
}

}  // namespace structures_xyz_import_test
}  // namespace gridbay

#include "core/letters.h"

#include <gtest/gtest.h>

#include "setup/setup_doc.h"

namespace gridbay {
namespace core_letters_test {

TEST(Letters, AreNotCut) {
  const std::string_view text = "aäø€𝄞";  // of 1, 2, 2, 3 and 4 bytes
  constexpr std::size_t kExpected[] = {0, 1, 1, 3, 3, 5, 5, 5, 8, 8, 8, 8, 12, 12};
  for (std::size_t most = 0; most < std::size(kExpected); ++most)
    EXPECT_EQ(wholeLetters(text, most), kExpected[most]) << most;
}

TEST(Letters, BytesThatAreNoTextAreCutAnywhere) {
  EXPECT_EQ(wholeLetters("\x80\x80\x80\x80\x80\x80\x80\x80", 6), 6U);
  EXPECT_EQ(wholeLetters("ab\xC3", 2), 2U);
  EXPECT_EQ(wholeLetters("\xFF\xFF\xFF", 2), 2U);
  EXPECT_EQ(onLines("\x80\x80\x80", 2), "\x80\x80\n\x80");
}

TEST(Letters, LinesEndBehindASeparator) {
  EXPECT_EQ(onLines("", 10), "");
  EXPECT_EQ(onLines("grids/area.tsb2", 15), "grids/area.tsb2");
  EXPECT_EQ(onLines("estuary/grids/area.tsb2", 15), "estuary/grids/\narea.tsb2");
  EXPECT_EQ(onLines("a/bathymetryoftheinlet", 10), "a/bathymet\nryoftheinl\net");
  EXPECT_EQ(onLines("one two three four", 8), "one two \nthree \nfour");
}

TEST(Letters, ATipCutsNoLetter) {
  std::string path = "d:\\model\\";
  for (int i = 0; i < 150; ++i) path += "ø";
  const std::string tip = CV27SetupDoc::GetToolTipsString(path);
  std::string expected = "d:\\model\\";
  for (int i = 0; i < 91; ++i) expected += "ø";
  expected += "\n";
  for (int i = 0; i < 59; ++i) expected += "ø";
  EXPECT_EQ(tip, expected);
  EXPECT_EQ(CV27SetupDoc::GetToolTipsString(std::string(100, 'x')), std::string(100, 'x'));
  EXPECT_EQ(CV27SetupDoc::GetToolTipsString(std::string(101, 'x')), std::string(100, 'x') + "\nx");
}

}  // namespace core_letters_test
}  // namespace gridbay

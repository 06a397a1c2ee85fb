#include "platform/files/line_reader.h"

#include <gmock/gmock.h>
#include <sys/stat.h>

#include <fstream>

#include "tests/support/temporary_folder.h"

namespace gridbay {
namespace platform_line_reader_test {

using ::testing::HasSubstr;
using Lines = std::vector<std::string>;

class LineReaderTest : public ::testing::Test {
 protected:
  Lines linesOf(std::string_view text) {
    Result<LineReader> reader = LineReader::open(folder.write("a.txt", text));
    Lines lines;
    while (const std::optional<std::string_view> line = reader->next()) lines.emplace_back(*line);
    EXPECT_FALSE(reader->hasFailed());
    EXPECT_FALSE(reader->isStopped());
    EXPECT_EQ(reader->next(), std::nullopt);
    return lines;
  }
  test::TemporaryFolder folder;
};

TEST_F(LineReaderTest, GivesLinesWithNoLineFeed) {
  EXPECT_EQ(linesOf(""), Lines{});
  EXPECT_EQ(linesOf("\n"), Lines{""});
  EXPECT_EQ(linesOf("a"), Lines{"a"});
  EXPECT_EQ(linesOf("a\n"), Lines{"a"});
  EXPECT_EQ(linesOf("a\r\n\nb c"), (Lines{"a\r", "", "b c"}));
  EXPECT_EQ(linesOf(std::string_view("\0x\n\0", 4)), (Lines{std::string("\0x", 2), std::string(1, '\0')}));
}

TEST_F(LineReaderTest, LinesOfManyPieces) {
  std::string text;
  Lines expected;
  for (int i = 0; text.size() < 3 * LineReader::kLongestLine; ++i) {
    expected.push_back(std::string(static_cast<std::size_t>(i % 5000), 'x') + std::to_string(i));
    text += expected.back() + '\n';
  }
  EXPECT_EQ(linesOf(text), expected);
  text.pop_back();
  EXPECT_EQ(linesOf(text), expected);
}

TEST_F(LineReaderTest, ALongLineIsCutAndItsRestPassedOver) {
  constexpr std::size_t kMost = LineReader::kLongestLine;
  for (const std::size_t length : {kMost - 1, kMost, kMost + 1, 3 * kMost}) {
    const std::string text = "a\n" + std::string(length, 'x') + "\nb\n" + std::string(length, 'y');
    Result<LineReader> reader = LineReader::open(folder.write("a.txt", text));
    ASSERT_TRUE(reader);
    EXPECT_EQ(reader->next(), "a");
    EXPECT_FALSE(reader->isCut());
    EXPECT_EQ(reader->next()->size(), std::min(length, kMost));
    EXPECT_EQ(reader->isCut(), length >= kMost);
    EXPECT_EQ(reader->next(), "b");
    EXPECT_FALSE(reader->isCut());
    EXPECT_EQ(reader->next(), std::string(std::min(length, kMost), 'y'));
    EXPECT_EQ(reader->next(), std::nullopt);
    EXPECT_FALSE(reader->hasFailed());
  }
}

TEST_F(LineReaderTest, TellsHowFarItIsAndStops) {
  const std::string path = folder.write("a.txt", std::string(4 * LineReader::kLongestLine, '\n'));
  std::vector<double> done;
  Result<LineReader> reader = LineReader::open(path, [&done](double part) {
    done.push_back(part);
    return part < 0.75;
  });
  std::size_t lines = 0;
  while (reader->next()) ++lines;
  EXPECT_EQ(done, (std::vector<double>{0.25, 0.5, 0.75}));
  EXPECT_TRUE(reader->isStopped());
  EXPECT_FALSE(reader->hasFailed());
  EXPECT_EQ(lines, 2 * LineReader::kLongestLine);
  EXPECT_EQ(reader->next(), std::nullopt);
}

TEST_F(LineReaderTest, OnlyFilesAreOpened) {
  EXPECT_THAT(LineReader::open(folder.file("none.txt")).error(), HasSubstr("No such file"));
  EXPECT_THAT(LineReader::open(folder.path().string()).error(), HasSubstr("it is not a file"));
  ASSERT_EQ(::mkfifo(folder.file("pipe").c_str(), 0600), 0);
  EXPECT_THAT(LineReader::open(folder.file("pipe")).error(), HasSubstr("it is not a file"));
}

}  // namespace platform_line_reader_test
}  // namespace gridbay

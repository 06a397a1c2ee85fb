// What is written is read back the same, whatever it is.

#include <gtest/gtest.h>

#include <bit>
#include <cmath>
#include <initializer_list>
#include <random>

#include "basic/bathymetry.h"
#include "basic/boundary.h"
#include "basic/mass_budget.h"
#include "basic/source_sink.h"
#include "core/kdl_reader.h"
#include "core/kdl_writer.h"
#include "hydrodynamic/boundary.h"
#include "setup/setup_file.h"
#include "tests/support/model.h"
#include "tests/support/temporary_folder.h"

namespace gridbay {
namespace core_round_trip_test {

class Chance {
 public:
  explicit Chance(unsigned seed) : random_(seed) {}

  std::uint64_t bits() { return random_(); }
  int below(int most) { return static_cast<int>(random_() % static_cast<unsigned>(most)); }
  std::string oneOf(std::initializer_list<const char*> list) {
    return list.begin()[below(static_cast<int>(list.size()))];
  }

  // Texts with all that is awkward: quotes, blanks at the ends, line breaks, other alphabets, control
  // characters, text that looks like something else.
  std::string text() {
    const std::initializer_list<const char*> kPieces = {
        "a",    "Z",      " ",       "  ",     "\t",     "\n",     "\r\n", "\"",  "\\",   "#",
        "{",    "}",      "//",      "/*",     "(file)", "=",      ";",    "é",   "水",   "🌊",
        "\x01", "\x7F",   "\u0085",  "\u2028", "#true",  "null",   "-inf", "1e5", "0x1F", "-",
        ".5",   "\"\"\"", "\\u{41}", "%d",     "\b",     "\u00a0", "\v",   "\f",  "+1",   "inf"};
    std::string text;
    for (int pieces = below(6); pieces > 0; --pieces) text += oneOf(kPieces);
    return text;
  }

  // Every class of numbers but not-a-number, and the extremes of each.
  double real() {
    using Limits = std::numeric_limits<double>;
    const double kExtremes[] = {0.0,
                                -0.0,
                                Limits::infinity(),
                                -Limits::infinity(),
                                Limits::max(),
                                Limits::lowest(),
                                Limits::min(),
                                -Limits::min(),
                                Limits::denorm_min(),
                                -Limits::denorm_min(),
                                0.1,
                                1e15,
                                1e16,
                                1e17,
                                1e-4,
                                1e-5,
                                123456.789};
    if (below(2) == 0) return kExtremes[below(static_cast<int>(std::size(kExtremes)))];
    const double any = std::bit_cast<double>(bits());
    return std::isnan(any) ? 1.5 : any;
  }

 private:
  std::mt19937_64 random_;
};

// The file that a text is, or nothing when it can't be read.
KvsHandle readBack(const KvsFile& file) {
  const Result<std::string> text = file.text();
  EXPECT_TRUE(text) << text.error();
  return text ? test::fileOf(*text) : nullptr;
}

void fill(KvsFile& file, Chance& chance, int depth) {
  for (int nodes = chance.below(12); nodes > 0; --nodes) {
    if (depth > 0 && chance.below(3) == 0) {
      kvsAddSection(file, chance.text());
      fill(file, chance, depth - 1);
      kvsEndSection(file);
      continue;
    }
    kvsAddKeyword(file, chance.text());
    for (int values = chance.below(5); values > 0; --values) {
      switch (chance.below(8)) {
        case 0:
          kvsAddBool(file, chance.below(2) == 0);
          break;
        case 1:
          kvsAddInt(file, static_cast<std::int32_t>(chance.bits()));
          break;
        case 2:
          kvsAddFloat(file, static_cast<float>(chance.real()));
          break;
        case 3:
          kvsAddDouble(file, chance.real());
          break;
        case 4:
          kvsAddFilename(file, chance.text());
          break;
        case 5:
          kvsAddResultFilename(file, chance.text());
          break;
        case 6:
          file.add(ValueKind::integer, chance.oneOf({"-9223372036854775808", "9223372036854775807", "0",
                                                     "18446744073709551615", "-2147483649"}));
          break;
        default:
          kvsAddString(file, chance.text());
      }
    }
  }
}

TEST(RoundTrip, AnyTreeIsReadBackEqual) {
  for (unsigned seed = 1; seed <= 3000; ++seed) {
    Chance chance(seed);
    KvsFile file;
    kvsAddTarget(file, chance.text());
    fill(file, chance, 4);
    kvsEndSection(file);
    const KvsHandle again = readBack(file);
    ASSERT_NE(again, nullptr) << "seed " << seed;
    ASSERT_TRUE(sameTree(file.tree().root(), again->tree().root())) << "seed " << seed << "\n"
                                                                    << *file.text();
    ASSERT_EQ(*again->text(), *file.text()) << "seed " << seed;
  }
}

TEST(RoundTrip, EveryRealComesBackBitByBit) {
  Chance chance(7);
  for (int i = 0; i < 100000; ++i) {
    const double number = chance.real();
    KvsFile file;
    kvsPutParam(file, "A", number);
    kvsPutParam(file, "B", static_cast<float>(number));
    const KvsHandle again = readBack(file);
    double twice = 1;
    float once = 1;
    kvsGetParam(&again->tree().root(), "A", &twice, 1, 1);
    kvsGetParam(&again->tree().root(), "B", &once, 1, 1);
    ASSERT_EQ(std::bit_cast<std::uint64_t>(twice), std::bit_cast<std::uint64_t>(number));
    ASSERT_EQ(std::bit_cast<std::uint32_t>(once), std::bit_cast<std::uint32_t>(static_cast<float>(number)));
  }
}

// Writes a section anew with other values of the same kinds, some of them beyond reason.
void disturb(const Node& section, KvsFile& file, Chance& chance) {
  for (const Node* node = section.first(); node != nullptr; node = node->next()) {
    if (chance.below(40) == 0) continue;  // left out
    if (node->isSection()) {
      kvsAddSection(file, node->name());
      disturb(*node, file, chance);
      kvsEndSection(file);
      continue;
    }
    kvsAddKeyword(file, node->name());
    for (const Value& value : node->values()) {
      const bool keep = chance.below(3) > 0;
      switch (value.kind()) {
        case ValueKind::boolean:
          kvsAddBool(file, chance.below(2) == 0);
          break;
        case ValueKind::integer:
          file.add(value.kind(), keep ? std::string(value.text())
                                      : chance.oneOf({"0", "1", "2", "3", "-1", "5", "8", "11", "2147483647",
                                                      "-2147483648", "40"}));
          break;
        case ValueKind::real:
          kvsAddDouble(file, chance.real());
          break;
        default:
          file.add(value.kind(), keep ? std::string(value.text()) : chance.text());
      }
    }
  }
}

TEST(RoundTrip, AnyModelSavedLoadedAndSavedIsTheSameText) {
  const test::TemporaryFolder folder;
  for (unsigned seed = 1; seed <= 400; ++seed) {
    Chance chance(seed);
    // A model with something in every list, and then with other values.
    test::Model model;
    model.root.bathymetry->SetNoAreas(1 + chance.below(4));
    model.root.boundary->SetNoBoundaries(chance.below(5));
    model.root.sourceSink->SetNoSources(chance.below(5));
    model.root.massBudget->SetNoPolygons(chance.below(4));
    const KvsHandle plain = test::fileOf(test::savedText(model.root, folder.file("s.v27")));
    KvsFile disturbed;
    disturb(plain->tree().root(), disturbed, chance);

    const auto loadedAndSaved = [&folder](const Node& file) {
      CollectingMessageHost host;
      CGlobalKvs root(&host);
      root.Load(&file, folder.file("s.v27"));
      return test::savedText(root, folder.file("s.v27"));
    };
    const auto next = [&](const std::string& text) {
      const KvsHandle file = test::fileOf(text);
      return file == nullptr ? std::string() : loadedAndSaved(file->tree().root());
    };
    // Where the list of components is missing, those that follow it are as they were until the next load.
    const std::string second = next(loadedAndSaved(disturbed.tree().root()));
    ASSERT_FALSE(second.empty()) << "seed " << seed;
    ASSERT_EQ(next(second), second) << "seed " << seed;
  }
}

}  // namespace core_round_trip_test
}  // namespace gridbay

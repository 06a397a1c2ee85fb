// Files that no one would write in earnest, beside a plain file of the same size: the time for each byte
// should not be of another order.

#include <benchmark/benchmark.h>
#include <fmt/format.h>

#include "core/kdl_reader.h"

namespace gridbay {
namespace {

constexpr std::size_t kSize = 20'000'000;

std::string repeated(std::string_view piece) {
  std::string text;
  while (text.size() < kSize) text += piece;
  return text;
}

std::string plain() {
  std::string text;
  for (int i = 1; text.size() < kSize; ++i)
    text += fmt::format("POINT_{} {{\n    X {}.25\n    Name \"n{}\"\n}}\n", i, i, i);
  return text;
}

// Reads the file and looks names up, the last one of a repeated name among them.
void readAndLookUp(benchmark::State& state, std::string (*make)()) {
  const std::string text = make();
  for (auto _ : state) {
    const ReadText read = readKdl(FileText(text));
    if (read.tree == nullptr) continue;
    const Node& root = read.tree->root();
    for (const char* name : {"POINT_1", "Drying_Depth", "nothing"}) {
      benchmark::DoNotOptimize(root.section(name, 100'000));
      benchmark::DoNotOptimize(root.keyword(name, 100'000));
    }
  }
  state.SetBytesProcessed(state.iterations() * static_cast<std::int64_t>(text.size()));
}

void add(const char* name, std::string (*make)()) {
  benchmark::RegisterBenchmark(name, readAndLookUp, make)->Unit(benchmark::kMillisecond);
}

const bool kAdded = [] {
  add("hostile/plainFile", plain);
  add("hostile/nestedBlocks", [] { return repeated("A {\n"); });
  add("hostile/oneLine", [] { return "Name \"" + std::string(kSize, 'x') + "\"\n"; });
  add("hostile/oneNumber", [] { return "Name " + std::string(kSize, '1') + "\n"; });
  add("hostile/escapes", [] { return "Name \"" + repeated("\\n") + "\"\n"; });
  add("hostile/oneComment", [] { return "/*" + std::string(kSize, '*') + "*/\n"; });
  add("hostile/repeatedKeyword", [] { return repeated("Drying_Depth 0.5\n"); });
  add("hostile/repeatedSection", [] { return repeated("POINT_1 {}\n"); });
  add("hostile/manyValues", [] { return "Corner" + repeated(" 7") + "\n"; });
  add("hostile/emptyLines", [] { return repeated("\n"); });
  add("hostile/wideCharacters", [] { return "Name \"" + repeated("水") + "\"\n"; });
  return true;
}();

}  // namespace
}  // namespace gridbay

// A setup of many point sections: read into the tree with every value taken as a double, beside a fast XML
// reader on the same tree as compact XML and a fast JSON reader on it as JSON; names looked up; and the text
// written.

#include <benchmark/benchmark.h>
#include <fmt/format.h>
#include <simdjson.h>

#include <cstdio>
#include <filesystem>
#include <fstream>
#include <pugixml.hpp>
#include <string>

#include "core/kdl_reader.h"
#include "core/kvs.h"

namespace gridbay {
namespace {

constexpr int kPoints = 1'000'000;

struct Texts {
  Texts() {
    kdl = "T {\n";
    xml = "<T>";
    json = "{\"T\":[";
    for (int i = 1; i <= kPoints; ++i) {
      const double x = 480000 + i * 0.37;
      const double y = 6100000 + i * 0.61;
      const double z = (i % 977) * 0.013 - 5;
      kdl += fmt::format("    POINT_{} {{\n        X {:.3f}\n        Y {:.3f}\n        Z {:.6f}\n    }}\n", i,
                         x, y, z);
      xml += fmt::format("<POINT_{} X=\"{:.3f}\" Y=\"{:.3f}\" Z=\"{:.6f}\"/>", i, x, y, z);
      json += fmt::format("{}{{\"POINT_{}\":{{\"X\":{:.3f},\"Y\":{:.3f},\"Z\":{:.6f}}}}}", i == 1 ? "" : ",",
                          i, x, y, z);
    }
    kdl += "}\n";
    xml += "</T>";
    json += "]}";
  }
  std::string kdl;
  std::string xml;
  std::string json;
};

const Texts& texts() {
  static const Texts made;
  return made;
}

double sumOfTree(const Node& target) {
  double sum = 0;
  for (const Node* point = target.first(); point != nullptr; point = point->next()) {
    for (const Node* keyword = point->first(); keyword != nullptr; keyword = keyword->next()) {
      sum += kvsGetDouble(&keyword->values().front());
    }
  }
  return sum;
}

// A text as a file in memory, so that a reader finds it in the page cache.
class CachedFile {
 public:
  CachedFile(std::string path, const std::string& text) : path_(std::move(path)) {
    std::FILE* file = std::fopen(path_.c_str(), "wb");
    std::fwrite(text.data(), 1, text.size(), file);
    std::fclose(file);
  }
  ~CachedFile() { std::filesystem::remove(path_); }
  const std::string& path() const { return path_; }

 private:
  std::string path_;
};

// Kilobytes of memory in use: now, and at most since the peak was forgotten.
long memoryNow() {
  long pages = 0;
  std::ifstream("/proc/self/statm") >> pages >> pages;
  return pages * 4;
}
void forgetPeak() {
  std::ofstream("/proc/self/clear_refs") << "5";
}
long memoryPeak() {
  std::ifstream status("/proc/self/status");
  for (std::string word; status >> word;) {
    long kilobytes = 0;
    if (word == "VmHWM:" && status >> kilobytes) return kilobytes;
  }
  return 0;
}

void parseKdl(benchmark::State& state) {
  const CachedFile file("/dev/shm/gridbay-bench.v27", texts().kdl);
  const long before = memoryNow();
  forgetPeak();
  for (auto _ : state) {
    const KvsHandle read = kvsLoadFile(file.path(), 0);
    benchmark::DoNotOptimize(sumOfTree(*read->tree().root().first()));
  }
  state.SetBytesProcessed(state.iterations() * static_cast<std::int64_t>(texts().kdl.size()));
  state.counters["peak_to_file"] =
      static_cast<double>(memoryPeak() - before) * 1024 / static_cast<double>(texts().kdl.size());
}
BENCHMARK(parseKdl)->Unit(benchmark::kMillisecond)->MinTime(2);

void parseXmlInPlace(benchmark::State& state) {
  const CachedFile file("/dev/shm/gridbay-bench.xml", texts().xml);
  const long before = memoryNow();
  forgetPeak();
  for (auto _ : state) {
    const std::size_t size = texts().xml.size();
    const auto text = std::make_unique_for_overwrite<char[]>(size);
    std::FILE* opened = std::fopen(file.path().c_str(), "rb");
    if (std::fread(text.get(), 1, size, opened) != size) state.SkipWithError("the file cannot be read");
    std::fclose(opened);
    pugi::xml_document document;
    document.load_buffer_inplace(text.get(), size);
    double sum = 0;
    for (const pugi::xml_node point : document.first_child()) {
      for (const pugi::xml_attribute value : point.attributes()) sum += value.as_double();
    }
    benchmark::DoNotOptimize(sum);
  }
  state.SetBytesProcessed(state.iterations() * static_cast<std::int64_t>(texts().xml.size()));
  state.counters["peak_to_file"] =
      static_cast<double>(memoryPeak() - before) * 1024 / static_cast<double>(texts().xml.size());
}
BENCHMARK(parseXmlInPlace)->Unit(benchmark::kMillisecond)->MinTime(2);

void parseJson(benchmark::State& state) {
  const CachedFile file("/dev/shm/gridbay-bench.json", texts().json);
  for (auto _ : state) {
    const simdjson::padded_string text = simdjson::padded_string::load(file.path());
    simdjson::dom::parser parser;
    double sum = 0;
    for (const simdjson::dom::element entry : parser.parse(text)["T"]) {
      for (const auto point : simdjson::dom::object(entry)) {
        for (const auto value : simdjson::dom::object(point.value)) sum += double(value.value);
      }
    }
    benchmark::DoNotOptimize(sum);
  }
  state.SetBytesProcessed(state.iterations() * static_cast<std::int64_t>(texts().json.size()));
}
BENCHMARK(parseJson)->Unit(benchmark::kMillisecond)->MinTime(2);

void lookUpEveryName(benchmark::State& state) {
  std::vector<std::string> names;
  for (int i = 1; i <= kPoints; ++i) names.push_back("POINT_" + std::to_string(i));
  for (auto _ : state) {
    // The index is finished at the first lookup, so each round has a tree of its own.
    state.PauseTiming();
    ReadText fresh = readKdl(FileText(texts().kdl));
    state.ResumeTiming();
    int found = 0;
    for (const std::string& name : names) {
      found += kvsSectionByNameNum(fresh.tree->root().first(), name, 1) != nullptr ? 1 : 0;
    }
    if (found != kPoints) state.SkipWithError("a name was not found");
    state.PauseTiming();
    fresh.tree.reset();
    state.ResumeTiming();
  }
}
BENCHMARK(lookUpEveryName)->Unit(benchmark::kMillisecond);

void writeText(benchmark::State& state) {
  KvsFile file(readKdl(FileText(texts().kdl)).tree);
  const std::string path = "/dev/shm/gridbay-bench.v27";
  for (auto _ : state) {
    if (!kvsWrite(file, path)) state.SkipWithError("the file cannot be written");
  }
  std::filesystem::remove(path);
  state.SetBytesProcessed(state.iterations() * static_cast<std::int64_t>(texts().kdl.size()));
}
BENCHMARK(writeText)->Unit(benchmark::kMillisecond);

void writeBytesPlainly(benchmark::State& state) {
  const std::string path = "/dev/shm/gridbay-bench.peer";
  for (auto _ : state) {
    std::FILE* file = std::fopen(path.c_str(), "wb");
    std::fwrite(texts().kdl.data(), 1, texts().kdl.size(), file);
    std::fclose(file);
  }
  std::filesystem::remove(path);
  state.SetBytesProcessed(state.iterations() * static_cast<std::int64_t>(texts().kdl.size()));
}
BENCHMARK(writeBytesPlainly)->Unit(benchmark::kMillisecond);

}  // namespace
}  // namespace gridbay

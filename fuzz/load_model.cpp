// A load into the root followed by a check and a save: a saved model loads and saves again to the same text.

#include <cstdlib>

#include "core/kdl_reader.h"
#include "core/kdl_writer.h"
#include "setup/global_kvs.h"

using namespace gridbay;

namespace {

std::string loadedAndSaved(std::string_view text, bool check) {
  ReadText read = readKdl(FileText(text));
  if (read.tree == nullptr) return {};
  CollectingMessageHost host;
  CGlobalKvs root(&host);
  root.Load(&read.tree->root(), "/nowhere/setup.v27");
  if (check) {
    ValidationList messages;
    root.Validate(messages, 1);
  }
  const KvsHandle file = kvsCreate();
  root.Save(*file, "/nowhere/setup.v27");
  Result<std::string> saved = file->text();
  if (!saved) std::abort();
  return *saved;
}

}  // namespace

extern "C" int LLVMFuzzerTestOneInput(const unsigned char* data, std::size_t size) {
  const std::string first = loadedAndSaved({reinterpret_cast<const char*>(data), size}, true);
  if (!first.empty() && loadedAndSaved(first, false) != first) std::abort();
  return 0;
}

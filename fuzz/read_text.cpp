// The text reader: any text is read or refused with a place, and what was read is written and read back
// equal.

#include <cstdlib>

#include "core/kdl_reader.h"
#include "core/kdl_writer.h"

using namespace gridbay;

extern "C" int LLVMFuzzerTestOneInput(const unsigned char* data, std::size_t size) {
  const ReadText read = readKdl(FileText(std::string_view(reinterpret_cast<const char*>(data), size)));
  if (read.tree == nullptr) {
    if (read.error.line == 0 || read.error.expected.empty()) std::abort();
    return 0;
  }
  const Result<std::string> text = kdlText(read.tree->root());
  if (!text) std::abort();
  const ReadText again = readKdl(FileText(*text));
  if (again.tree == nullptr || !sameTree(read.tree->root(), again.tree->root())) std::abort();
  return 0;
}

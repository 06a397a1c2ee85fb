// A model definition chosen for a model of two areas, checked, saved with all that is made of it, and loaded
// again to the same text.

#include <sys/mman.h>
#include <unistd.h>

#include <cstdlib>
#include <string>

#include "basic/bathymetry.h"
#include "basic/boundary.h"
#include "basic/module_selection.h"
#include "core/kdl_reader.h"
#include "ecology/model_definition.h"
#include "setup/global_kvs.h"

using namespace gridbay;

namespace {

void require(bool holds) {
  if (!holds) std::abort();
}

// A file in memory, by a name under which it can be opened.
class MemoryFile {
 public:
  MemoryFile(const unsigned char* data, std::size_t size) : descriptor_(::memfd_create("definition", 0)) {
    require(::write(descriptor_, data, size) == static_cast<::ssize_t>(size));
  }
  MemoryFile(const MemoryFile&) = delete;
  MemoryFile& operator=(const MemoryFile&) = delete;
  ~MemoryFile() { ::close(descriptor_); }
  std::string path() const { return "/proc/self/fd/" + std::to_string(descriptor_); }

 private:
  int descriptor_;
};

std::string saved(CGlobalKvs& root) {
  const KvsHandle file = kvsCreate();
  root.Save(*file, "/nowhere/setup.v27");
  const Result<std::string> text = file->text();
  require(static_cast<bool>(text));
  return *text;
}

}  // namespace

extern "C" int LLVMFuzzerTestOneInput(const unsigned char* data, std::size_t size) {
  const MemoryFile definition(data, size);
  CollectingMessageHost host;
  CGlobalKvs root(&host);
  root.moduleSelection->simulationType = module::kEcological;
  root.bathymetry->SetNoAreas(2);
  root.boundary->SetNoBoundaries(1);
  UFileName file;
  file = definition.path();
  root.wqsModelDefinition->Choose(file);
  const CWQSModelDefinitionKvs& model = *root.wqsModelDefinition;
  require(model.definition().fault.empty() || model.definition().IsEmpty());
  for (const std::int32_t place : model.transported())
    require(model.StateVariable(place + 1) != nullptr && model.StateVariable(place + 1)->IsTransported());
  ValidationList messages;
  root.Validate(messages, 1);
  const std::string first = saved(root);

  const ReadText read = readKdl(FileText(first));
  require(read.tree != nullptr);
  CGlobalKvs again(&host);
  again.Load(&read.tree->root(), "/nowhere/setup.v27");
  require(saved(again) == first);
  return 0;
}

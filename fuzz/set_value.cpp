// A path and a value from the command line, on a new model: found or refused, and what is set can be read.

#include <cstdlib>

#include "cli/setup_path.h"
#include "setup/setup_file.h"

using namespace gridbay;

extern "C" int LLVMFuzzerTestOneInput(const unsigned char* data, std::size_t size) {
  const std::string_view setting(reinterpret_cast<const char*>(data), size);
  const std::size_t equals = setting.find('=');
  if (equals == setting.npos) return 0;
  static const KvsHandle file = SetupFile(nullptr).tree("/nowhere/setup.v27");
  const Result<const Node*> found = cli::findPath(*file, setting.substr(0, equals));
  if (!found || (*found)->isSection()) return 0;
  ParameterTree keeper;
  const auto values = cli::valuesOfText(**found, setting.substr(equals + 1), keeper);
  if (!values) return 0;
  CollectingMessageHost host;
  const SetupFile changed =
      SetupFile::fromTree(cli::withValues(*file, *found, *values), "/nowhere/setup.v27", &host);
  if (!cli::findPath(changed.source(), setting.substr(0, equals))) std::abort();
  return 0;
}

// A path and a value from the command line, on a new model: found or refused. What is set can be read, and
// what is refused leaves the old value.

#include <cstdlib>

#include "cli/member_keyword.h"
#include "cli/setup_path.h"

using namespace gridbay;

extern "C" int LLVMFuzzerTestOneInput(const unsigned char* data, std::size_t size) {
  const std::string_view setting(reinterpret_cast<const char*>(data), size);
  const std::size_t equals = setting.find('=');
  if (equals == setting.npos) return 0;
  const std::string path(setting.substr(0, equals));
  CGlobalKvs model;
  Result<cli::MemberKeyword> keyword = cli::findKeyword(model, path, "/nowhere/setup.v27");
  if (!keyword) return 0;
  ParameterTree keeper;
  const auto values =
      cli::valuesOfText(keyword->node(), setting.substr(equals + 1), keyword->takesAnyNumber(), keeper);
  if (!values) return 0;
  const std::string before = cli::shownValues(keyword->node());
  const bool taken = keyword->set(*values);
  const Result<cli::MemberKeyword> after = cli::findKeyword(model, path, "/nowhere/setup.v27");
  if (!after || (!taken && cli::shownValues(after->node()) != before)) std::abort();
  return 0;
}

// A path and a value from the command line, on a new model: found or refused. What is set can be read, and
// what is refused leaves the old value.

#include <cstdlib>

#include "setup/member_keyword.h"
#include "setup/setup_path.h"

using namespace gridbay;

extern "C" int LLVMFuzzerTestOneInput(const unsigned char* data, std::size_t size) {
  const std::string_view setting(reinterpret_cast<const char*>(data), size);
  const std::size_t equals = setting.find('=');
  if (equals == setting.npos) return 0;
  const std::string path(setting.substr(0, equals));
  CGlobalKvs model;
  Result<MemberKeyword> keyword = findKeyword(model, path, "/nowhere/setup.v27");
  if (!keyword) return 0;
  ParameterTree keeper;
  const auto values =
      valuesOfText(keyword->node(), setting.substr(equals + 1), keyword->takesAnyNumber(), keeper);
  if (!values) return 0;
  const std::string before = shownValues(keyword->node());
  const bool taken = keyword->set(*values);
  const Result<MemberKeyword> after = findKeyword(model, path, "/nowhere/setup.v27");
  if (!after || (!taken && shownValues(after->node()) != before)) std::abort();
  return 0;
}

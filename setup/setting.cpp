#include "setup/setting.h"

#include <fmt/format.h>

#include "setup/member_keyword.h"
#include "setup/setup_path.h"

namespace gridbay {
namespace {

// The engine's options are not in the model: a save passes on what stands in the file that was read.
Outcome setOption(SetupFile& setup, const Setting& setting) {
  const Result<const Node*> keyword = findPath(setup.source(), setting.path);
  if (!keyword) return Failure{keyword.error()};
  if ((*keyword)->isSection())
    return Failure{fmt::format("\"{}\" is a section; name a keyword in it", setting.path)};
  ParameterTree keeper;
  const Result<std::vector<Value>> values = valuesOfText(**keyword, setting.value, false, keeper);
  if (!values) return Failure{values.error()};
  setup.replaceSource(withValues(setup.source(), *keyword, *values));
  return {};
}

Outcome setMember(SetupFile& setup, const Setting& setting, const std::string& documentPath) {
  const Result<MemberKeyword> keyword = findKeyword(setup.model(), setting.path, documentPath);
  if (keyword) return applySetting(setup.model(), setting, documentPath);
  const KvsHandle effective = setup.tree(documentPath);
  const Result<const Node*> found = findPath(*effective, setting.path);
  return found && (*found)->isSection()
             ? Failure{fmt::format("\"{}\" is a section; name a keyword in it", setting.path)}
             : Failure{found ? keyword.error() : found.error()};
}

}  // namespace

Outcome applySetting(CGlobalKvs& model, const Setting& setting, const std::string& documentPath) {
  Result<MemberKeyword> keyword = findKeyword(model, setting.path, documentPath);
  if (!keyword) return Failure{keyword.error()};
  ParameterTree keeper;
  const Result<std::vector<Value>> values =
      valuesOfText(keyword->node(), setting.value, keyword->takesAnyNumber(), keeper);
  if (!values) return Failure{values.error()};
  if (keyword->set(*values)) return {};
  return Failure{fmt::format("{} cannot be {} here: it stays {}; allowed is {}", setting.path, setting.value,
                             shownValues(keyword->node()), keyword->allowed(*values))};
}

Result<Setting> settingOf(const std::string& text) {
  const std::size_t equals = text.find('=');
  if (equals == text.npos) return Failure{fmt::format("\"{}\" is not of the form PATH=VALUE", text)};
  return Setting{text.substr(0, equals), text.substr(equals + 1)};
}

Outcome applySetting(SetupFile& setup, const Setting& setting, const std::string& documentPath) {
  return isOption(setting.path) ? setOption(setup, setting) : setMember(setup, setting, documentPath);
}

}  // namespace gridbay

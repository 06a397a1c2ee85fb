#include "setup/member_keyword.h"

#include <fmt/format.h>

#include <algorithm>
#include <cmath>

#include "core/file_name.h"
#include "core/number_text.h"
#include "setup/setup_path.h"

namespace gridbay {
namespace {

// A file's name as a setup at `documentPath` writes it.
std::string nameOnFile(std::string_view name, const std::string& documentPath) {
  UFileName file;
  file.Set(name, documentPath);
  const KvsHandle written = kvsCreate();
  file.Save(*written, documentPath);
  return std::string(written->tree().root().first()->values().front().text());
}

// Whether a keyword has these values; the model may hold a number with fewer digits, and a file beside the
// setup is written by its name from there.
bool stands(const Node& keyword, const std::vector<Value>& wanted, const std::string& documentPath) {
  return std::ranges::equal(keyword.values(), wanted, [&](const Value& a, const Value& b) {
    if (a.kind() == ValueKind::real) return floatOfText(a.text()) == floatOfText(b.text());
    if (a.text() == b.text()) return true;
    const bool isFile = a.kind() == ValueKind::fileName || a.kind() == ValueKind::resultFileName;
    return isFile && a.text() == nameOnFile(b.text(), documentPath);
  });
}

bool areFinite(const std::vector<Value>& values) {
  return std::ranges::all_of(values, [](const Value& value) {
    return value.kind() != ValueKind::real || std::isfinite(floatOfText(value.text()).value_or(0));
  });
}

}  // namespace

bool MemberKeyword::write() {
  written_ = kvsCreate();
  PathAccess access{PathAccess::What::write, written_.get(), nullptr, &documentPath_};
  const bool found = model_->AccessPath(path_, access) && !access.isSection;
  takesAnyNumber_ = access.takesAnyNumber;
  most_ = access.most;
  return found && written_->tree().root().first() != nullptr;
}

void MemberKeyword::take(std::string_view name, std::span<const Value> values) {
  KvsFile given;
  kvsAddKeyword(given, name);
  for (const Value& value : values) given.add(value.kind(), value.text());
  PathAccess access{PathAccess::What::set, nullptr, &given.tree().root(), &documentPath_};
  model_->AccessPath(path_, access);
}

bool MemberKeyword::set(const std::vector<Value>& values) {
  if (!areFinite(values)) return false;
  const KvsHandle before = std::move(written_);
  const Node& keyword = *before->tree().root().first();
  take(keyword.name(), values);
  if (write() && stands(node(), values, documentPath_)) return true;
  take(keyword.name(), keyword.values());
  write();
  return false;
}

std::string MemberKeyword::allowed(const std::vector<Value>& refused) const {
  if (!areFinite(refused)) return "a finite number";
  if (most_ > 0) return fmt::format("0 to {}", most_);
  return shownValues(node());
}

Result<MemberKeyword> findKeyword(CGlobalKvs& model, std::string_view path, const std::string& documentPath) {
  MemberKeyword keyword;
  keyword.model_ = &model;
  keyword.path_ = withoutTarget(path);
  keyword.documentPath_ = documentPath;
  PathAccess look{PathAccess::What::look};
  if (model.AccessPath(keyword.path_, look) && look.isWrittenOnly)
    return Failure{fmt::format("\"{}\" follows from other values, and is not set by itself", path)};
  if (!keyword.write()) return Failure{fmt::format("There is no keyword \"{}\" in this setup", path)};
  return keyword;
}

}  // namespace gridbay

#include "core/selections.h"

namespace gridbay {
namespace {

constexpr std::string_view kFileName = "File_Name";
constexpr std::string_view kItemNumbers = "Item_Numbers";

}  // namespace

void SelectionFileName::Save(KvsFile& file, const std::string& documentPath, std::string_view keyword) const {
  if (isResult_) {
    kvsPutParamResultFilename(file, keyword, onFile(documentPath));
  } else {
    kvsPutParamFilename(file, keyword, onFile(documentPath));
  }
}

void SelectionFileName::Load(KvsSection section, const std::string& documentPath, std::string_view keyword) {
  const KvsKeyword found = kvsKeywordByNameNum(section, keyword, 1);
  const KvsParam param = found == nullptr ? nullptr : kvsParamByNum(found, 1);
  std::string name = text();
  if (param != nullptr) {
    const ValueKind kind = param->kind();
    if (kind == ValueKind::fileName || kind == ValueKind::resultFileName) {
      isResult_ = kind == ValueKind::resultFileName;
      name = param->text();
    }
  }
  take(std::move(name), documentPath);
}

void UTsbSelection::SetNoItems(int n) {
  if (n < 0) return;
  const auto count = static_cast<std::size_t>(n);
  while (items.size() < count) items.push_back(static_cast<std::uint32_t>(items.size()) + 1);
  items.resize(count);
}

namespace {

void putItems(KvsFile& file, const std::vector<std::uint32_t>& items) {
  kvsAddKeyword(file, kItemNumbers);
  for (const std::uint32_t item : items) kvsAddInt(file, static_cast<std::int32_t>(item));
}

// At most `most` numbers.
std::vector<std::uint32_t> itemsOf(KvsKeyword numbers, int most) {
  std::vector<std::uint32_t> items;
  for (int i = 1; i <= kvsGetNoParams(numbers) && i <= most; ++i) {
    items.push_back(static_cast<std::uint32_t>(kvsGetInt(kvsParamByNum(numbers, i))));
  }
  return items;
}

}  // namespace

void UTsbSelection::Save(KvsFile& file, const std::string& documentPath) const {
  fileName.Save(file, documentPath, kFileName);
  putItems(file, items);
}

void UTsbSelection::Load(KvsSection section, const std::string& documentPath, std::optional<int> n) {
  fileName.Load(section, documentPath, kFileName);
  const KvsKeyword numbers = kvsKeywordByNameNum(section, kItemNumbers, 1);
  if (numbers != nullptr) {
    items = itemsOf(numbers, n.value_or(kvsGetNoParams(numbers)));
  } else if (n) {
    SetNoItems(*n);
  }
}

bool UTsbSelection::Access(std::string_view name, PathAccess& access) {
  if (sameName(name, kFileName)) {
    if (access.what == PathAccess::What::write) fileName.Save(*access.out, *access.documentPath, kFileName);
    if (access.what == PathAccess::What::set) fileName.Load(access.in, *access.documentPath, kFileName);
    return true;
  }
  if (!sameName(name, kItemNumbers)) return false;
  access.takesAnyNumber = true;
  if (access.what == PathAccess::What::write) putItems(*access.out, items);
  if (access.what == PathAccess::What::set) {
    if (const KvsKeyword numbers = kvsKeywordByNameNum(access.in, kItemNumbers, 1); numbers != nullptr)
      items = itemsOf(numbers, kvsGetNoParams(numbers));
  }
  return true;
}

}  // namespace gridbay

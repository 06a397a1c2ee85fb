#include "core/selections.h"

namespace gridbay {
namespace {

constexpr std::string_view kFileName = "File_Name";
constexpr std::string_view kItemNumbers = "Item_Numbers";

}  // namespace

void UTsbSelection::SetNoItems(int n) {
  if (n < 0) return;
  const auto count = static_cast<std::size_t>(n);
  while (items.size() < count) items.push_back(static_cast<std::uint32_t>(items.size()) + 1);
  items.resize(count);
}

void UTsbSelection::Save(KvsFile& file, const std::string& documentPath) const {
  fileName.Save(file, documentPath, kFileName);
  kvsAddKeyword(file, kItemNumbers);
  for (const std::uint32_t item : items) kvsAddInt(file, static_cast<std::int32_t>(item));
}

void UTsbSelection::Load(KvsSection section, const std::string& documentPath, int n) {
  fileName.Load(section, documentPath, kFileName);
  const KvsKeyword numbers = kvsKeywordByNameNum(section, kItemNumbers, 1);
  if (numbers == nullptr) {
    SetNoItems(n);
    return;
  }
  items.clear();
  for (int i = 1; i <= kvsGetNoParams(numbers) && i <= n; ++i) {
    items.push_back(static_cast<std::uint32_t>(kvsGetInt(kvsParamByNum(numbers, i))));
  }
}

}  // namespace gridbay

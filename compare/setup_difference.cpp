#include "compare/setup_difference.h"

#include <fmt/format.h>

#include <algorithm>
#include <filesystem>

#include "compare/keyword_pages.h"
#include "compare/page_difference.h"
#include "core/nearest.h"
#include "platform/files/paths.h"
#include "setup/setup_path.h"

namespace gridbay {
namespace {

// A keyword that no page shows.
Difference byPath(const KeywordDifference& keyword) {
  return {.thing = keyword.path, .own = keyword.own, .other = keyword.other, .keywords = {keyword.path}};
}

// Copies what a section holds, with names of files in the one form that a save would give them: "./a" and "a"
// lead to one file.
void copyPlain(const Node& section, const std::string& folder, KvsFile& file) {
  for (const Node* node = section.first(); node != nullptr; node = node->next()) {
    if (node->isSection()) {
      kvsAddSection(file, node->name());
      copyPlain(*node, folder, file);
      kvsEndSection(file);
      continue;
    }
    kvsAddKeyword(file, node->name());
    for (const Value& value : node->values()) {
      const bool isName = value.kind() == ValueKind::fileName || value.kind() == ValueKind::resultFileName;
      if (isName && !value.text().empty()) {
        file.add(value.kind(), pathOnFile(absolutePath(value.text(), folder), folder));
      } else {
        file.add(value.kind(), value.text());
      }
    }
  }
}

KvsHandle plain(const KvsFile& file, const std::string& path) {
  KvsHandle copy = kvsCreate();
  copyPlain(file.tree().root(), folderOfFile(path), *copy);
  return copy;
}

void compareEditions(const std::string& own, const std::string& other, SetupDifference& found) {
  if (own == other || own.empty() || other.empty()) return;
  found.differences.insert(found.differences.begin(), {.thing = "Edition", .own = own, .other = other});
}

// What a save would leave out, by what the files hold of it.
void compareUnknown(SetupFile* own, SetupFile& other, SetupDifference& found) {
  std::set<std::string> paths;
  for (SetupFile* setup : {own, &other}) {
    if (setup == nullptr) continue;
    for (std::string& path : setup->unknownSections()) paths.insert(std::move(path));
  }
  for (const std::string& path : paths) {
    const Node* a = own == nullptr ? nullptr : nodeAt(own->source(), path);
    const Node* b = nodeAt(other.source(), path);
    if (sameNode(a, b)) continue;
    const auto held = [](const Node* node) {
      return node == nullptr ? std::nullopt : std::optional<std::string>("");
    };
    std::vector<KeywordDifference> inside = a == nullptr || b == nullptr
                                                ? std::vector<KeywordDifference>{{"", true, held(a), held(b)}}
                                                : differencesOf(*a, *b);
    for (KeywordDifference& difference : inside) {
      difference.path = difference.path.empty() ? path : path + '/' + difference.path;
      found.differences.push_back(byPath(difference));
      found.keywords.push_back(std::move(difference));
    }
  }
}

}  // namespace

std::string editionNamed(const std::string& path) {
  const std::string extension = lowered(std::filesystem::path(path).extension().string());
  return extension == ".v27" || extension == ".v27wsk" ? extension.substr(1) : std::string();
}

SetupDifference compareFiles(const KvsFile& ownFile, const KvsFile& otherFile, const std::string& path,
                             const UnitChoices& units, const SetupDifference* before) {
  const KvsHandle plainOwn = plain(ownFile, path);
  const KvsHandle plainOther = plain(otherFile, path);
  const KvsFile& own = *plainOwn;
  const KvsFile& other = *plainOther;
  const auto target = [](const KvsFile& file) { return kvsTargetByNameNum(file, CGlobalKvs::kTarget, 1); };
  SetupDifference found{.keywords = differencesOf(*target(own), *target(other)), .differences = {}};
  if (found.keywords.empty()) return found;
  {
    ComparedModel ownModel(own, path, units);
    ComparedModel otherModel(other, path, units);
    found.differences = pageDifferences(ownModel, otherModel);
  }
  const std::vector<std::string> left = joinKeywords(own, other, path, units, before, found);
  const std::set<std::string> paths(left.begin(), left.end());
  for (const KeywordDifference& keyword : found.keywords) {
    if (paths.contains(keyword.path)) found.differences.push_back(byPath(keyword));
  }
  return found;
}

void compareRest(SetupFile* own, SetupFile& other, const std::string& ownPath, const std::string& otherPath,
                 SetupDifference& found) {
  compareUnknown(own, other, found);
  compareEditions(editionNamed(ownPath), editionNamed(otherPath), found);
}

SetupDifference compareSetups(SetupOnDisk& own, SetupOnDisk& other) {
  const KvsHandle ownFile = own.setup.tree(own.path);
  const KvsHandle otherFile = other.setup.tree(own.path);
  SetupDifference found = compareFiles(*ownFile, *otherFile, own.path);
  compareRest(&own.setup, other.setup, own.path, other.path, found);
  return found;
}

std::string shortened(std::string text) {
  constexpr std::size_t kMost = 120;
  if (text.size() <= kMost) return text;
  std::size_t end = kMost;
  while (end > 0 && (static_cast<unsigned char>(text[end]) & 0xC0U) == 0x80U) --end;
  return text.substr(0, end) + "...";
}

std::optional<std::string> shortened(const std::optional<std::string>& text) {
  return text ? std::optional(shortened(*text)) : std::nullopt;
}

std::string wordsOf(const std::optional<std::string>& own, const std::optional<std::string>& other,
                    std::string_view ownName, std::string_view otherName) {
  const auto shown = [](const std::string& value) { return value.empty() ? std::string("nothing") : value; };
  if (own && other) return fmt::format("{} in {}, {} in {}", shown(*own), ownName, shown(*other), otherName);
  const std::string& value = own ? *own : *other;
  return fmt::format("only in {}{}", own ? ownName : otherName, value.empty() ? "" : " (" + value + ")");
}

}  // namespace gridbay

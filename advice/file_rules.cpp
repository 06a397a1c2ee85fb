// Doubts about the names of the files that are read and written.

#include <fmt/format.h>

#include <filesystem>
#include <map>

#include "advice/fix_files.h"
#include "advice/rules.h"
#include "platform/files/paths.h"
#include "setup/member_keyword.h"
#include "setup/setup_path.h"

namespace gridbay {
namespace {

// Where a name stands first, and how often besides.
struct NamedFile {
  PagePlace place;
  std::vector<std::string> further;  // their keywords
  bool isResult = false;
  bool isRead = false;
};

// A name that is to take the place of another one, with the file that is made for it.
struct BetterName {
  std::string fix;
  std::string name;
  std::vector<AdviceFile> files = {};
};

void adviseName(AdviceContext& context, const std::string& name, const NamedFile& named, std::string doubt,
                std::string reason, BetterName better) {
  Advice advice{{}, fmt::format("{} {}", name, doubt), std::move(reason), named.place};
  advice.place.value = name;
  if (!named.further.empty())
    advice.doubt += fmt::format(" It is named {} more time{}.", named.further.size(),
                                named.further.size() == 1 ? "" : "s");
  advice.fix =
      AdviceFix{std::move(better.fix), {{named.place.keyword, better.name}}, std::move(better.files)};
  for (const std::string& path : named.further) advice.fix.settings.push_back({path, better.name});
  context.add(std::move(advice));
}

// What a file outside of the setup's folder can be called in it. A result is written there from now on; a
// file that is read is copied, unless it is there already. Nothing for one that is not to be had: where it is
// in use the check tells so. What one part writes and another reads stays one file, with what it holds now.
std::optional<BetterName> inFolder(AdviceContext& context, const std::string& folder, const std::string& name,
                                   const NamedFile& named) {
  if (!isUsablePathName(name)) return std::nullopt;
  const std::string plain = std::filesystem::path(name).filename().string();
  const std::string from = absolutePath(name, folder);
  const std::string beside = absolutePath(plain, folder);
  const bool isThere = named.isRead && isReadableFile(from);
  if (!named.isResult && isReadableFile(beside) && (!isThere || isSmallAndSame(from, beside)))
    return BetterName{fmt::format("Take {} of the setup's folder", plain), plain};
  if (!isThere && !named.isResult) return std::nullopt;
  const std::string free = context.freeName(plain);
  if (!isThere)
    return BetterName{fmt::format("Write {}{} in the setup's folder", named.isRead ? "and read " : "", free),
                      free};
  return BetterName{
      fmt::format("Copy {} into the setup's folder{}{}", plain, free == plain ? std::string() : " as " + free,
                  named.isResult ? ", and write it there" : ""),
      free,
      {{from, absolutePath(free, folder)}}};
}

}  // namespace

// A save names files from the setup's folder where it can, whatever the file on disk says.
void adviseFileNames(AdviceContext& context) {
  if (context.documentPath.empty()) return;
  const std::string folder = folderOfFile(context.documentPath);
  std::map<std::string, NamedFile> outside;
  std::map<std::string, NamedFile> absolute;
  const auto note = [](std::map<std::string, NamedFile>& files, const FileKeyword& keyword) {
    NamedFile& file = files[keyword.name];
    (keyword.isResult ? file.isResult : file.isRead) = true;
    if (file.place.keyword.empty()) {
      file.place = keyword.place;
    } else {
      file.further.push_back(keyword.place.keyword);
    }
  };
  for (const FileKeyword& each : context.fileKeywords()) {
    if (each.name.starts_with('/') || each.name.starts_with("../")) note(outside, each);
  }
  if (context.source != nullptr) {
    for (const FileKeyword& each : fileKeywordsOf(*context.source)) {
      if (each.name.starts_with('/') && !isOption(each.place.keyword) && !outside.contains(each.name) &&
          !pathOnFile(each.name, folder).starts_with("../") &&
          findKeyword(context.model, each.place.keyword, context.documentPath))
        note(absolute, each);
    }
  }
  for (const auto& [name, named] : outside) {
    std::optional<BetterName> better = inFolder(context, folder, name, named);
    if (!better) continue;
    adviseName(context, name, named,
               name.starts_with('/') ? "is named absolutely, and lies outside of the setup's folder."
                                     : "lies outside of the setup's folder.",
               "When the folder is moved or sent, the file stays behind.", std::move(*better));
  }
  for (const auto& [name, named] : absolute) {
    adviseName(context, name, named, "is named absolutely.",
               "When the folder is moved or sent, the name leads nowhere.",
               BetterName{fmt::format("Name it {}, from the setup's folder", pathOnFile(name, folder)),
                          pathOnFile(name, folder)});
  }
}

}  // namespace gridbay

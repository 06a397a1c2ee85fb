#pragma once

#include <string>
#include <vector>

#include "compare/setup_comparison.h"
#include "compare/tree_difference.h"
#include "platform/units/edit_style.h"
#include "setup/setup_file.h"

namespace gridbay {

// What differs between two setups: all keywords in the order of the file, and the same in the words of the
// pages, in the order of the tree. Keywords that no page shows stand behind these by their paths.
struct SetupDifference {
  std::vector<KeywordDifference> keywords;
  std::vector<Difference> differences;

  bool isSame() const { return keywords.empty() && differences.empty(); }
};

// Compares two files as a save to the same path would write them, so that file names are as seen from there.
// What was found before an edit of the first, in the same units, spares looking at all again.
SetupDifference compareFiles(const KvsFile& ownFile, const KvsFile& otherFile, const std::string& path,
                             const UnitChoices& units = {}, const SetupDifference* before = nullptr);

// The edition that a setup's name tells, as "v27wsk"; empty for another name.
std::string editionNamed(const std::string& path);

// A setup on disk with the path that its file names start from.
struct SetupOnDisk {
  SetupFile setup;
  std::string path;
};

// Adds what the files that a save writes do not tell: the edition, by the names of the files, and sections
// that this version does not know. Without `own` there is no first file yet.
void compareRest(SetupFile* own, SetupFile& other, const std::string& ownPath, const std::string& otherPath,
                 SetupDifference& found);

// Compares two setups: file names by where they lead. Sections that this version does not know, and the
// edition, are compared too.
SetupDifference compareSetups(SetupOnDisk& own, SetupOnDisk& other);

// Values of very many numbers in part.
std::string shortened(std::string text);
std::optional<std::string> shortened(const std::optional<std::string>& text);
// "0.02 m in A, 0.05 m in B"
std::string wordsOf(const std::optional<std::string>& own, const std::optional<std::string>& other,
                    std::string_view ownName, std::string_view otherName);

}  // namespace gridbay

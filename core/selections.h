#pragma once

#include <cstdint>
#include <string>
#include <vector>

#include "core/file_name.h"

namespace gridbay {

// A data file with the numbers of the items chosen in it (counted from 1).
class UTsbSelection {
 public:
  explicit UTsbSelection(int noItems = 0) { SetNoItems(noItems); }

  // Drops items from the tail, or appends the numbers that follow; a negative number does nothing.
  void SetNoItems(int n);
  void UpdateData(const UTsbSelection& other) { *this = other; }
  // Keywords "File_Name" and "Item_Numbers" in the section of the owning object.
  void Save(KvsFile& file, const std::string& documentPath) const;
  // Reads both: at most `n` items where the file names some, else `n`.
  void Load(KvsSection section, const std::string& documentPath, int n);

  std::vector<std::uint32_t> items;
  UFileName fileName;
};

// First, last and interval.
struct USubLine {
  std::int32_t first = 0;
  std::int32_t last = 0;
  std::int32_t interval = 1;

  void UpdateData(const USubLine& other) { *this = other; }
  bool operator==(const USubLine&) const = default;
};

// First, last and interval along X, then along Y.
struct USubArea {
  USubLine x;
  USubLine y;

  void UpdateData(const USubArea& other) { *this = other; }
  bool operator==(const USubArea&) const = default;
};

}  // namespace gridbay

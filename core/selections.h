#pragma once

#include <cstdint>
#include <optional>
#include <string>
#include <vector>

#include "core/file_name.h"
#include "core/object_state.h"

namespace gridbay {

// The name of a data file. On file it may be that of an input or of a result; it stays what it was read as.
class SelectionFileName : public FileNameValue {
 public:
  using FileNameValue::operator=;
  void Save(KvsFile& file, const std::string& documentPath, std::string_view keyword) const;
  void Load(KvsSection section, const std::string& documentPath, std::string_view keyword);

  bool operator==(const SelectionFileName&) const = default;

 private:
  bool isResult_ = false;
};

// A data file with the numbers of the items chosen in it (counted from 1).
class UTsbSelection {
 public:
  explicit UTsbSelection(int noItems = 0) { SetNoItems(noItems); }

  // Drops items from the tail, or appends the numbers that follow; a negative number does nothing.
  void SetNoItems(int n);
  void UpdateData(const UTsbSelection& other) { *this = other; }
  // Keywords "File_Name" and "Item_Numbers" in the section of the owning object.
  void Save(KvsFile& file, const std::string& documentPath) const;
  // Reads both: at most `n` items where the file names some, else `n`. Without `n` all that the file names,
  // and where it names none they stay.
  void Load(KvsSection section, const std::string& documentPath, std::optional<int> n = {});
  // One of the two keywords by its name; false for any other.
  bool Access(std::string_view name, PathAccess& access);

  bool operator==(const UTsbSelection&) const = default;

  std::vector<std::uint32_t> items;
  SelectionFileName fileName;
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

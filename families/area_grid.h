#pragma once

#include <string>
#include <string_view>

#include "pages/cell_grid.h"

namespace gridbay {

// The columns of rows that take a value or the map of a file: which of the two, the value, and the file.
template <class Entry>
struct ValueOrFile {
  std::string_view formatHeader;
  int formatWidth;
  std::int32_t Entry::*format;
  Choices formats;
  std::string_view valueHeader;
  int valueWidth;
  float Entry::*value;
  ByRow<int> quantity;  // 0 for a plain number
  Column::Rule takesValue;
  FileColumns file;  // enabled where a file is taken
};

// A grid with a row for each area.
class AreaGrid : public ColumnGrid {
 protected:
  std::string CornerHeader() override { return "Area"; }
  int RowHeaderWidth() override { return 40; }

  // Gives the column of the value.
  template <class Access, class Entry>
  Column& ValueOrFileColumns(Access entry, const ValueOrFile<Entry>& columns) {
    List(columns.formatHeader, columns.formatWidth, entry, columns.format, columns.formats);
    Column& value = Number(columns.valueHeader, columns.valueWidth, entry, columns.value, columns.quantity)
                        .EnabledIf(columns.takesValue);
    File(columns.file);
    return value;
  }
};

}  // namespace gridbay

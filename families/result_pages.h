#pragma once

#include <string>

#include "basic/page_texts.h"
#include "families/page_texts.h"
#include "families/result_output.h"
#include "families/result_texts.h"
#include "pages/cell_grid.h"

// What the pages of outputs of all modules have alike.

namespace gridbay {

// The file that is written of an output of that extent.
FileKind resultFileKind(Extent extent);

// Lets the user choose the part of an area's grid and the steps in a dialog; true when he did. Without the
// area that is told. A part that is a line has no width when it is pointed at on a map.
bool chooseResultPart(CVdDoc& document, const ResultLimits& limits, std::int32_t area, USubArea& part,
                      USubLine& steps, bool isLine = false);
// Whether there is an area; that there is none is told.
bool hasAreaOrTells(CVdDoc& document, const ResultLimits& limits);

// The caption of the box that has hot start files written: when it is checked, with their size.
std::string hotStartCaption(std::string_view label, bool isOn, double megabytes);

namespace result_pages_detail {

template <class Room, class Pointer>
Room roomOf(Pointer Room::*);

}  // namespace result_pages_detail

// A grid with a button for the choice of a file beside its name, below "...". What is chosen there has the
// name of the file's column.
class ResultFileGrid : public ColumnGrid {
 protected:
  Column& BrowseBeside(const FileChoice& file);
  std::string editName(int row, int col) override;
};

// A row for each area: its hot start file. `results` is the member of a room that holds the module's results,
// with the files in `hotStarts` and the flag `generateHotStart`.
template <auto results, const FileKind& kind = texts::hotStartFile>
class ResultHotStartGrid final : public ResultFileGrid {
  using Room = decltype(result_pages_detail::roomOf(results));

  void LayOut() override {
    const auto holder = [this]() -> auto& {
      return *(parts<Room>().*results);
    };
    const auto hotStart = [holder](GridRow row) { return holder().hotStarts.GetItem(row.item); };
    const Column::Rule isOn = [holder](GridRow) { return holder().generateHotStart; };
    using HotStart = std::remove_pointer_t<decltype(hotStart(GridRow{}))>;
    Rows([holder] { return holder().hotStarts.GetCount(); });
    const FileChoice file = resultFileOf(hotStart, &HotStart::file, kind);
    FileName("Hot Start File", 230, file).EnabledIf(isOn);
    BrowseBeside(file).EnabledIf(isOn);
    Text("Title", 140, hotStart, &HotStart::title).EnabledIf(isOn);
    View(texts::view.format, 45, file);
  }
};

}  // namespace gridbay

#include "families/line_box_page.h"

#include "families/entry_selection.h"
#include "families/page_texts.h"

namespace gridbay {

PlaceDlg::PlaceDlg(CVdDoc& document, const PlaceTexts& texts, const LineOrBox& item)
    : CV27SetupDialog(document, texts.title), copy_(item) {
  const auto copy = [this]() -> LineOrBox& { return copy_; };
  const auto point = [&](std::string_view label, GridPoint LineOrBox::*member) {
    const auto held = [copy, member]() -> GridPoint& { return copy().*member; };
    FieldPick pick;
    const Control& frame = form().Group(label, [&] {
      pick.fields = {&form().Number("J", held, &GridPoint::j),
                     &form().Number("K", held, &GridPoint::k).Beside()};
    });
    pick.wanted = [copy, held, name = frame.name()] {
      return CellPick{.name = name, .area = copy().areaNumber, .held = {{.point = held()}}};
    };
    pick.take = [held](std::span<const PickedPlace> places) { held() = places.front().point; };
    AddPick(std::move(pick));
  };
  point(texts.first, &LineOrBox::first);
  point(texts.last, &LineOrBox::last);
  form().Group("Calculation Period", [&] {
    const auto steps = [copy]() -> USubLine& { return copy().steps; };
    form().Number("First time step:", steps, &USubLine::first);
    form().Number("Last time step:", steps, &USubLine::last).Beside();
  });
}

void PlaceDlg::OnOK(LineOrBox& item) const {
  item.first = copy_.first;
  item.last = copy_.last;
  item.steps = copy_.steps;
}

void LineOrBoxGrid::LayOut() {
  const auto item = [this](GridRow row) { return list_().GetLineOrBox(row.item); };
  const FileChoice file = resultFileOf(item, &LineOrBox::file, texts::massFile);
  Rows([this] { return list_().GetCount(); });
  Integer("Area", 45, item, &LineOrBox::areaNumber);
  Button("...", 20, [this, item](GridRow row) {
    if (choosePlace_(document(), *item(row))) UpdateDoc();
  });
  const auto area = [item](GridRow row) { return item(row)->areaNumber; };
  Point("First", 70, item, &LineOrBox::first).OfArea(area);
  Point("Last", 70, item, &LineOrBox::last).OfArea(area);
  Range(
      "Period", 70, [item](GridRow row) { return &item(row)->steps; }, false);
  FileName("File name", 160, file);
  BrowseBeside(file);
  View(texts::view.format, 45, file);
  Text("Title", 120, item, &LineOrBox::title);
  Button("Items...", 60, [this, item](GridRow row) {
    const std::string whose = (list_().kind().isLine ? "Line " : "Box ") + std::to_string(row.item);
    if (chooseEntries(document(), whose, list_().entryNames(), item(row)->entries)) UpdateDoc();
  });
}

void listLineOrBoxControls(Form& form, const LineOrBoxGrid::List& list, LineOrBoxGrid& grid) {
  const bool isLine = list().kind().isLine;
  form.Count(isLine ? "Number of Lines" : "Number of Boxes", countOf(list), LineOrBoxList::kMost);
  form.Shown("Output Size", [list] { return formatted(texts::megabytes, list().size()); }).Beside();
  form.Grid(isLine ? "Lines" : "Boxes", grid);
}

}  // namespace gridbay

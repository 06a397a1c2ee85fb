#include "plugin/series_rehearsal.h"

#include <algorithm>

#include "pages/grid_wnd.h"

namespace gridbay {
namespace {

KvsHandle fileOf(CV27SetupDoc& document) {
  // A save may leave out what can't be written, of a copy only.
  CGlobalKvs copy;
  copy.AssignState(document.root());
  KvsHandle file = kvsCreate();
  copy.Save(*file, document.path());
  return file;
}

}  // namespace

SeriesRehearsal::SeriesRehearsal(CV27SetupDoc& document, const std::string& file)
    : document_(document),
      giver_(file),
      file_(fileOf(document)),
      model_(*file_, document.path(), document.units(), &giver_) {
  model_.assign(document.root());
}

Control& SeriesRehearsal::controlOf(const SeriesPlace& place, int control) {
  return model_.page(place.page)->form().controls()[static_cast<std::size_t>(control)];
}

CV27SetupGridWnd* SeriesRehearsal::masterOf(CV27SetupFormView& page) {
  for (const Control& control : page.form().controls()) {
    if (control.grid != nullptr && control.grid->CurrentRow()) return control.grid;
  }
  return nullptr;
}

void SeriesRehearsal::show(CV27SetupFormView& page, int currentRow) {
  CV27SetupGridWnd* master = currentRow > 0 ? masterOf(page) : nullptr;
  if (master != nullptr) master->OnCurrentRow(currentRow);
  page.OnUpdate();
}

bool SeriesRehearsal::choose(const SeriesPlace& place) {
  CV27SetupFormView& page = *model_.page(place.page);
  Control& list = controlOf(place, place.format.control);
  bool isMade = false;
  if (list.grid != nullptr) {
    isMade = list.grid->StoreStyleRowCol(place.row, place.format.column, place.format.choice) != 0;
  } else {
    const auto at = std::ranges::find(list.choices, place.format.choice);
    const auto index = static_cast<std::size_t>(at - list.choices.begin());
    isMade = at != list.choices.end() && list.usable() &&
             (index >= list.choiceEnabled.size() || list.choiceEnabled[index]);
    if (isMade) list.index = static_cast<int>(index);
    if (isMade) page.form().act(list);
  }
  if (isMade) show(page, place.currentRow);
  return isMade;
}

void SeriesRehearsal::press(const SeriesPlace& place) {
  giver_.forget();
  Control& pressed = controlOf(place, place.control);
  if (pressed.grid == nullptr) {
    model_.page(place.page)->form().act(pressed);
  } else {
    pressed.grid->OnClickedButtonRowCol(place.row, place.column);
  }
}

void SeriesRehearsal::takeBack(const SeriesPlace& place) {
  model_.assign(document_.root());
  show(*model_.page(place.page), place.currentRow);
}

bool SeriesRehearsal::give(const SeriesPlace& place) {
  CV27SetupFormView* page = model_.isVisible(place.page) ? model_.page(place.page) : nullptr;
  if (page == nullptr) return false;
  show(*page, place.currentRow);
  const auto controls = static_cast<int>(page->form().controls().size());
  if (std::max(place.control, place.format.control) >= controls) return false;
  if (!place.format.choice.empty() && !choose(place)) return false;
  giver_.wish(place.items);
  press(place);
  return !giver_.ways().empty() && place.name.ends_with(model_.lastEdit());
}

}  // namespace gridbay

#include "plugin/series_places.h"

#include <algorithm>
#include <map>
#include <set>
#include <tuple>

#include "pages/grid_wnd.h"
#include "plugin/series_rehearsal.h"

namespace gridbay {
namespace {

constexpr std::size_t kMostPlaces = 200;
constexpr int kMostTrials = 300;  // of formats, on a page
constexpr int kEnough = 3;        // rows in which a format asked for no series

// The frame around a control, as what its name is said of; empty for none.
std::string frameOf(const Control& control) {
  for (const Control* group = control.group; group != nullptr; group = group->group) {
    if (const std::string name = group->name(); !name.empty()) return name + ", ";
  }
  return {};
}

// The button behind the edit of a file.
bool isBrowse(Form& form, int control) {
  const auto place = static_cast<std::size_t>(control);
  const Control& button = form.controls()[place];
  return place > 0 && button.kind == ControlKind::button && button.usable() &&
         form.controls()[place - 1].isFile;
}
bool isBrowse(const CellStyle& style) {
  return style.kind == CellKind::button && style.enabled && style.value.find("...") != style.value.npos &&
         !style.value.starts_with("View");
}

class PlaceFinder {
 public:
  PlaceFinder(CV27SetupDoc& document, const std::string& file) : copy_(document, file) {}

  // What asks for a series as it is, and then what does so with another format.
  SeriesPlaces find() {
    if (!copy_.giver().isReadable()) return {};
    for (const bool triesFormats : {false, true}) {
      triesFormats_ = triesFormats;
      others_.clear();
      for (const ComparedPage& page : copy_.model().pages()) {
        if (isFull()) break;
        if (copy_.model().isVisible(page.id) && copy_.model().page(page.id) != nullptr) findOn(page);
      }
      found_.others.insert(found_.others.end(), others_.begin(), others_.end());
    }
    return std::move(found_);
  }

 private:
  bool isFull() const { return found_.places.size() >= kMostPlaces; }

  void findOn(const ComparedPage& entry) {
    CV27SetupFormView& page = *copy_.model().page(entry.id);
    page.OnUpdate();
    trials_ = 0;
    CV27SetupGridWnd* master = SeriesRehearsal::masterOf(page);
    const int rows = master == nullptr ? 0 : master->GetRowCount();
    for (int current = std::min(rows, 1); current <= rows && !isFull(); ++current) {
      SeriesRehearsal::show(page, current);
      for (int i = 0; i < static_cast<int>(page.form().controls().size()) && !isFull(); ++i) {
        const Control& control = page.form().controls()[static_cast<std::size_t>(i)];
        const SeriesPlace place{
            .page = entry.id, .name = entry.caption + ": ", .currentRow = current, .control = i};
        if (control.grid != nullptr) {
          // Its rows are not of the row that is current.
          if (current <= 1 || control.grid != master) findIn(*control.grid, place);
        } else if (triesFormats_) {
          tryList(place);
        } else if (isBrowse(page.form(), i)) {
          tryAt(place);
        }
      }
    }
  }

  void findIn(CV27SetupGridWnd& grid, SeriesPlace place) {
    if (!grid.IsEnabled()) return;
    for (place.row = 1; place.row <= grid.GetRowCount() && !isFull(); ++place.row) {
      for (place.column = 1; place.column <= grid.GetColCount(); ++place.column) {
        CellStyle style;
        grid.GetStyleRowCol(place.row, place.column, style);
        if (triesFormats_ && style.kind == CellKind::dropDown && style.takesValue()) {
          tryFormats(place, style.choices, style.value);
        } else if (!triesFormats_ && isBrowse(style)) {
          tryAt(place);
        }
      }
    }
  }

  // A list of a page, or its radio buttons.
  void tryList(const SeriesPlace& place) {
    const Control& list = copy_.controlOf(place, place.control);
    const bool isList = list.kind == ControlKind::dropDown || list.kind == ControlKind::radio;
    if (!isList || !list.usable()) return;
    const auto now = static_cast<std::size_t>(list.index);
    tryFormats(place, list.choices, now < list.choices.size() ? list.choices[now] : std::string());
  }

  // Makes each choice of a list but the one that stands, and presses the buttons that come to life by it. The
  // list itself may follow what is chosen.
  void tryFormats(const SeriesPlace& list, std::vector<std::string> choices, const std::string& now) {
    for (const std::string& choice : choices) {
      int& vain = vain_[{list.page, list.control, list.column, choice}];
      if (choice == now || vain >= kEnough || trials_ >= kMostTrials || isFull()) continue;
      ++trials_;
      SeriesPlace place = list;
      place.format = {choice, list.control, list.column};
      if (copy_.choose(place) && !tryButtons(place)) ++vain;
      copy_.takeBack(place);
    }
  }

  // Whether one of the buttons on the page, or in the row of a table that the format stands in, asks for a
  // series.
  bool tryButtons(SeriesPlace place) {
    bool isAsked = false;
    if (CV27SetupGridWnd* grid = copy_.controlOf(place, place.control).grid) {
      for (place.column = 1; place.column <= grid->GetColCount(); ++place.column) {
        CellStyle style;
        grid->GetStyleRowCol(place.row, place.column, style);
        if (isBrowse(style)) isAsked = tryAt(place) || isAsked;
      }
      return isAsked;
    }
    Form& form = copy_.model().page(place.page)->form();
    for (place.control = 0; place.control < static_cast<int>(form.controls().size()); ++place.control) {
      if (isBrowse(form, place.control)) isAsked = tryAt(place) || isAsked;
    }
    return isAsked;
  }

  // Presses the button of a place, unless that is known to ask for a series already; whether it does. What
  // that has changed is taken back.
  bool tryAt(SeriesPlace place) {
    const Button button{place.page, place.currentRow, place.control, place.row, place.column};
    if (asked_.contains(button)) return false;
    if (place.row == 0) place.name += frameOf(copy_.controlOf(place, place.control));
    copy_.press(place);
    const SeriesGiver& giver = copy_.giver();
    if (!giver.isAsked()) return false;
    const bool isNew = !place.format.choice.empty();
    // With another format still it may take the series.
    if (!isNew || !giver.ways().empty()) asked_.insert(button);
    if (!giver.refused().empty()) others_.insert(place.name + giver.refused());
    if (giver.ways().empty()) return true;
    place.name += copy_.model().lastEdit();
    for (const SeriesGiver::Way& way : giver.ways()) {
      place.items = way.items;
      place.item = way.item;
      place.doubt = way.doubt;
      found_.places.push_back(place);
    }
    copy_.takeBack(place);
    if (isNew) copy_.choose(place);
    return true;
  }

  using Button = std::tuple<std::int32_t, int, int, int, int>;
  using Format = std::tuple<std::int32_t, int, int, std::string>;

  SeriesRehearsal copy_;
  SeriesPlaces found_;
  std::set<std::string> others_;
  bool triesFormats_ = false;
  std::set<Button> asked_;      // that need no format any more
  std::map<Format, int> vain_;  // how often a choice has led to no series
  int trials_ = 0;              // on the page
};

}  // namespace

SeriesPlaces findSeriesPlaces(CV27SetupDoc& document, const std::string& file) {
  return PlaceFinder(document, file).find();
}

std::string putSeries(CV27SetupDoc& document, const std::string& file, const SeriesPlace& place) {
  SeriesRehearsal copy(document, file);
  if (!copy.give(place)) return "The page does not ask for such a file any more";
  const bool isTaken = document.Attempt([&] { document.root().AssignState(copy.model().root()); });
  if (!isTaken) return "The file can't be taken there";
  const auto id = static_cast<PageId>(place.page);
  document.Touch(id);
  document.SetModifiedFlag();
  document.RecordEdit(id, copy.model().lastEdit());
  document.UpdateAllViews(nullptr);
  return {};
}

}  // namespace gridbay

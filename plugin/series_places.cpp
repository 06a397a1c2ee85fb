#include "plugin/series_places.h"

#include <algorithm>
#include <set>

#include "compare/compared_model.h"
#include "pages/grid_wnd.h"
#include "setup/setup_doc.h"

namespace gridbay {
namespace {

constexpr std::size_t kMostPlaces = 200;
constexpr std::string_view kSeries = "tsb0";

// Answers who asks for a file: with the series, where it is one that is asked for.
class SeriesGiver final : public NoHost {
 public:
  explicit SeriesGiver(std::string file) : file_(std::move(file)) {
    isReadable_ = tsbFileRead(file_, &header_) == 0;
  }

  // The items that are to be taken; none for whichever fit.
  void wish(std::vector<std::uint32_t> items) { wished_ = std::move(items); }
  bool isReadable() const { return isReadable_; }
  const std::string& file() const { return file_; }

  // One way of taking the series.
  struct Way {
    std::vector<std::uint32_t> items = {};
    std::string item = {};
    std::string doubt = {};
  };
  // What the last button has led to: the ways, or what was asked for in place of them.
  void forget() {
    ways_.clear();
    refused_.clear();
  }
  const std::vector<Way>& ways() const { return ways_; }
  const std::string& refused() const { return refused_; }

  bool choose(CVdFileSelectorDlg& selector) override {
    // Some name no extension of their own.
    const bool isOfSeries =
        selector.kind() == kSeries || selector.filter().find(kSeries) != std::string::npos;
    if (!isReadable_ || !isOfSeries) return false;
    findWays(selector);
    if (ways_.empty()) return false;
    selector.SetFileName(file_);
    if (!selector.GetSelectedItems().empty())
      selector.SetSelectedItems(wished_.empty() ? ways_.front().items : wished_);
    return true;
  }

 private:
  std::vector<std::uint32_t> itemsFor(const CVdRqTsbItem& request) const {
    std::vector<std::uint32_t> fitting;
    for (int number = 1; number <= tsbGetNoOfItems(header_); ++number) {
      if (request.fault(header_, number).empty()) fitting.push_back(static_cast<std::uint32_t>(number));
    }
    return fitting;
  }
  std::string nameOf(std::uint32_t item) { return tsbItemD(header_, static_cast<int>(item))->name; }

  void findWays(const CVdFileSelectorDlg& selector) {
    std::vector<std::vector<std::uint32_t>> fitting;
    for (const auto& request : selector.requests()) {
      fitting.push_back(itemsFor(*request));
      if (!fitting.back().empty()) continue;
      refused_ = request->description();
      return;
    }
    const std::size_t chosen = selector.GetSelectedItems().size();
    std::string why;
    if (chosen == 0 || fitting.empty()) {
      selector.IsTsbFileValid(file_, &why);
      ways_.push_back({std::vector<std::uint32_t>(chosen, 1), {}, why});
      return;
    }
    // Where one item is asked for each that fits will do.
    const std::size_t count = fitting.size() == 1 ? fitting.front().size() : 1;
    for (std::size_t n = 0; n < count; ++n) {
      Way way{.items = selector.GetSelectedItems()};
      for (std::size_t i = 0; i < std::min(chosen, fitting.size()); ++i)
        way.items[i] = fitting[i][i == 0 ? n : std::min(i, fitting[i].size() - 1)];
      if (fitting.size() == 1) way.item = nameOf(way.items.front());
      why.clear();
      if (!selector.IsTsbFileValid(file_, way.items, &why)) way.doubt = why;
      ways_.push_back(std::move(way));
    }
  }

  std::string file_;
  TsbHeader header_;
  bool isReadable_ = false;
  std::vector<std::uint32_t> wished_;
  std::vector<Way> ways_;
  std::string refused_;
};

KvsHandle fileOf(CV27SetupDoc& document) {
  // A save may leave out what can't be written, of a copy only.
  CGlobalKvs copy;
  copy.AssignState(document.root());
  KvsHandle file = kvsCreate();
  copy.Save(*file, document.path());
  return file;
}

// A copy of a document whose buttons are pressed with nobody to see it.
class Rehearsal {
 public:
  Rehearsal(CV27SetupDoc& document, const std::string& file)
      : document_(document),
        giver_(file),
        file_(fileOf(document)),
        model_(*file_, document.path(), document.units(), &giver_) {
    model_.assign(document.root());
  }

  SeriesPlaces find() {
    if (!giver_.isReadable()) return {};
    for (const ComparedPage& page : model_.pages()) {
      if (isFull()) break;
      if (model_.isVisible(page.id) && model_.page(page.id) != nullptr) findOn(page);
    }
    found_.others.assign(others_.begin(), others_.end());
    return std::move(found_);
  }

  std::string put(const SeriesPlace& place) {
    const std::string gone = "The page does not ask for such a file any more";
    CV27SetupFormView* page = model_.isVisible(place.page) ? model_.page(place.page) : nullptr;
    if (page == nullptr) return gone;
    show(*page, masterOf(*page), place.currentRow);
    if (place.control >= static_cast<int>(page->form().controls().size())) return gone;
    giver_.wish(place.items);
    press(*page, place.control, place.row, place.column);
    if (giver_.ways().empty() || !place.name.ends_with(model_.lastEdit())) return gone;
    const bool isTaken = document_.Attempt([this] { document_.root().AssignState(model_.root()); });
    if (!isTaken) return "The file can't be taken there";
    const auto id = static_cast<PageId>(place.page);
    document_.Touch(id);
    document_.SetModifiedFlag();
    document_.RecordEdit(id, model_.lastEdit());
    document_.UpdateAllViews(nullptr);
    return {};
  }

 private:
  bool isFull() const { return found_.places.size() >= kMostPlaces; }
  // The table whose current row decides what the rest of the page shows; null for none.
  static CV27SetupGridWnd* masterOf(CV27SetupFormView& page) {
    for (const Control& control : page.form().controls()) {
      if (control.grid != nullptr && control.grid->CurrentRow()) return control.grid;
    }
    return nullptr;
  }
  static void show(CV27SetupFormView& page, CV27SetupGridWnd* master, int currentRow) {
    if (master != nullptr && currentRow > 0) master->OnCurrentRow(currentRow);
    page.OnUpdate();
  }

  void findOn(const ComparedPage& entry) {
    CV27SetupFormView& page = *model_.page(entry.id);
    page.OnUpdate();
    CV27SetupGridWnd* master = masterOf(page);
    const int rows = master == nullptr ? 0 : master->GetRowCount();
    for (int current = std::min(rows, 1); current <= rows && !isFull(); ++current) {
      show(page, master, current);
      for (int i = 0; i < static_cast<int>(page.form().controls().size()) && !isFull(); ++i) {
        const Control& control = page.form().controls()[static_cast<std::size_t>(i)];
        if (control.grid != nullptr) {
          // Its rows are not of the row that is current.
          if (current <= 1 || control.grid != master) findIn(entry, *control.grid, current, i);
        } else if (isBrowse(page.form(), i)) {
          tryAt({.page = entry.id,
                 .name = entry.caption + ": " + frameOf(control),
                 .currentRow = current,
                 .control = i});
        }
      }
    }
  }
  // The frame around a control, as what its name is said of; empty for none.
  static std::string frameOf(const Control& control) {
    for (const Control* group = control.group; group != nullptr; group = group->group) {
      if (const std::string name = group->name(); !name.empty()) return name + ", ";
    }
    return {};
  }
  // The button behind the edit of a file.
  static bool isBrowse(Form& form, int control) {
    const auto place = static_cast<std::size_t>(control);
    const Control& button = form.controls()[place];
    return place > 0 && button.kind == ControlKind::button && button.usable() &&
           form.controls()[place - 1].isFile;
  }

  void findIn(const ComparedPage& entry, CV27SetupGridWnd& grid, int current, int control) {
    if (!grid.IsEnabled()) return;
    for (int row = 1; row <= grid.GetRowCount() && !isFull(); ++row) {
      for (int column = 1; column <= grid.GetColCount(); ++column) {
        CellStyle style;
        grid.GetStyleRowCol(row, column, style);
        const bool browses = style.kind == CellKind::button && style.enabled &&
                             style.value.find("...") != style.value.npos && !style.value.starts_with("View");
        if (browses)
          tryAt({.page = entry.id,
                 .name = entry.caption + ": ",
                 .currentRow = current,
                 .control = control,
                 .row = row,
                 .column = column});
      }
    }
  }

  void press(CV27SetupFormView& page, int control, int row, int column) {
    giver_.forget();
    Control& pressed = page.form().controls()[static_cast<std::size_t>(control)];
    if (pressed.grid == nullptr) {
      page.form().act(pressed);
    } else {
      pressed.grid->OnClickedButtonRowCol(row, column);
    }
  }

  // Presses the button of a place. What that has changed is taken back.
  void tryAt(SeriesPlace place) {
    CV27SetupFormView& page = *model_.page(place.page);
    press(page, place.control, place.row, place.column);
    if (!giver_.refused().empty()) others_.insert(place.name + giver_.refused());
    if (giver_.ways().empty()) return;
    place.name += model_.lastEdit();
    for (const SeriesGiver::Way& way : giver_.ways()) {
      place.items = way.items;
      place.item = way.item;
      place.doubt = way.doubt;
      found_.places.push_back(place);
    }
    model_.assign(document_.root());
    show(page, masterOf(page), place.currentRow);
  }

  CV27SetupDoc& document_;
  SeriesGiver giver_;
  KvsHandle file_;
  ComparedModel model_;
  SeriesPlaces found_;
  std::set<std::string> others_;
};

}  // namespace

SeriesPlaces findSeriesPlaces(CV27SetupDoc& document, const std::string& file) {
  return Rehearsal(document, file).find();
}

std::string putSeries(CV27SetupDoc& document, const std::string& file, const SeriesPlace& place) {
  return Rehearsal(document, file).put(place);
}

}  // namespace gridbay

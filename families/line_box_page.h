#pragma once

#include <functional>

#include "families/line_box.h"
#include "families/result_pages.h"
#include "pages/dialog.h"

namespace gridbay {

// What the dialog for the place and the period of a line or box says.
struct PlaceTexts {
  std::string_view title;
  std::string_view first;
  std::string_view last;
};

// That dialog, over a copy.
class PlaceDlg : public CV27SetupDialog {
 public:
  PlaceDlg(CVdDoc& document, const PlaceTexts& texts, const LineOrBox& item);
  // Gives the copy back.
  void OnOK(LineOrBox& item) const;

 private:
  LineOrBox copy_;
};

// A row for each line or box.
class LineOrBoxGrid final : public ResultFileGrid {
 public:
  // The list, and the dialog for a place: true when the item has another one.
  using List = std::function<LineOrBoxList&()>;
  using ChoosePlace = bool (*)(CVdDoc&, LineOrBox&);
  LineOrBoxGrid(List list, ChoosePlace choosePlace) : list_(std::move(list)), choosePlace_(choosePlace) {}

 private:
  void LayOut() override;

  List list_;
  ChoosePlace choosePlace_;
};

// The page of the list which is the member `list` of a room. `PlaceDialog` is the class of its dialog.
template <std::int32_t dialogTemplate, PageId id, auto list, class PlaceDialog>
class LineOrBoxDlg : public Page<dialogTemplate, id> {
  using Room = decltype(result_pages_detail::roomOf(list));

 public:
  explicit LineOrBoxDlg(CVdDoc& document)
      : Page<dialogTemplate, id>(document),
        grid_([this]() -> LineOrBoxList& { return *(this->template parts<Room>().*list); }, choosePlace) {}

 private:
  void DoDataExchange(Form& form) override { listLineOrBoxControls(form, this->objectOf(list), grid_); }

  static bool choosePlace(CVdDoc& document, LineOrBox& item) {
    PlaceDialog dialog(document, item);
    if (dialog.DoModal() != 1) return false;
    dialog.OnOK(item);
    return true;
  }

  LineOrBoxGrid grid_;
};

void listLineOrBoxControls(Form& form, const LineOrBoxGrid::List& list, LineOrBoxGrid& grid);

}  // namespace gridbay

#pragma once

#include <functional>

#include "families/mass_budget.h"
#include "families/result_pages.h"

namespace gridbay {

// A row for each mass file.
class MassFileGrid final : public ResultFileGrid {
 public:
  using List = std::function<MassFileList&()>;
  explicit MassFileGrid(List list) : list_(std::move(list)) {}

 private:
  void LayOut() override;
  std::string CornerHeader() override { return "File"; }

  List list_;
};

void listMassBudgetControls(Form& form, const MassFileGrid::List& list, MassFileGrid& grid);

// The page of the list which is the member `list` of a room.
template <std::int32_t dialogTemplate, PageId id, auto list>
class MassFilesDlg : public Page<dialogTemplate, id> {
  using Room = decltype(result_pages_detail::roomOf(list));

 public:
  explicit MassFilesDlg(CVdDoc& document)
      : Page<dialogTemplate, id>(document),
        grid_([this]() -> MassFileList& { return *(this->template parts<Room>().*list); }) {}

 private:
  void DoDataExchange(Form& form) override { listMassBudgetControls(form, this->objectOf(list), grid_); }

  MassFileGrid grid_;
};

}  // namespace gridbay

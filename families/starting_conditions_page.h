#pragma once

#include <memory>

#include "families/page_texts.h"
#include "pages/cell_grid.h"

// The page of a module's starting conditions; `conditions` is the member of the module's parts that holds
// them.

namespace gridbay {

// The hot start file of each area.
template <auto conditions>
class HotStartGrid final : public ColumnGrid {
  void LayOut() override {
    const auto area = RowsOf(conditions);
    using HotFile = std::remove_pointer_t<decltype(area(GridRow{}))>;
    const auto isHot = [holder = host().objectOf(conditions)](GridRow) { return holder().hotStart; };
    const FileChoice file = fileOf(area, &HotFile::file, texts::hotStartFile, &HotFile::RequestFile);
    FileName("Hot Start File", 230, file);
    Browse("...", 30, file).EnabledIf(isHot);
    View("View...", 45, file, isHot);
  }
};

// A module that begins when the flow does.
template <auto conditions, std::int32_t dialogTemplate, PageId id>
class HotStartPage : public Page<dialogTemplate, id> {
 public:
  using Page<dialogTemplate, id>::Page;

 protected:
  // What a module has above the type, and below it.
  virtual void AddAbove(Form&) {}
  virtual void AddBelow(Form&) {}
  auto holder() { return this->objectOf(conditions); }

 private:
  void DoDataExchange(Form& form) final {
    AddAbove(form);
    using Object = std::remove_reference_t<decltype(holder()())>;
    form.Radio("Type", Choices::numbered({"Cold start", "Hot start"}), holder(), &Object::hotStart);
    AddBelow(form);
    form.Grid("Hot start files", grid_);
  }

  HotStartGrid<conditions> grid_;
};

// A module with time steps of its own.
template <auto conditions, std::int32_t dialogTemplate, PageId id>
class StartingConditionsPage : public HotStartPage<conditions, dialogTemplate, id> {
 public:
  using HotStartPage<conditions, dialogTemplate, id>::HotStartPage;

 private:
  void AddAbove(Form& form) final {
    form.Group("Simulation Period", [&] {
      form.Group("Time step range:", [&] {
        const auto object = this->holder();
        using Object = std::remove_reference_t<decltype(object())>;
        form.Number("First:", object, &Object::firstStep);
        form.Number("Last:", object, &Object::lastStep).Beside();
      });
    });
  }
};

}  // namespace gridbay

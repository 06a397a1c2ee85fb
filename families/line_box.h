#pragma once

#include <cstdint>
#include <string>
#include <string_view>
#include <vector>

#include "core/file_name.h"
#include "core/grid_point.h"
#include "core/list_kvs.h"
#include "core/page_id.h"
#include "core/selections.h"
#include "families/entry_flags.h"

// Transport through lines, and masses in boxes: of each a place on the grid of an area, a period, and a file
// that the engine writes. The modules differ in their keywords and in the pages of their messages.

namespace gridbay {

// A line, by its ends, or a box, by its lower left and upper right corner. J, K and time steps from 0.
struct LineOrBox {
  std::int32_t areaNumber = 1;  // from 1
  GridPoint first;
  GridPoint last;
  USubLine steps;  // the interval is not used
  UResultFileName file;
  std::string title;
  EntryFlags entries;
};

// What tells the lines or boxes of a module from those of others.
struct LineOrBoxKind {
  bool isLine;
  bool loadsPeriod;  // under the keywords that it is saved with; else it is looked for under older ones
  std::string_view section;
  std::string_view count;
  std::string_view item;
  PageId page;
  PageId areaPage;   // to which an area that does not exist is told
  PageId countPage;  // to which it is told that there are too many
};

// All lines or all boxes of a module, as a page sees them.
class LineOrBoxList {
 public:
  static constexpr int kMost = 10;

  virtual const LineOrBoxKind& kind() const = 0;
  virtual int GetCount() const = 0;
  virtual void SetCount(int count) = 0;
  // From 1; null out of range.
  virtual LineOrBox* GetLineOrBox(int number) = 0;
  // The module's entries by their names.
  virtual std::vector<std::string> entryNames() = 0;
  // Megabytes that the engine will write. The entries of each are counted again for all that follow.
  virtual float size() = 0;

 protected:
  ~LineOrBoxList() = default;
};

// The defaults of number `number`, from 1: the areas in turn, the whole area, the whole simulation.
void startLineOrBox(LineOrBox& item, CKvsBase& object, int number, std::size_t entries);
// The checks of a line or box, in the order of its kind. Return the number of faults.
unsigned checkLineOrBox(ValidationList& messages, CKvsBase& object, const LineOrBox& item,
                        const LineOrBoxKind& kind);
unsigned checkLineOrBoxCount(ValidationList& messages, int count, const LineOrBoxKind& kind);
float sizeOfLinesOrBoxes(LineOrBoxList& list, CKvsBase& object);

// `Module` has the kind, as `static constexpr LineOrBoxKind kKind`.
template <class Module>
class LineOrBoxObjectKvs final : public TableKvs<LineOrBoxObjectKvs<Module>>, public LineOrBox {
 public:
  using TableKvs<LineOrBoxObjectKvs>::TableKvs;

  static constexpr auto table() {
    return keywords(keyword("Area_Number", &LineOrBox::areaNumber),
                    keyword("Start_Coordinate", &LineOrBox::first),
                    keyword("End_Coordinate", &LineOrBox::last), stepsRow(),
                    keyword("File_Name", &LineOrBox::file), keyword("Title", &LineOrBox::title),
                    numbersThenCount("Component_Numbers", "No_of_Components_in_Calc", &LineOrBox::entries));
  }

  unsigned Validate(ValidationList& messages, int) override {
    return checkLineOrBox(messages, *this, *this, Module::kKind);
  }

 private:
  static constexpr auto stepsRow() {
    constexpr auto kSaved = subLine("Start_Time_Step", "End_Time_Step", {}, &LineOrBox::steps);
    if constexpr (Module::kKind.loadsPeriod) {
      return kSaved;
    } else {
      return loadedAs(kSaved, subLine("First_Time_Step", "Last_Time_Step", {}, &LineOrBox::steps));
    }
  }
};

// `Module` also has `static std::vector<std::string> entryNames(CKvsBase& object)`, the entries of the model
// in which an object stands.
template <class Module>
class LineOrBoxKvs : public ListKvs<LineOrBoxKvs<Module>, LineOrBoxObjectKvs<Module>>, public LineOrBoxList {
  using List = ListKvs<LineOrBoxKvs, LineOrBoxObjectKvs<Module>>;

 public:
  using List::List;

  static constexpr auto table() {
    return section(Module::kKind.section, count(Module::kKind.count), items(Module::kKind.item));
  }

  void initialise(LineOrBoxObjectKvs<Module>& item, int number) {
    startLineOrBox(item, *this, number, entryNames().size());
  }

  unsigned Validate(ValidationList& messages, int deep) override {
    const unsigned faults = checkLineOrBoxCount(messages, GetCount(), kind());
    return faults + List::Validate(messages, deep);
  }

  // A flag for each of the module's entries; new ones are chosen. A negative count does nothing.
  void SetEntryCount(int entries) {
    if (entries < 0) return;
    for (int number = 1; number <= GetCount(); ++number)
      this->GetItem(number)->entries.resize(static_cast<std::size_t>(entries), 1);
  }

  const LineOrBoxKind& kind() const override { return Module::kKind; }
  int GetCount() const override { return List::GetCount(); }
  void SetCount(int count) override { List::SetCount(count); }
  LineOrBox* GetLineOrBox(int number) override { return this->GetItem(number); }
  std::vector<std::string> entryNames() override { return Module::entryNames(*this); }
  float size() override { return sizeOfLinesOrBoxes(*this, *this); }
};

}  // namespace gridbay

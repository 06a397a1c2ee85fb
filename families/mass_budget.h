#pragma once

#include <cstdint>
#include <string>
#include <vector>

#include "core/file_name.h"
#include "core/list_kvs.h"
#include "core/page_id.h"
#include "core/selections.h"
#include "families/entry_flags.h"
#include "families/starting_conditions.h"
#include "families/texts.h"

// The masses in the polygons of the model, each written to a file. The modules differ in the keywords of the
// count and of the entries.

namespace gridbay {

struct MassFile {
  std::int32_t polygon = 1;  // from 1
  USubLine steps;            // from 0
  UResultFileName file;
  std::string title;
  EntryFlags entries{1};  // of the module; those without a flag are not chosen
  EntryFlags variables;   // of the polygon as a whole, in a module that has such
};

// All mass files of a module, as a page sees them.
class MassFileList {
 public:
  static constexpr int kMostOnPage = 300;

  virtual int GetCount() const = 0;
  virtual void SetCount(int count) = 0;
  // From 1; null out of range.
  virtual MassFile* GetMassFile(int number) = 0;
  // The module's entries by their names.
  virtual std::vector<std::string> entryNames() = 0;
  // The further variables that a file can have.
  virtual std::vector<std::string> variableNames() { return {}; }

 protected:
  ~MassFileList() = default;
};

// The checks, in their order. Returns the number of faults.
unsigned checkMassFile(ValidationList& messages, CKvsBase& object, PageId page, const MassFile& item);

// `Module` has
//   static constexpr PageId kPage
//   static constexpr auto entryRows()   the rows of the entries, as countThenNumbers(..., &MassFile::entries)
//   using Item                          what an item holds: MassFile, or what derives from it
//   static std::vector<std::string> entryNames(CKvsBase& object)
// and where it has further variables
//   static std::vector<std::string> variableNames()
template <class Module>
class MassFileKvs final : public TableKvs<MassFileKvs<Module>>, public Module::Item {
  using Self = MassFileKvs;

 public:
  using TableKvs<MassFileKvs>::TableKvs;

  static constexpr auto table() {
    return keywords(keyword("AssociatedPolygon", &MassFile::polygon), keyword("TRange", &MassFile::steps),
                    keyword("FILE_NAME", &MassFile::file), keyword("Title", &MassFile::title),
                    Module::entryRows());
  }

  unsigned Validate(ValidationList& messages, int) override {
    return checkMassFile(messages, *this, Module::kPage, *this);
  }

  int entryCount() { return static_cast<int>(Module::entryNames(*this).size()); }
};

// `Module` also has `static constexpr std::string_view kCount`, the keyword of the count.
template <class Module>
class MassFilesKvs : public ListKvs<MassFilesKvs<Module>, MassFileKvs<Module>>, public MassFileList {
  using List = ListKvs<MassFilesKvs, MassFileKvs<Module>>;

 public:
  using List::List;

  static constexpr auto table() {
    return section("MASS_BUDGET", count(Module::kCount),
                   items("MASS_FILE_%d", texts::massFileSectionMissing));
  }

  void initialise(MassFileKvs<Module>& item, int) { item.steps.last = lastTimeStep(*this); }

  int GetCount() const override { return List::GetCount(); }
  void SetCount(int count) override { List::SetCount(count); }
  MassFile* GetMassFile(int number) override { return this->GetItem(number); }
  std::vector<std::string> entryNames() override { return Module::entryNames(*this); }
  std::vector<std::string> variableNames() override {
    if constexpr (requires { Module::variableNames(); }) {
      return Module::variableNames();
    } else {
      return {};
    }
  }
};

}  // namespace gridbay

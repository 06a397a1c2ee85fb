#pragma once

#include <cstdint>
#include <map>
#include <memory>
#include <string>

#include "compare/page_contents.h"
#include "pages/form_view.h"
#include "pages/no_host.h"
#include "setup/global_kvs.h"
#include "setup/navigation_tree.h"

namespace gridbay {

// A page by its id, with the roots of the tree among them.
struct ComparedPage {
  std::int32_t id;
  std::string caption;  // with that of its root, as several pages are called "Boundary"
};

// A model of its own whose pages can be read, for a setup that is beside another one. Nobody is asked or told
// anything, and no edit is kept.
class ComparedModel final : private CVdDoc {
 public:
  // The model of a file of a setup, which must outlive it, with file names that start from the folder of
  // `path`. What its pages ask is declined, or asked of a host, which must outlive it too.
  ComparedModel(const KvsFile& file, const std::string& path, const UnitChoices& units,
                NoHost* host = nullptr);
  ~ComparedModel() override;

  CGlobalKvs& root() { return *root_; }
  // Takes over another state, and has the pages show it.
  void assign(CGlobalKvs& other);
  // What a save would write.
  KvsHandle file();

  // The items of the tree in the order of the screen, and whether one is seen.
  std::vector<ComparedPage> pages() const;
  bool isVisible(std::int32_t page) const { return tree_.IsVisible(page); }
  void setUnits(const UnitChoices& units) { CVdDoc::units() = units; }
  // Works out anew which items are seen.
  void showTree() { tree_.OnUpdate(root_.get()); }
  // What a page shows; nothing where it has no controls.
  PageContents contents(std::int32_t page);
  // The page itself; null where there is none. It lives as long as the model.
  CV27SetupFormView* page(std::int32_t id);
  // What an undo would call the last edit that was made on a page.
  const std::string& lastEdit() const { return lastEdit_; }

 private:
  CKvsBase& GetKvs() override { return *root_; }
  void RecordEdit(PageId, std::string name, bool) override { lastEdit_ = std::move(name); }
  void TakeBackUnrecorded() override {}

  static NoHost& noHost();

  std::unique_ptr<CGlobalKvs> root_;
  std::string lastEdit_;
  CDlgEnumerator enumerator_;
  CNavigationView tree_{enumerator_};
  std::map<std::int32_t, std::unique_ptr<CV27SetupFormView>> pages_;
};

}  // namespace gridbay

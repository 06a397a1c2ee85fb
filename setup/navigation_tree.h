#pragma once

#include <cstdint>
#include <span>
#include <string>
#include <string_view>
#include <vector>

#include "setup/dlg_enumerator.h"
#include "setup/global_kvs.h"

namespace gridbay {

// An item of the navigation tree, by its page id.
struct TreeItem {
  std::int32_t id;
  std::string caption;
  int parent;  // its place in the list of items, -1 for a root
  int depth;
  bool shown = true;  // its own flag; a hidden parent hides it all the same
};

// The tree of all pages, built once; after every change the rules work out from the model which items apply.
class CNavigationView {
 public:
  explicit CNavigationView(const CDlgEnumerator& enumerator) : enumerator_(enumerator) {}

  // Builds the tree in the order of the screen, and applies the rules.
  void OnInitialUpdate(CGlobalKvs* root);
  // Applies the rules to the model; without one it does nothing.
  void OnUpdate(CGlobalKvs* root);

  int AddRootItem(std::string_view caption, std::int32_t id);
  int AddTreeItem(int parent, std::int32_t id);
  // Marks the item shown or hidden; an id that the tree does not have is passed over.
  void Show(std::int32_t id, bool shown);

  std::span<const TreeItem> items() const { return items_; }
  // The item's own flag, and whether it is seen: shown, and all that is above it too.
  bool IsShown(std::int32_t id) const;
  bool IsVisible(std::int32_t id) const;
  bool IsVisible(const TreeItem& item) const;

 private:
  const TreeItem* find(std::int32_t id) const;

  const CDlgEnumerator& enumerator_;
  std::vector<TreeItem> items_;
};

}  // namespace gridbay

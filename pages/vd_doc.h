#pragma once

#include <functional>
#include <set>
#include <string>
#include <string_view>
#include <utility>
#include <vector>

#include "core/kvs_base.h"
#include "core/page_id.h"
#include "pages/host.h"
#include "platform/units/edit_style.h"

namespace gridbay {

class CV27SetupFormView;
class CV27SetupGridWnd;

// A document as its pages see it: the root of the model, and what the pages of one setup share.
class CVdDoc {
 public:
  explicit CVdDoc(SetupHost& host) : host_(host) {}
  CVdDoc(const CVdDoc&) = delete;
  CVdDoc& operator=(const CVdDoc&) = delete;
  virtual ~CVdDoc() = default;

  virtual CKvsBase& GetKvs() = 0;
  SetupHost& host() { return host_; }
  UnitChoices& units() { return units_; }
  const UnitChoices& units() const { return units_; }

  // The setup's file; empty until it has one.
  const std::string& path() const { return path_; }
  // The absolute form of a file name in the setup.
  std::string getAbsoluteFilepath(const std::string& name) const;

  // A page has brought an edit into the model: it can be taken back by this name. An edit that continues a
  // like one is taken back with it.
  virtual void RecordEdit(PageId page, std::string name, bool continues = false) = 0;

  // Makes an edit. An exception in it is told, and the model is then as it was before; false.
  bool Attempt(const std::function<void()>& edit);

  bool IsModified() const { return modified_; }
  void SetModifiedFlag(bool modified = true) { modified_ = modified; }

  // Whether the user has worked on a page: then derived defaults leave its values alone.
  bool HasBeenTouched(PageId page) const { return touched_.contains(page); }
  void Touch(PageId page) { touched_.insert(page); }
  void UnTouch(PageId page) { touched_.erase(page); }

  // Tool tips: of a page's control, and of the long values in a column of a grid.
  static void EnableMultiToolTips(CV27SetupFormView& page, std::string_view label, std::string_view text);
  static void EnableGXMultiToolTips(CV27SetupGridWnd& grid, int column);
  // The tip of a long value, on lines that fit a screen.
  static std::string GetToolTipsString(std::string_view value);

  // Views are told of each change, but for the one that made it.
  using View = std::function<void()>;
  void AddView(const void* owner, View update);
  void RemoveView(const void* owner);
  void UpdateAllViews(const void* sender);

 protected:
  // Brings the model back to what it was after the last edit.
  virtual void TakeBackUnrecorded() = 0;
  void SetPath(const std::string& path) { path_ = path; }
  std::set<PageId>& touched() { return touched_; }

 private:
  SetupHost& host_;
  UnitChoices units_;
  std::string path_;
  std::set<PageId> touched_;
  bool modified_ = false;
  std::vector<std::pair<const void*, View>> views_;
};

}  // namespace gridbay

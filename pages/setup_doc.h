#pragma once

#include <functional>
#include <memory>
#include <set>
#include <string>
#include <vector>

#include "core/global_kvs.h"
#include "core/page_id.h"
#include "core/setup_file.h"
#include "pages/host.h"
#include "platform/units/edit_style.h"

namespace gridbay {

// A document: a model that is never without its parts, the file it is saved in, and what the pages of one
// setup share. It knows of no window.
class CV27SetupDoc {
 public:
  explicit CV27SetupDoc(SetupHost& host) : host_(host), setup_(&host) {}
  CV27SetupDoc(const CV27SetupDoc&) = delete;
  CV27SetupDoc& operator=(const CV27SetupDoc&) = delete;
  virtual ~CV27SetupDoc() = default;

  CGlobalKvs& root() { return setup_.model(); }
  SetupHost& host() { return host_; }
  UnitChoices& units() { return units_; }

  // A fresh model without a file.
  virtual bool OnNewDocument();
  // Reads a setup. On failure the reason is shown, and the document is as it was.
  bool OnOpenDocument(const std::string& path);
  // Writes the setup and makes the path the document's own. On failure the reason is shown.
  bool OnSaveDocument(const std::string& path);
  const std::string& path() const { return path_; }

  // All faults of the model.
  unsigned ValidateData(ValidationList& messages) { return root().Validate(messages, 1); }
  void SetEngine(std::string name) { engine_ = std::move(name); }
  const std::string& engine() const { return engine_; }

  // The absolute form of a file name in the setup.
  std::string getAbsoluteFilepath(const std::string& name) const;

  bool IsModified() const { return modified_; }
  void SetModifiedFlag(bool modified = true) { modified_ = modified; }

  // Whether the user has worked on a page: then derived defaults leave its values alone.
  bool HasBeenTouched(PageId page) const { return touched_.contains(page); }
  void Touch(PageId page) { touched_.insert(page); }
  void UnTouch(PageId page) { touched_.erase(page); }

  // Views are told of each change, but for the one that made it.
  using View = std::function<void()>;
  void AddView(const void* owner, View update);
  void RemoveView(const void* owner);
  void UpdateAllViews(const void* sender);

 private:
  SetupHost& host_;
  SetupFile setup_;
  UnitChoices units_;
  std::string path_;
  std::string engine_;
  std::set<PageId> touched_;
  bool modified_ = false;
  std::vector<std::pair<const void*, View>> views_;
};

}  // namespace gridbay

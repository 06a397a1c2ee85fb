#pragma once

#include <cstdint>
#include <functional>
#include <string_view>
#include <type_traits>
#include <utility>
#include <vector>

#include "core/file_name.h"
#include "core/file_selector.h"
#include "core/selections.h"
#include "pages/binding.h"
#include "pages/grid_row.h"
#include "pages/vd_doc.h"

namespace gridbay {

// A file name of the model, with the items chosen in the file where there are any to choose.
struct FileRef {
  FileRef() = default;
  FileRef(FileNameValue& held) : name(&held) {}
  FileRef(UTsbSelection& selection) : name(&selection.fileName), items(&selection.items) {}

  FileNameValue* name = nullptr;  // null where there is no such object
  std::vector<std::uint32_t>* items = nullptr;
};

// What a file dialog is for: the extension with no dot, and the filter.
struct FileKind {
  std::string_view extension;
  std::string_view filter;
};

// How a file is chosen and looked at, on a page or in the rows of a grid; a page has no rows.
struct FileChoice {
  std::function<FileRef(GridRow)> file;
  ByRow<FileKind> kind;
  // States what the file must be. Without it, and for a file that is to be written, the dialog is a plain
  // one.
  std::function<void(CVdFileSelectorDlg& selector, GridRow)> request = {};
  bool isResult = false;
  // Asked before the dialog is shown; false, having told why, when there is nothing to choose yet.
  std::function<bool(GridRow)> ready = {};
  // The file is another one now, by choice or by typing.
  std::function<void(GridRow)> changed = {};
  // What follows from a choice in a dialog alone, and from typing alone.
  std::function<void(GridRow)> chosen = {};
  std::function<void(GridRow)> typed = {};

  std::string text(GridRow row) const;
  void type(std::string_view text, GridRow row, CVdDoc& document) const;
  // Lets the user choose; true when he did, and the model has it.
  bool choose(GridRow row, CVdDoc& document) const;
  // Whether there is a file to be looked at; it is opened in the host.
  bool canView(GridRow row) const;
  void view(GridRow row, CVdDoc& document) const;
};

// The file that is a member of the object which `object(row)` gives. `request`, a function or a member of the
// object, gets the selector and the number of the item.
template <class Access, class Owner, class Member, class Request>
FileChoice fileOf(Access object, Member Owner::*file, ByRow<FileKind> kind, Request request) {
  FileChoice choice{.file = [object, file](GridRow row) -> FileRef {
                      auto* owner = pointerTo(object(row));
                      return owner == nullptr ? FileRef() : FileRef(owner->*file);
                    },
                    .kind = std::move(kind)};
  if constexpr (std::is_member_function_pointer_v<Request>) {
    choice.request = [object, request](CVdFileSelectorDlg& selector, GridRow row) {
      (pointerTo(object(row))->*request)(selector, row.item);
    };
  } else {
    choice.request = std::move(request);
  }
  return choice;
}

// The same for a file that the engine will make.
template <class Access, class Owner, class Member>
FileChoice resultFileOf(Access object, Member Owner::*file, ByRow<FileKind> kind) {
  FileChoice choice = fileOf(object, file, std::move(kind), [](CVdFileSelectorDlg&, GridRow) {});
  choice.isResult = true;
  return choice;
}

}  // namespace gridbay

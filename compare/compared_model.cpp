#include "compare/compared_model.h"

#include <algorithm>

#include "pages/grid_wnd.h"
#include "setup/page_factory.h"

namespace gridbay {

ComparedModel::ComparedModel(const KvsFile& file, const std::string& path, const UnitChoices& units,
                             NoHost* host)
    : CVdDoc(host == nullptr ? noHost() : *host), root_(std::make_unique<CGlobalKvs>()) {
  SetPath(path);
  this->units() = units;
  root_->Load(&file.tree().root(), path);
  root_->SetSourceFile(&file);
  tree_.OnInitialUpdate(root_.get());
}

ComparedModel::~ComparedModel() = default;

// It keeps nothing of what it is told.
NoHost& ComparedModel::noHost() {
  static NoHost host;
  return host;
}

void ComparedModel::assign(CGlobalKvs& other) {
  root_->AssignState(other);
  tree_.OnUpdate(root_.get());
}

KvsHandle ComparedModel::file() {
  KvsHandle file = kvsCreate();
  root_->Save(*file, path());
  return file;
}

std::vector<ComparedPage> ComparedModel::pages() const {
  std::vector<ComparedPage> pages;
  std::string root;
  for (const TreeItem& item : tree_.items()) {
    if (item.depth == 0) root = item.caption;
    pages.push_back({item.id, item.depth == 0 ? item.caption : root + ", " + item.caption});
  }
  return pages;
}

CV27SetupFormView* ComparedModel::page(std::int32_t id) {
  const auto [place, isNew] = pages_.try_emplace(id);
  if (isNew) {
    std::string topic;
    std::string local;
    place->second = makePage(enumerator_.GetPageClass(id, &topic, &local), *this);
  }
  return place->second.get();
}

PageContents ComparedModel::contents(std::int32_t id) {
  CV27SetupFormView* shown = page(id);
  if (shown == nullptr) return {};
  shown->OnUpdate();
  PageContents contents = contentsOf(shown->form());
  const auto master = std::ranges::find_if(shown->form().controls(), [](const Control& control) {
    return control.grid != nullptr && control.grid->CurrentRow().has_value();
  });
  if (master == shown->form().controls().end()) return contents;
  // The table itself is read once, and what is beside it for each of its rows.
  CV27SetupGridWnd& grid = *master->grid;
  std::size_t place = 0;
  for (const Control& control : shown->form().controls()) {
    if (control.grid == &grid) break;
    if (control.grid != nullptr) ++place;
  }
  ShownTable rows = std::move(contents.tables[place]);
  contents = {.tables = {std::move(rows)}};
  for (int row = 1; row <= grid.GetRowCount(); ++row) {
    grid.OnCurrentRow(row);
    shown->OnUpdate();
    contents.details.push_back(contentsOf(shown->form()));
    contents.details.back().tables[place] = {};
  }
  return contents;
}

}  // namespace gridbay

#include "compare/document_change.h"

#include "compare/tree_difference.h"
#include "compare/tree_packing.h"

namespace gridbay {
namespace {

std::unique_ptr<CGlobalKvs> modelOf(const KvsFile& file, const std::string& path) {
  auto model = std::make_unique<CGlobalKvs>();
  model->Load(&file.tree().root(), path);
  return model;
}

}  // namespace

void pass(Packing& pack, DocumentChange& change) {
  pack(change.parts, change.after, change.path, change.source);
  if (change.model == nullptr && change.after != nullptr) change.model = modelOf(*change.after, change.path);
}

DocumentChange changeOf(ChangeOf files) {
  DocumentChange change{.after = std::move(files.after), .path = std::move(files.path)};
  change.model = modelOf(*change.after, change.path);
  const std::unique_ptr<CGlobalKvs> before = modelOf(files.before, files.beforePath);
  const std::vector<CKvsBase*> olds = before->children();
  const std::vector<CKvsBase*> news = change.model->children();
  for (std::size_t i = 0; i < olds.size(); ++i) {
    if (!olds[i]->SameState(*news[i])) change.parts.push_back(static_cast<std::int32_t>(i));
  }
  if (files.isOfFiles || !sameOptions(files.before, *change.after))
    change.source = withOptions(files.source, *change.after);
  return change;
}

std::string makeChange(CV27SetupDoc& document, DocumentChange change, PageId page, const std::string& name) {
  const bool isDone = document.Attempt([&] {
    const std::vector<CKvsBase*> olds = document.root().children();
    const std::vector<CKvsBase*> news = change.model->children();
    for (const std::int32_t part : change.parts) {
      const auto i = static_cast<std::size_t>(part);
      olds.at(i)->AssignState(*news.at(i));
    }
  });
  if (!isDone) return "The edit could not be made";
  if (change.source != nullptr) document.ReplaceSource(std::move(change.source));
  if (page != PageId::none) document.Touch(page);
  document.SetModifiedFlag();
  document.RecordEdit(page, name);
  document.UpdateAllViews(nullptr);
  return {};
}

}  // namespace gridbay

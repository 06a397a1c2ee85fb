#pragma once

#include <cstdint>
#include <string>
#include <vector>

#include "compare/setup_comparison.h"
#include "compare/tree_merge.h"
#include "setup/setup_doc.h"

namespace gridbay {

// A merge into a document, which must outlive it. What was read stays packed: each step that takes long
// unpacks it for itself.
class DocumentMerging final : public SetupMerging {
 public:
  explicit DocumentMerging(CV27SetupDoc& document) : document_(document) {}

  std::string read(const std::string& base, const std::string& own, const std::string& other) const override;
  std::string start(const std::string& found) override;
  const std::vector<std::string>& leftOut() const override { return leftOut_; }
  std::vector<MergeQuestion>& questions() override { return questions_; }
  std::string word() const override;
  bool takeWords(const std::string& words) override;
  std::string make() const override;
  std::string finish(const std::string& made) override;

 private:
  CV27SetupDoc& document_;
  std::string files_;        // packed; empty for none
  std::uint64_t state_ = 0;  // of the document that they were read beside
  std::vector<std::string> leftOut_;
  std::vector<MergeQuestion> questions_;
};

}  // namespace gridbay

#pragma once

#include <memory>

#include "python/keyword_notes.h"
#include "python/page_fields.h"
#include "setup/gridbay_doc.h"

namespace gridbay::python {

// Uses each control of each page, and of each dialog that a page opens, once for each of its choices and
// behind each of them, and notes which keyword that edits, what it is called and measured in.
class PageTrial {
 public:
  PageTrial(KeywordNotes& notes, DialogHost& host);
  PageTrial(const PageTrial&) = delete;
  PageTrial& operator=(const PageTrial&) = delete;
  ~PageTrial();

  // The pages of a document, which is as it was afterwards. Depth: behind how many choices at once what they
  // bring up is used; of one that has been linked to its keyword no more is asked.
  void use(CGridbayDoc& document, int depth);

 private:
  class Work;
  std::unique_ptr<Work> work_;
};

}  // namespace gridbay::python

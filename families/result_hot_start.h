#pragma once

#include <string>

#include "core/table_kvs.h"
#include "families/result_output.h"

namespace gridbay {

// The hot start file that a module writes of one area. The page is that of its module's results.
template <PageId page>
class ResultHotStartKvs final : public TableKvs<ResultHotStartKvs<page>> {
 public:
  using TableKvs<ResultHotStartKvs>::TableKvs;

  std::string title;
  UResultFileName file;

  static constexpr auto table() {
    return keywords(keyword("Title", &ResultHotStartKvs::title),
                    keyword("File_Name", &ResultHotStartKvs::file));
  }

  unsigned Validate(ValidationList& messages, int) override {
    return checkResultFileName(messages, page, file);
  }
};

}  // namespace gridbay

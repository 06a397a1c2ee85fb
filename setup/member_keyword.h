#pragma once

#include <string>
#include <string_view>
#include <vector>

#include "core/kvs.h"
#include "platform/result.h"
#include "setup/global_kvs.h"

namespace gridbay {

// A keyword that a path of a setup's target names, with the member behind it: what it holds is written and
// taken by the rules of its own object, with nothing else loaded or saved.
class MemberKeyword {
 public:
  // The keyword with the values that it has now.
  const Node& node() const { return *written_->tree().root().first(); }
  bool takesAnyNumber() const { return takesAnyNumber_; }
  // Gives the member other values, of the kinds that it has. False, with its old values, when they do
  // not stand then, as where an edition has its own, or are no finite numbers.
  bool set(const std::vector<Value>& values);
  // What it takes beside the kinds of its values, for people: "a finite number", "0 to 65535", the values
  // that it has where it takes no others.
  std::string allowed(const std::vector<Value>& refused) const;

 private:
  friend Result<MemberKeyword> findKeyword(CGlobalKvs& model, std::string_view path,
                                           const std::string& documentPath);

  bool write();
  void take(std::string_view name, std::span<const Value> values);

  CGlobalKvs* model_ = nullptr;
  std::string path_;
  std::string documentPath_;
  KvsHandle written_;
  bool takesAnyNumber_ = false;
  int most_ = 0;  // of a count
};

// An error when the model has no such keyword, or when its value follows from others.
Result<MemberKeyword> findKeyword(CGlobalKvs& model, std::string_view path, const std::string& documentPath);

}  // namespace gridbay

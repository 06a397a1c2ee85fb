#pragma once

#include <memory>
#include <string>
#include <string_view>

#include "platform/result.h"

namespace gridbay {

// Replaces a file by a new text, whole or not at all: the text goes to a file beside the target, is flushed
// to the disk and renamed over it. Until `commit` has succeeded the target is as it was; a file that is not
// committed leaves nothing behind. A symbolic link stays a link, and its target is replaced; permissions and,
// where the system allows it, ownership of the old file are kept.
class FileSave {
 public:
  static Result<FileSave> begin(const std::string& path);

  FileSave(FileSave&&) noexcept;
  FileSave& operator=(FileSave&&) = delete;
  ~FileSave();

  Outcome write(std::string_view text);
  Outcome commit();

 private:
  struct State;
  explicit FileSave(std::unique_ptr<State> state);

  Outcome writeThrough(std::string_view text);
  Outcome flush();

  std::unique_ptr<State> state_;
};

Outcome saveFile(const std::string& path, std::string_view text);

}  // namespace gridbay

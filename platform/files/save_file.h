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
  // When what is written reaches the disk. One of many files is not flushed by itself: a `flushFiles` behind
  // the last of them does it for all. It is whole or not there either way, but for a crash of the machine.
  enum class Flush { now, withOthers };

  static Result<FileSave> begin(const std::string& path);

  FileSave(FileSave&&) noexcept;
  FileSave& operator=(FileSave&&) = delete;
  ~FileSave();

  Outcome write(std::string_view text);
  Outcome commit(Flush flush = Flush::now);

 private:
  struct State;
  explicit FileSave(std::unique_ptr<State> state);

  Outcome writeThrough(std::string_view text);
  Outcome writeBuffer();

  std::unique_ptr<State> state_;
};

Outcome saveFile(const std::string& path, std::string_view text,
                 FileSave::Flush flush = FileSave::Flush::now);

// Flushes all that has been written to the file system that the folder is on.
Outcome flushFiles(const std::string& folder);

}  // namespace gridbay

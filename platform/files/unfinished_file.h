#pragma once

#include <sys/types.h>

#include <string>

namespace gridbay {

// A file under a hidden name beside the one that it is going to be, until it is whole. It goes with this
// object where it has not been finished.
class UnfinishedFile {
 public:
  // Of a file that is going to be `target`, or what that links to. It has no path, with the reason in
  // `errno`, where none can be made: above all where a folder, a device or a pipe has that name.
  explicit UnfinishedFile(const std::string& target);
  ~UnfinishedFile();
  UnfinishedFile(const UnfinishedFile&) = delete;
  UnfinishedFile& operator=(const UnfinishedFile&) = delete;

  const std::string& path() const { return path_; }
  // Brings it to the disk, and to its name; false with the reason in `errno`.
  bool finish();

 private:
  std::string target_;
  std::string path_;
};

// Removes what a process that has been killed has left of files that were going to be `target`.
void removeUnfinished(const std::string& target, pid_t process);

}  // namespace gridbay

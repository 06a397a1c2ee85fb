#include "platform/files/unfinished_file.h"

#include <fcntl.h>
#include <sys/stat.h>
#include <unistd.h>

#include <cerrno>
#include <cstdio>
#include <filesystem>

#include "platform/files/file_descriptor.h"
#include "platform/files/paths.h"

namespace gridbay {
namespace {

namespace fs = std::filesystem;

fs::path folderOf(const fs::path& target) {
  return target.has_parent_path() ? target.parent_path() : fs::path(".");
}

// What the hidden names of a process begin with.
std::string stemOf(const fs::path& target, pid_t process) {
  return "." + target.filename().string() + "." + std::to_string(process) + ".";
}

}  // namespace

UnfinishedFile::UnfinishedFile(const std::string& target) : target_(endOfLinks(target)) {
  const fs::path end(target_);
  struct stat old {};
  if (::stat(target_.c_str(), &old) == 0 && !S_ISREG(old.st_mode)) {
    errno = S_ISDIR(old.st_mode) ? EISDIR : EPERM;
    return;
  }
  std::string hidden = (folderOf(end) / (stemOf(end, ::getpid()) + "XXXXXX")).string();
  const FileDescriptor made(::mkostemp(hidden.data(), O_CLOEXEC));
  if (!made) return;
  const mode_t mask = ::umask(0);
  ::umask(mask);
  if (::fchmod(made.get(), 0666U & ~mask) != 0) errno = 0;
  path_ = std::move(hidden);
}

UnfinishedFile::~UnfinishedFile() {
  if (!path_.empty()) ::unlink(path_.c_str());
}

bool UnfinishedFile::finish() {
  const FileDescriptor written(::open(path_.c_str(), O_RDONLY | O_CLOEXEC));
  if (!written || ::fsync(written.get()) != 0 || ::rename(path_.c_str(), target_.c_str()) != 0) return false;
  path_.clear();
  return true;
}

void removeUnfinished(const std::string& target, pid_t process) {
  const fs::path end(endOfLinks(target));
  const std::string stem = stemOf(end, process);
  std::error_code error;
  for (fs::directory_iterator each(folderOf(end), error), none; !error && each != none;
       each.increment(error)) {
    if (each->path().filename().string().starts_with(stem)) ::unlink(each->path().c_str());
  }
}

}  // namespace gridbay

#include "platform/files/save_file.h"

#include <fcntl.h>
#include <sys/stat.h>
#include <unistd.h>

#include <algorithm>
#include <cerrno>
#include <cstdlib>
#include <filesystem>
#include <optional>

#include "platform/files/file_descriptor.h"
#include "platform/files/paths.h"

namespace gridbay {
namespace {

constexpr std::size_t kBufferSize = 1 << 16;
// A process that is told to stop does so between two writes, also on a slow disk.
constexpr std::size_t kMostAtOnce = 1 << 18;

std::string folderOf(const std::filesystem::path& path) {
  const std::string folder = path.parent_path().string();
  return folder.empty() ? "." : folder;
}

}  // namespace

struct FileSave::State {
  std::string shownPath;
  std::string target;
  std::string folder;
  std::string temporary;
  FileDescriptor file{-1};
  std::string buffer;

  State(std::string shown, std::string end, std::string in, std::string temp, FileDescriptor descriptor)
      : shownPath(std::move(shown)),
        target(std::move(end)),
        folder(std::move(in)),
        temporary(std::move(temp)),
        file(std::move(descriptor)) {}
  State(const State&) = delete;
  State& operator=(const State&) = delete;
  ~State() {
    if (!temporary.empty()) ::unlink(temporary.c_str());
  }

  Failure failure() const { return {systemError("cannot save", shownPath) + ". The old file is unchanged."}; }
};

FileSave::FileSave(std::unique_ptr<State> state) : state_(std::move(state)) {}
FileSave::FileSave(FileSave&&) noexcept = default;
FileSave::~FileSave() = default;

Result<FileSave> FileSave::begin(const std::string& path) {
  const std::filesystem::path target = endOfLinks(path);
  const std::string folder = folderOf(target);

  struct stat old {};
  const bool replaces = ::stat(target.c_str(), &old) == 0;
  const auto refuse = [&path](std::string_view why) {
    return Failure{"cannot save \"" + path + "\": " + std::string(why)};
  };
  if (replaces && !S_ISREG(old.st_mode)) return refuse("a folder or a device has that name");
  if (replaces && ::access(target.c_str(), W_OK) != 0) return refuse("the file is read-only");

  std::string temporary = folder + "/." + target.filename().string() + ".XXXXXX";
  FileDescriptor file(::mkostemp(temporary.data(), O_CLOEXEC));
  if (!file) return Failure{systemError("cannot save", path)};

  auto state = std::make_unique<State>(path, target.string(), folder, temporary, std::move(file));
  if (replaces) {
    // Ownership goes first: giving a file away clears its set-id bits. Only a privileged user may do it.
    if (::fchown(state->file.get(), old.st_uid, old.st_gid) != 0) errno = 0;
    if (::fchmod(state->file.get(), old.st_mode & 07777U) != 0) return state->failure();
  } else {
    const mode_t mask = ::umask(0);
    ::umask(mask);
    if (::fchmod(state->file.get(), 0666U & ~mask) != 0) return state->failure();
  }
  return FileSave(std::move(state));
}

Outcome FileSave::writeThrough(std::string_view text) {
  while (!text.empty()) {
    const ssize_t n = ::write(state_->file.get(), text.data(), std::min(text.size(), kMostAtOnce));
    if (n < 0 && errno == EINTR) continue;
    if (n < 0) return state_->failure();
    text.remove_prefix(static_cast<std::size_t>(n));
  }
  return {};
}

Outcome FileSave::writeBuffer() {
  if (Outcome written = writeThrough(state_->buffer); !written) return written;
  state_->buffer.clear();
  return {};
}

Outcome FileSave::write(std::string_view text) {
  if (state_->buffer.size() + text.size() < kBufferSize) {
    state_->buffer.append(text);
    return {};
  }
  if (Outcome flushed = writeBuffer(); !flushed) return flushed;
  return writeThrough(text);
}

Outcome FileSave::commit(Flush flush) {
  if (Outcome flushed = writeBuffer(); !flushed) return flushed;
  if (flush == Flush::now && ::fsync(state_->file.get()) != 0) return state_->failure();
  if (::close(state_->file.release()) != 0) return state_->failure();
  if (::rename(state_->temporary.c_str(), state_->target.c_str()) != 0) return state_->failure();
  state_->temporary.clear();
  if (flush == Flush::withOthers) return {};
  // The new name is durable once its folder is; a file system that cannot flush folders keeps the old rule.
  const FileDescriptor folder(::open(state_->folder.c_str(), O_RDONLY | O_DIRECTORY | O_CLOEXEC));
  if (folder && ::fsync(folder.get()) != 0) errno = 0;
  return {};
}

Outcome saveFile(const std::string& path, std::string_view text, FileSave::Flush flush) {
  Result<FileSave> save = FileSave::begin(path);
  if (!save) return Failure{save.error()};
  if (Outcome written = save->write(text); !written) return written;
  return save->commit(flush);
}

Outcome flushFiles(const std::string& folder) {
  const FileDescriptor descriptor(::open(folder.c_str(), O_RDONLY | O_DIRECTORY | O_CLOEXEC));
  if (!descriptor || ::syncfs(descriptor.get()) != 0) return Failure{systemError("cannot flush", folder)};
  return {};
}

}  // namespace gridbay

#pragma once

#include <sys/types.h>

#include <functional>
#include <optional>
#include <string>

#include "platform/files/file_descriptor.h"
#include "platform/result.h"

namespace gridbay {

// One long piece of work in a copy of this process, while this process goes on. The libraries below are no
// more than one thread's, so that a thread would not do; and what a damaged file does to them ends the copy
// alone. The copy begins with all that this process has in memory, and hands back a text.
class WorkApart {
 public:
  // Told how much is done, 0 to 1; false when the work is to stop, and nobody waits for its text any more.
  using Progress = std::function<bool(double done)>;
  using Work = std::function<std::string(const Progress& progress)>;

  // Fails where no copy can be made. To be called by the one thread that uses the libraries, or while others
  // have a NoCopyNow. `file` is the one that the work makes, of which nothing is left whatever ends it; work
  // that makes none is ended at once when it is to stop.
  static Result<WorkApart> begin(const Work& work, std::string file = {});

  WorkApart(WorkApart&& other) noexcept;
  WorkApart& operator=(WorkApart&&) = delete;
  // Stops the work. What does not heed that within two seconds is ended all the same.
  ~WorkApart();

  // Can be read as soon as `take` has something to say.
  int descriptor() const { return line_.get(); }
  // Takes what has come, waiting for nothing: true while the work goes on.
  bool take();
  // How much is done, 0 to 1.
  double done() const { return done_; }
  // The text, once the work is at its end; nothing where that was a crash.
  const std::optional<std::string>& text() const { return text_; }
  void stop();

 private:
  WorkApart(FileDescriptor line, pid_t process, std::string file)
      : line_(std::move(line)), process_(process), file_(std::move(file)) {}

  FileDescriptor line_;
  pid_t process_;
  std::string file_;  // empty for none
  std::string read_;  // and not understood yet
  double done_ = 0;
  std::optional<std::string> text_;
};

}  // namespace gridbay

#pragma once

#include <sys/types.h>

#include <cstddef>
#include <optional>
#include <string>
#include <vector>

#include "platform/result.h"

namespace gridbay::cli {

// A folder with what is known of a run of several setups, so that any later call can tell how they are: their
// files, the number of the job or else the process that makes the run (`process`), and for each, by its
// number from 1, its state (`N.status`: "running" with the engine's process where that is known, or its exit
// status) and what its engine said (`N.log`).
class RunFolder {
 public:
  struct Member {
    std::string file;
    bool isRunning = false;
    bool isGone = false;        // its engine has ended, though nobody told how
    std::optional<int> status;  // of the engine, once it has ended
  };

  // A new folder "run-N" beside the first of the files, with the first number that is free.
  static Result<RunFolder> create(const std::vector<std::string>& files);
  // A folder that was made before.
  static Result<RunFolder> open(const std::string& path);

  const std::string& path() const { return path_; }
  std::size_t count() const { return files_.size(); }
  const std::string& file(std::size_t number) const { return files_[number - 1]; }
  std::string logOf(std::size_t number) const;
  Member member(std::size_t number) const;
  // The number that Slurm gave its job; empty for a run on this machine.
  const std::string& job() const { return job_; }

  // Whether each has its exit status.
  bool areAllEnded() const;
  // Whether the process that makes the run has ended, so that nothing more will come of what is not done.
  bool isLeft() const;

  Outcome setJob(const std::string& job);
  Outcome setProcess(pid_t process) const;
  Outcome setRunning(std::size_t number, pid_t engine) const;
  Outcome setStatus(std::size_t number, int status) const;
  Outcome write(const std::string& name, const std::string& text) const;
  // With all that is in it, of a run that never was.
  void remove() const;

 private:
  RunFolder(std::string path, std::vector<std::string> files)
      : path_(std::move(path)), files_(std::move(files)) {}

  std::string path_;
  std::vector<std::string> files_;
  std::string job_;
};

}  // namespace gridbay::cli

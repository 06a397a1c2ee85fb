#pragma once

#include <memory>
#include <optional>
#include <string>
#include <vector>

#include "core/kvs.h"
#include "platform/result.h"
#include "setup/global_kvs.h"

namespace gridbay {

// A model with the file it came from, which stays open so that a save can pass on what the editor does not
// know.
class SetupFile {
 public:
  // A new default model. The host, which must outlive it, is shown what a load has to say, in one list.
  explicit SetupFile(MessageHost* host);

  // Reads a setup; a file that is no setup is an error, so that it cannot be saved over by accident.
  // File names in it are relative to the folder of `documentPath`, where one is given.
  static Result<SetupFile> open(const std::string& path, MessageHost* host,
                                const std::optional<std::string>& documentPath = std::nullopt);
  // Reads a setup from a tree in memory that stands for the file at the path.
  static SetupFile fromTree(KvsHandle tree, const std::string& path, MessageHost* host);

  CGlobalKvs& model() { return *model_; }
  // The file as it was read; empty for a new model.
  const KvsFile& source() const { return *source_; }
  // What a save to the path would write.
  KvsHandle tree(const std::string& path);
  // Writes the setup. What a save does to the model, as it leaves out what can't be written, stays. A model
  // that can't be written leaves the file as it was.
  Outcome save(const std::string& path);
  // Writes what a save to the path would, to another file; the model stays as it is.
  Outcome saveCopy(const std::string& copy, const std::string& path);
  // Another file in the place of the one that was read: what a save passes on comes from it.
  void replaceSource(KvsHandle source);
  // Sections of the file, as paths, that no load takes anything of and a save leaves out. What belongs to a
  // module that is not selected is left out on purpose and is not among them, nor is what an edit took out.
  std::vector<std::string> unknownSections();

 private:
  KvsHandle source_;
  std::unique_ptr<CGlobalKvs> model_;
};

}  // namespace gridbay

#pragma once

#include <chrono>
#include <functional>
#include <memory>
#include <optional>
#include <string>
#include <vector>

#include "advice/advice.h"
#include "core/kvs.h"
#include "platform/result.h"

namespace gridbay {

class CGlobalKvs;
class DataFileFacts;

// Looks over a setup for what is doubtful. It keeps what it has learnt of data files from one look to the
// next.
class Advisor {
 public:
  Advisor();
  ~Advisor();

  // What all rules have to say of the setup at `documentPath`, with what is known of its data files by now;
  // the model stays as it is. With the file as it stands on disk its names are looked at too.
  std::vector<Advice> look(CGlobalKvs& model, const std::string& documentPath,
                           const KvsFile* source = nullptr);
  // Reads for some time in data files that the last look asked for. False when there is more to read; once
  // there is not, another look knows all.
  bool read(std::chrono::milliseconds time);
  // Whether the last look knew all that it asked for.
  bool isComplete() const;

  // A look that knows all, however long that takes.
  std::vector<Advice> lookThoroughly(CGlobalKvs& model, const std::string& documentPath,
                                     const KvsFile* source = nullptr);

  // The megabytes (of 1048576 bytes) that can be written in a folder; those of the disk unless given.
  void setFreeMegabytes(std::function<std::optional<double>(const std::string& folder)> free);

 private:
  std::unique_ptr<DataFileFacts> files_;
  std::function<std::optional<double>(const std::string& folder)> freeMegabytes_;
};

// Makes all of a fix or nothing; an error says which file can't be made, or which keyword would not take its
// value. Files stay when the step is taken back. `progress` is told how much of the files is done, 0 to 1,
// and stops the work by false.
Outcome makeFix(CGlobalKvs& model, const AdviceFix& fix, const std::string& documentPath,
                const std::function<bool(double)>& progress = {});

}  // namespace gridbay

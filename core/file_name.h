#pragma once

#include <string>
#include <string_view>

#include "core/kvs.h"

namespace gridbay {

// A file name of a setup, shown as the user gave it. It remembers the folder that a relative name starts
// from; on file it is relative to the setup's own folder, so that setup and data can move together.
class FileNameValue {
 public:
  FileNameValue& operator=(std::string_view name) {
    name_ = name;
    return *this;
  }

  // A name that is relative to the folder of the setup at `documentPath`.
  void Set(std::string_view name, const std::string& documentPath) { take(std::string(name), documentPath); }

  const std::string& text() const { return name_; }
  bool empty() const { return name_.empty(); }
  // The name by which the file can be opened; empty for an empty name.
  std::string absolute() const;
  // The same name from the same folder.
  bool operator==(const FileNameValue&) const = default;

 protected:
  FileNameValue() = default;
  // The name as a setup at `documentPath` writes it, and taken from there.
  std::string onFile(const std::string& documentPath) const;
  void take(std::string name, const std::string& documentPath);

 private:
  std::string name_;
  std::string folder_;
};

// The name of an input file.
class UFileName : public FileNameValue {
 public:
  static constexpr std::string_view kKeyword = "FILE_NAME";

  using FileNameValue::operator=;
  void Save(KvsFile& file, const std::string& documentPath, std::string_view keyword = kKeyword) const;
  void Load(KvsSection section, const std::string& documentPath, std::string_view keyword = kKeyword);
};

// The name of a file that the engine makes.
class UResultFileName : public FileNameValue {
 public:
  using FileNameValue::operator=;
  void Save(KvsFile& file, const std::string& documentPath, std::string_view keyword) const;
  void Load(KvsSection section, const std::string& documentPath, std::string_view keyword);
};

}  // namespace gridbay

#include "core/file_name.h"

#include <filesystem>

#include "platform/files/paths.h"

namespace gridbay {

std::string FileNameValue::absolute() const {
  return absolutePath(name_, folder_);
}

std::string FileNameValue::onFile(const std::string& documentPath) const {
  if (name_.empty()) return name_;
  const std::string folder = folderOfFile(documentPath);
  const bool asGiven = std::filesystem::path(name_).is_relative() && folder_ == folder;
  return asGiven ? name_ : pathOnFile(absolute(), folder);
}

void FileNameValue::take(std::string name, const std::string& documentPath) {
  name_ = std::move(name);
  folder_ = folderOfFile(documentPath);
}

void UFileName::Save(KvsFile& file, const std::string& documentPath, std::string_view keyword) const {
  kvsPutParamFilename(file, keyword, onFile(documentPath));
}

void UFileName::Load(KvsSection section, const std::string& documentPath, std::string_view keyword) {
  std::string name = text();
  kvsGetParamFilename(section, keyword, &name, 1, 1);
  take(std::move(name), documentPath);
}

void UResultFileName::Save(KvsFile& file, const std::string& documentPath, std::string_view keyword) const {
  kvsPutParamResultFilename(file, keyword, onFile(documentPath));
}

void UResultFileName::Load(KvsSection section, const std::string& documentPath, std::string_view keyword) {
  std::string name = text();
  kvsGetParamResultFilename(section, keyword, &name, 1, 1);
  take(std::move(name), documentPath);
}

}  // namespace gridbay

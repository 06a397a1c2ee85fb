#pragma once

#include <memory>
#include <string>
#include <string_view>
#include <vector>

#include "basic/module_selection.h"
#include "core/kdl_reader.h"
#include "core/kdl_writer.h"
#include "setup/global_kvs.h"

namespace gridbay::test {

// What an object writes, as text; the setup is /case/setup.v27 unless another is named.
inline std::string savedText(CKvsBase& object, const std::string& documentPath = "/case/setup.v27") {
  const KvsHandle file = kvsCreate();
  object.Save(*file, documentPath);
  return *file->text();
}

// A text as the file that holds it.
inline KvsHandle fileOf(std::string_view text) {
  ReadText read = readKdl(FileText(text));
  return read.tree == nullptr ? nullptr : std::make_unique<KvsFile>(std::move(read.tree));
}

// Loads an object from a text that holds its section.
inline void load(CKvsBase& object, std::string_view text,
                 const std::string& documentPath = "/case/setup.v27") {
  const KvsHandle file = fileOf(text);
  object.Load(&file->tree().root(), documentPath);
}

// A whole model with a list for what it shows.
struct Model {
  CollectingMessageHost host;
  CGlobalKvs root{&host};
};

inline std::vector<std::string> textsOf(const ValidationList& messages) {
  std::vector<std::string> texts;
  for (const CMessage& message : messages) texts.push_back(message.text);
  return texts;
}

// The messages of an object's own check, which must be as many as it counts.
inline ValidationList messagesOf(CKvsBase& object, int deep = 1) {
  ValidationList messages;
  object.Validate(messages, deep);
  return messages;
}

}  // namespace gridbay::test

#pragma once

#include <cstdint>
#include <memory>
#include <string>
#include <string_view>

#include "core/kdl_writer.h"
#include "core/parameter_tree.h"
#include "platform/result.h"

// The parameter file as its users see it: a tree of targets, sections, keywords and parameters. Writing goes
// through one cursor, reading through explicit handles. A null handle means that the thing isn't there. Names
// match without regard to case and to blanks at their ends, numbers count from 1.

namespace gridbay {

// A file that was read, or one in writing. What is written is kept as the text that it will be on file, and
// becomes a tree when that is asked for; the handles into a tree hold until the next write.
class KvsFile {
 public:
  // A file with nothing in it.
  KvsFile();
  explicit KvsFile(std::unique_ptr<ParameterTree> tree);
  ~KvsFile();

  // With all that is open closed. Empty where what was written can't be read, of which `text` or a load tell.
  const ParameterTree& tree() const;
  Result<std::string> text() const;
  // Gives the sink the whole text.
  Outcome writeTo(TextSink& sink) const;

  // The cursor. In a file that was read it starts behind all there is.
  void open(std::string_view name);
  void close();
  void startKeyword(std::string_view name);
  void add(ValueKind kind, std::string_view text);
  // A keyword with one value.
  void put(std::string_view name, ValueKind kind, std::string_view text);

 private:
  struct Writing;

  KdlWriter& writer();

  std::unique_ptr<Writing> writing_;             // null until the first write
  mutable std::unique_ptr<ParameterTree> tree_;  // null when there is more in `writing_`
};

using KvsHandle = std::unique_ptr<KvsFile>;
using KvsSection = const Node*;  // a target or a section
using KvsKeyword = const Node*;
using KvsParam = const Value*;

// Codes of the pending error.
inline constexpr int kKvsNoError = 0;
inline constexpr int kKvsCannotRead = 1001;
inline constexpr int kKvsCannotWrite = 1002;
inline constexpr int kKvsSyntaxError = 1003;

KvsHandle kvsCreate();
// Parses a whole file. On failure the error is pending and the file is empty.
KvsHandle kvsLoadFile(const std::string& path, int flag);
// Replaces the file at the path, whole or not at all. False with the error pending when it can't.
bool kvsWrite(KvsFile& file, const std::string& path);
void kvsClose(KvsHandle* file);

int kvsPeekErrorGlb();
int kvsGetErrorGlb();
void kvsGetSyntaxErr(const KvsFile* file, int* line, int* column, std::string* text);
// The last error's text, whatever its code: names the file, the place and the reason.
const std::string& kvsGetErrorText();

void kvsAddTarget(KvsFile& file, std::string_view name);
void kvsAddSection(KvsFile& file, std::string_view name);
void kvsEndSection(KvsFile& file);
void kvsAddKeyword(KvsFile& file, std::string_view name);
void kvsAddBool(KvsFile& file, bool value);
void kvsAddInt(KvsFile& file, std::int32_t value);
void kvsAddFloat(KvsFile& file, float value);
void kvsAddDouble(KvsFile& file, double value);
void kvsAddString(KvsFile& file, std::string_view value);
void kvsAddFilename(KvsFile& file, std::string_view path);
void kvsAddResultFilename(KvsFile& file, std::string_view path);

void kvsPutParam(KvsFile& file, std::string_view keyword, std::int32_t value);
void kvsPutParam(KvsFile& file, std::string_view keyword, float value);
void kvsPutParam(KvsFile& file, std::string_view keyword, double value);
void kvsPutParam(KvsFile& file, std::string_view keyword, bool value);
void kvsPutParam(KvsFile& file, std::string_view keyword, std::string_view value);
void kvsPutParam(KvsFile& file, std::string_view keyword, const char* value);
void kvsPutParamFilename(KvsFile& file, std::string_view keyword, std::string_view path);
void kvsPutParamResultFilename(KvsFile& file, std::string_view keyword, std::string_view path);

KvsSection kvsTargetByNameNum(const KvsFile& file, std::string_view name, int occurrence);
KvsSection kvsSectionByNameNum(KvsSection parent, std::string_view name, int occurrence);
KvsKeyword kvsKeywordByNameNum(KvsSection section, std::string_view name, int occurrence);
int kvsGetNoKeywords(KvsSection section);
int kvsGetNoParams(KvsKeyword keyword);
KvsParam kvsParamByNum(KvsKeyword keyword, int number);

// The value of a parameter; 0 or an empty text for one of another kind.
bool kvsGetBool(KvsParam param);
std::int32_t kvsGetInt(KvsParam param);
float kvsGetFloat(KvsParam param);
double kvsGetDouble(KvsParam param);
std::string kvsGetString(KvsParam param);
std::string kvsGetFilename(KvsParam param);
std::string kvsGetResultFilename(KvsParam param);

// Fills the variable from parameter `number` of the keyword's given occurrence. A keyword or parameter that
// isn't there, and a value of a wrong kind, leave it alone; a number of another numeric kind is converted.
void kvsGetParam(KvsSection section, std::string_view keyword, std::int32_t* value, int occurrence,
                 int number);
void kvsGetParam(KvsSection section, std::string_view keyword, float* value, int occurrence, int number);
void kvsGetParam(KvsSection section, std::string_view keyword, double* value, int occurrence, int number);
void kvsGetParam(KvsSection section, std::string_view keyword, bool* value, int occurrence, int number);
void kvsGetParam(KvsSection section, std::string_view keyword, std::string* value, int occurrence,
                 int number);
void kvsGetParamFilename(KvsSection section, std::string_view keyword, std::string* value, int occurrence,
                         int number);
void kvsGetParamResultFilename(KvsSection section, std::string_view keyword, std::string* value,
                               int occurrence, int number);

// A keyword with one integer for each letter "i" of the format.
template <class... Integers>
void kvsPutListParam(KvsFile& file, std::string_view keyword, [[maybe_unused]] std::string_view format,
                     Integers... values) {
  kvsAddKeyword(file, keyword);
  (kvsAddInt(file, values), ...);
}

// Fills the variables, one for each letter "i" of the format, from the parameters of the keyword.
template <class... Integers>
void kvsGetListParam(KvsSection section, std::string_view keyword, int occurrence,
                     [[maybe_unused]] std::string_view format, Integers*... values) {
  int number = 0;
  (kvsGetParam(section, keyword, values, occurrence, ++number), ...);
}

}  // namespace gridbay

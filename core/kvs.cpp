#include "core/kvs.h"

#include <optional>

#include "core/kdl_reader.h"
#include "core/kdl_writer.h"
#include "core/number_text.h"
#include "core/text_pieces.h"
#include "platform/files/read_file.h"
#include "platform/files/save_file.h"

namespace gridbay {
namespace {

struct PendingError {
  int code = kKvsNoError;
  int line = 0;
  int column = 0;
  std::string text;
};

// The library's interface has one error for the whole process; here it is one for each thread.
PendingError& pendingError() {
  thread_local PendingError error;
  return error;
}

class FileSink : public TextSink {
 public:
  explicit FileSink(FileSave& save) : save_(save) {}
  Outcome write(std::string_view text) override { return save_.write(text); }

 private:
  FileSave& save_;
};

Outcome writeFile(const KvsFile& file, const std::string& path) {
  Result<FileSave> save = FileSave::begin(path);
  if (!save) return Failure{save.error()};
  FileSink sink(*save);
  if (Outcome written = file.writeTo(sink); !written) return written;
  return save->commit();
}

bool isNumber(ValueKind kind) {
  return kind == ValueKind::integer || kind == ValueKind::real;
}

std::optional<std::int32_t> valueOf(const Value& value, std::int32_t) {
  return isNumber(value.kind()) ? int32OfText(value.text()) : std::nullopt;
}
std::optional<float> valueOf(const Value& value, float) {
  return isNumber(value.kind()) ? floatOfText(value.text()) : std::nullopt;
}
std::optional<double> valueOf(const Value& value, double) {
  return isNumber(value.kind()) ? doubleOfText(value.text()) : std::nullopt;
}
std::optional<bool> valueOf(const Value& value, bool) {
  return value.kind() == ValueKind::boolean ? std::optional(value.text() == "true") : std::nullopt;
}
std::optional<std::string> textOf(const Value& value, ValueKind kind) {
  return value.kind() == kind ? std::optional(std::string(value.text())) : std::nullopt;
}

KvsParam paramOf(KvsSection section, std::string_view keyword, int occurrence, int number) {
  const KvsKeyword found = kvsKeywordByNameNum(section, keyword, occurrence);
  return found == nullptr ? nullptr : kvsParamByNum(found, number);
}

template <class T>
void getNumber(KvsSection section, std::string_view keyword, T* value, int occurrence, int number) {
  const KvsParam param = paramOf(section, keyword, occurrence, number);
  if (param == nullptr) return;
  if (const auto got = valueOf(*param, T())) *value = *got;
}

void getText(KvsSection section, std::string_view keyword, ValueKind kind, std::string* value, int occurrence,
             int number) {
  const KvsParam param = paramOf(section, keyword, occurrence, number);
  if (param == nullptr) return;
  if (auto got = textOf(*param, kind)) *value = *std::move(got);
}

}  // namespace

struct KvsFile::Writing {
  TextPieces pieces;
  KdlWriter writer{pieces};
};

KvsFile::KvsFile() : KvsFile(std::make_unique<ParameterTree>()) {}

KvsFile::KvsFile(std::unique_ptr<ParameterTree> tree) : tree_(std::move(tree)) {}

KvsFile::~KvsFile() = default;

KdlWriter& KvsFile::writer() {
  if (writing_ == nullptr) {
    writing_ = std::make_unique<Writing>();
    writeKdl(tree_->root(), writing_->writer);
  }
  tree_.reset();
  return writing_->writer;
}

void KvsFile::open(std::string_view name) {
  writer().open(name);
}
void KvsFile::close() {
  writer().close();
}
void KvsFile::startKeyword(std::string_view name) {
  writer().startKeyword(name);
}
void KvsFile::add(ValueKind kind, std::string_view text) {
  writer().add(kind, text);
}
void KvsFile::put(std::string_view name, ValueKind kind, std::string_view text) {
  writer().put(name, kind, text);
}

Outcome KvsFile::writeTo(TextSink& sink) const {
  if (writing_ == nullptr) return writeKdl(tree_->root(), sink);
  if (Outcome written = writing_->writer.flush(); !written) return written;
  if (Outcome written = writing_->pieces.copyTo(sink); !written) return written;
  const std::string closing = writing_->writer.closing();
  return closing.empty() ? Outcome() : sink.write(closing);
}

Result<std::string> KvsFile::text() const {
  StringSink sink;
  if (Outcome written = writeTo(sink); !written) return Failure{written.error()};
  return sink.take();
}

const ParameterTree& KvsFile::tree() const {
  if (tree_ == nullptr) {
    const Result<std::string> whole = text();
    if (whole) tree_ = readKdl(FileText(*whole)).tree;
    if (tree_ == nullptr) tree_ = std::make_unique<ParameterTree>();
  }
  return *tree_;
}

KvsHandle kvsCreate() {
  return std::make_unique<KvsFile>();
}

KvsHandle kvsLoadFile(const std::string& path, int) {
  pendingError() = {};
  Result<FileText> text = readFile(path);
  if (!text) {
    pendingError() = {kKvsCannotRead, 0, 0, text.error()};
    return kvsCreate();
  }
  ReadText read = readKdl(std::move(*text));
  if (read.tree == nullptr) {
    pendingError() = {kKvsSyntaxError, static_cast<int>(read.error.line), static_cast<int>(read.error.column),
                      "Syntax error in \"" + path + "\", " + read.error.text()};
    return kvsCreate();
  }
  return std::make_unique<KvsFile>(std::move(read.tree));
}

bool kvsWrite(KvsFile& file, const std::string& path) {
  if (const Outcome written = writeFile(file, path); !written) {
    pendingError() = {kKvsCannotWrite, 0, 0, written.error()};
    return false;
  }
  return true;
}

void kvsClose(KvsHandle* file) {
  file->reset();
}

int kvsPeekErrorGlb() {
  return pendingError().code;
}

int kvsGetErrorGlb() {
  const int code = pendingError().code;
  pendingError().code = kKvsNoError;
  return code;
}

void kvsGetSyntaxErr(const KvsFile*, int* line, int* column, std::string* text) {
  *line = pendingError().line;
  *column = pendingError().column;
  *text = pendingError().text;
}

const std::string& kvsGetErrorText() {
  return pendingError().text;
}

void kvsAddTarget(KvsFile& file, std::string_view name) {
  file.open(name);
}
void kvsAddSection(KvsFile& file, std::string_view name) {
  file.open(name);
}
void kvsEndSection(KvsFile& file) {
  file.close();
}
void kvsAddKeyword(KvsFile& file, std::string_view name) {
  file.startKeyword(name);
}
void kvsAddBool(KvsFile& file, bool value) {
  file.add(ValueKind::boolean, value ? "true" : "false");
}
void kvsAddInt(KvsFile& file, std::int32_t value) {
  file.add(ValueKind::integer, NumberText(std::int64_t{value}).view());
}
void kvsAddFloat(KvsFile& file, float value) {
  file.add(ValueKind::real, NumberText(value).view());
}
void kvsAddDouble(KvsFile& file, double value) {
  file.add(ValueKind::real, NumberText(value).view());
}
void kvsAddString(KvsFile& file, std::string_view value) {
  file.add(ValueKind::string, value);
}
void kvsAddFilename(KvsFile& file, std::string_view path) {
  file.add(ValueKind::fileName, path);
}
void kvsAddResultFilename(KvsFile& file, std::string_view path) {
  file.add(ValueKind::resultFileName, path);
}

void kvsPutParam(KvsFile& file, std::string_view keyword, std::int32_t value) {
  file.put(keyword, ValueKind::integer, NumberText(std::int64_t{value}).view());
}
void kvsPutParam(KvsFile& file, std::string_view keyword, float value) {
  file.put(keyword, ValueKind::real, NumberText(value).view());
}
void kvsPutParam(KvsFile& file, std::string_view keyword, double value) {
  file.put(keyword, ValueKind::real, NumberText(value).view());
}
void kvsPutParam(KvsFile& file, std::string_view keyword, bool value) {
  file.put(keyword, ValueKind::boolean, value ? "true" : "false");
}
void kvsPutParam(KvsFile& file, std::string_view keyword, std::string_view value) {
  file.put(keyword, ValueKind::string, value);
}
void kvsPutParam(KvsFile& file, std::string_view keyword, const char* value) {
  file.put(keyword, ValueKind::string, value);
}
void kvsPutParamFilename(KvsFile& file, std::string_view keyword, std::string_view path) {
  file.put(keyword, ValueKind::fileName, path);
}
void kvsPutParamResultFilename(KvsFile& file, std::string_view keyword, std::string_view path) {
  file.put(keyword, ValueKind::resultFileName, path);
}

KvsSection kvsTargetByNameNum(const KvsFile& file, std::string_view name, int occurrence) {
  return kvsSectionByNameNum(&file.tree().root(), name, occurrence);
}

KvsSection kvsSectionByNameNum(KvsSection parent, std::string_view name, int occurrence) {
  return occurrence < 1 ? nullptr : parent->section(name, static_cast<std::uint32_t>(occurrence));
}

KvsKeyword kvsKeywordByNameNum(KvsSection section, std::string_view name, int occurrence) {
  return occurrence < 1 ? nullptr : section->keyword(name, static_cast<std::uint32_t>(occurrence));
}

int kvsGetNoKeywords(KvsSection section) {
  return static_cast<int>(section->keywordCount());
}
int kvsGetNoParams(KvsKeyword keyword) {
  return static_cast<int>(keyword->values().size());
}

KvsParam kvsParamByNum(KvsKeyword keyword, int number) {
  return number < 1 || number > kvsGetNoParams(keyword)
             ? nullptr
             : &keyword->values()[static_cast<std::size_t>(number) - 1];
}

bool kvsGetBool(KvsParam param) {
  return valueOf(*param, bool()).value_or(false);
}
std::int32_t kvsGetInt(KvsParam param) {
  return valueOf(*param, std::int32_t()).value_or(0);
}
float kvsGetFloat(KvsParam param) {
  return valueOf(*param, float()).value_or(0.0F);
}
double kvsGetDouble(KvsParam param) {
  return valueOf(*param, double()).value_or(0.0);
}
std::string kvsGetString(KvsParam param) {
  return textOf(*param, ValueKind::string).value_or("");
}
std::string kvsGetFilename(KvsParam param) {
  return textOf(*param, ValueKind::fileName).value_or("");
}
std::string kvsGetResultFilename(KvsParam param) {
  return textOf(*param, ValueKind::resultFileName).value_or("");
}

void kvsGetParam(KvsSection section, std::string_view keyword, std::int32_t* value, int occurrence,
                 int number) {
  getNumber(section, keyword, value, occurrence, number);
}
void kvsGetParam(KvsSection section, std::string_view keyword, float* value, int occurrence, int number) {
  getNumber(section, keyword, value, occurrence, number);
}
void kvsGetParam(KvsSection section, std::string_view keyword, double* value, int occurrence, int number) {
  getNumber(section, keyword, value, occurrence, number);
}
void kvsGetParam(KvsSection section, std::string_view keyword, bool* value, int occurrence, int number) {
  getNumber(section, keyword, value, occurrence, number);
}
void kvsGetParam(KvsSection section, std::string_view keyword, std::string* value, int occurrence,
                 int number) {
  getText(section, keyword, ValueKind::string, value, occurrence, number);
}
void kvsGetParamFilename(KvsSection section, std::string_view keyword, std::string* value, int occurrence,
                         int number) {
  getText(section, keyword, ValueKind::fileName, value, occurrence, number);
}
void kvsGetParamResultFilename(KvsSection section, std::string_view keyword, std::string* value,
                               int occurrence, int number) {
  getText(section, keyword, ValueKind::resultFileName, value, occurrence, number);
}

}  // namespace gridbay

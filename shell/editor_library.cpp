#include "shell/editor_library.h"

#include <dlfcn.h>

#include "platform/files/program_path.h"

namespace gridbay::shell {

std::unique_ptr<EditorLibrary> EditorLibrary::load(const QString& name, QString* error) {
  const QString path = QString::fromStdString(pluginFolder()) + "/" + name + ".so";
  void* library = ::dlopen(path.toUtf8().constData(), RTLD_NOW | RTLD_LOCAL);
  if (library == nullptr) {
    *error = QString("There is no editor %1: %2").arg(path, QString::fromUtf8(::dlerror()));
    return nullptr;
  }
  std::unique_ptr<EditorLibrary> editor(new EditorLibrary(library));
  const auto number = reinterpret_cast<int (*)()>(::dlsym(library, "VdGetNumDocTemplates"));
  const auto make = reinterpret_cast<CVdDocTemplate* (*)(int)>(::dlsym(library, "VdGetDocTemplatePtr"));
  const auto nameOf = reinterpret_cast<int (*)(std::string*)>(::dlsym(library, "VdGetEditorString"));
  std::string editorName;
  if (number == nullptr || make == nullptr || nameOf == nullptr || number() < 1 || nameOf(&editorName) == 0) {
    *error = QString("%1 is no editor").arg(path);
    return nullptr;
  }
  editor->editorName_ = QString::fromStdString(editorName);
  editor->template_.reset(make(0));
  return editor;
}

EditorLibrary::~EditorLibrary() {
  template_.reset();
  ::dlclose(library_);
}

QString EditorLibrary::docString(CVdDocTemplate::Field field) const {
  return QString::fromStdString(template_->GetDocString(field));
}

}  // namespace gridbay::shell

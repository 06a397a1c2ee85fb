#include "platform/files/program_path.h"

#include <dlfcn.h>
#include <link.h>

#include <filesystem>

namespace gridbay {
namespace {

namespace fs = std::filesystem;

struct Installation {
  fs::path plugins;
  fs::path data;
};

// The program, or the library that holds this code.
fs::path ownFile() {
  std::error_code error;
  Dl_info info;
  void* object = nullptr;
  const auto* const code = reinterpret_cast<const void*>(&pluginFolder);
  if (::dladdr1(code, &info, &object, RTLD_DL_LINKMAP) != 0 && object != nullptr) {
    const char* const name = static_cast<const link_map*>(object)->l_name;
    // The program itself has no name there.
    if (name != nullptr && *name != '\0') return fs::canonical(name, error);
  }
  return fs::read_symlink("/proc/self/exe", error);
}

Installation installation() {
  const fs::path own = ownFile().parent_path();
  for (fs::path folder = own; folder.has_relative_path(); folder = folder.parent_path()) {
    const std::string name = folder.filename().string();
    if (name != "bin" && !name.starts_with("lib")) continue;
    const fs::path prefix = folder.parent_path();
    std::error_code error;
    if (fs::is_directory(prefix / GRIDBAY_DATA_FOLDER, error))
      return {prefix / GRIDBAY_PLUGIN_FOLDER, prefix / GRIDBAY_DATA_FOLDER};
  }
  return {own, own};
}

}  // namespace

std::string CKTOConfigFiles::GetProgramPath(int withSeparator) {
  const std::string folder = installation().data.string();
  return withSeparator != 0 && !folder.empty() && !folder.ends_with('/') ? folder + '/' : folder;
}

std::string pluginFolder() {
  return installation().plugins.string();
}

}  // namespace gridbay

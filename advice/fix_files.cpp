#include "advice/fix_files.h"

#include <fmt/format.h>

#include <algorithm>
#include <filesystem>
#include <fstream>
#include <iterator>
#include <variant>

#include "platform/files/save_file.h"

namespace gridbay {
Outcome makeFile(const FileCopy&, const std::string& fromPath, const std::string& toPath,
                 const FileProgress& progress) {
  constexpr std::size_t kBytesAtOnce = std::size_t{1} << 20;
  std::ifstream from(fromPath, std::ios::binary);
  std::error_code error;
  const auto size = static_cast<double>(std::filesystem::file_size(fromPath, error));
  if (!from || error) return Failure{fmt::format("{} can't be read", fromPath)};
  Result<FileSave> to = FileSave::begin(toPath);
  if (!to) return Failure{to.error()};
  std::string piece(kBytesAtOnce, '\0');
  double done = 0;
  while (from.read(piece.data(), static_cast<std::streamsize>(piece.size())) || from.gcount() > 0) {
    const auto read = static_cast<std::size_t>(from.gcount());
    if (const Outcome written = to->write(std::string_view(piece).substr(0, read)); !written) return written;
    done += static_cast<double>(read);
    if (progress && !progress(done / size)) return Failure{std::string(kFixStopped)};
  }
  if (from.bad()) return Failure{fmt::format("{} can't be read", fromPath)};
  return to->commit();
}

Outcome makeFiles(std::span<const AdviceFile> files, const FileProgress& progress) {
  for (std::size_t i = 0; i < files.size(); ++i) {
    const AdviceFile& file = files[i];
    const auto part = [&](double done) {
      return !progress || progress((static_cast<double>(i) + done) / static_cast<double>(files.size()));
    };
    std::error_code error;
    Outcome made =
        std::filesystem::exists(file.to, error)
            ? Failure{fmt::format("There is a file {} already", file.to)}
            : std::visit([&](const auto& making) { return makeFile(making, file.from, file.to, part); },
                         file.making);
    if (!made) {
      removeFiles(files.first(i));
      return made;
    }
  }
  return {};
}

void removeFiles(std::span<const AdviceFile> files) {
  std::error_code error;
  for (const AdviceFile& file : files) std::filesystem::remove(file.to, error);
}

bool isSmallAndSame(const std::string& a, const std::string& b) {
  constexpr std::uintmax_t kMost = 100'000;  // bytes
  std::error_code error;
  const std::uintmax_t size = std::filesystem::file_size(a, error);
  if (error || size > kMost || std::filesystem::file_size(b, error) != size || error) return false;
  std::ifstream one(a, std::ios::binary);
  std::ifstream two(b, std::ios::binary);
  using Bytes = std::istreambuf_iterator<char>;
  return one && two && std::equal(Bytes(one), Bytes(), Bytes(two), Bytes());
}

}  // namespace gridbay

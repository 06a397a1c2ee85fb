#pragma once

#include <string>
#include <string_view>

namespace gridbay {

// The absolute form of a name that is relative to a folder; an empty folder is the current one. Dots are
// resolved in the text alone, links are left as they are. An empty name stays empty.
std::string absolutePath(std::string_view name, std::string_view folder);

// The folder of a file as an absolute path.
std::string folderOfFile(std::string_view file);

// How a setup in `folder` names the file `absolute`: relative to the folder, so that both can move together,
// unless the two share no folder but the root, when only the absolute name goes on working.
std::string pathOnFile(std::string_view absolute, std::string_view folder);

// Whether a text can name a file: not empty, no zero byte or control character, each part no longer than the
// file systems allow, and a file name at its end.
bool isUsablePathName(std::string_view path);

// The file that a write to the path replaces: the end of a chain of links, whether or not it exists yet.
std::string endOfLinks(const std::string& path);

// Whether the file exists and can be read.
bool isReadableFile(const std::string& path);

}  // namespace gridbay

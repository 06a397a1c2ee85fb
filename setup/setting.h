#pragma once

#include <string>

#include "platform/result.h"
#include "setup/path_setting.h"
#include "setup/setup_file.h"

namespace gridbay {

// A text of the form PATH=VALUE.
Result<Setting> settingOf(const std::string& text);

// Gives a keyword of the setup at `documentPath` other values: one that the model holds, or an option of the
// engine that its file has. An error names the path, what was given and what is allowed, and leaves the
// keyword as it was.
Outcome applySetting(SetupFile& setup, const Setting& setting, const std::string& documentPath);
// The same for a keyword that the model holds, without the file that it came from.
Outcome applySetting(CGlobalKvs& model, const Setting& setting, const std::string& documentPath);

}  // namespace gridbay

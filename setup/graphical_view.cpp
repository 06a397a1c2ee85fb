#include "setup/graphical_view.h"

#include "core/string_table.h"
#include "platform/files/paths.h"

namespace gridbay {
namespace {

constexpr Text kPicturePath{"d:\\VaneDeck\\dev\\bin\\wave.bmp", 19042};

}  // namespace

void CGraphicalView::OnInitialUpdate() {
  const std::string path(kPicturePath.format);
  picture_ = isReadableFile(path) ? std::optional(path) : std::nullopt;
}

}  // namespace gridbay

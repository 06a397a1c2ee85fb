#include "pages/cell_controls.h"

#include <algorithm>

#include "platform/cartography/cartography.h"

namespace gridbay {
namespace {

constexpr int kLocalCoordinates = 1;
constexpr int kUtmZones = 60;

}  // namespace

void CVdGridResultFileEditCtrl::SetDialogPara(std::string_view filter, std::string_view extension) {
  filter_ = filter;
  extension_ = extension;
}

bool CVdGridResultFileEditCtrl::ShowDialog(std::string* text) {
  std::string name = *text;
  if (!host_.chooseFile(filter_, extension_, &name)) return false;
  *text = AdjustFileExtension(name);
  return true;
}

std::string CVdGridResultFileEditCtrl::AdjustFileExtension(std::string_view text) const {
  if (text.empty() || extension_.empty()) return std::string(text);
  const std::size_t name = text.find_last_of("/\\") + 1;  // 0 when there is no folder
  const std::size_t dot = text.rfind('.');
  const bool hasExtension = dot != text.npos && dot > name;
  return std::string(text.substr(0, hasExtension ? dot : text.size())) + "." + extension_;
}

void CVdMapProjectionGXComboBox::UpdateMapProjection(std::string_view text) {
  projection_ = text;
  choices_ = {projection_};
  const auto add = [this](const std::string& choice) {
    if (std::ranges::find(choices_, choice) == choices_.end()) choices_.push_back(choice);
  };
  add(CVdMapProjection::IDtoProjectionString(kLocalCoordinates));
  for (int zone = 1; zone <= kUtmZones; ++zone) add("UTM-" + std::to_string(zone));
}

}  // namespace gridbay

#pragma once

#include <optional>
#include <string>
#include <string_view>

namespace gridbay {

// The first thing in the page pane, before a tree item is chosen: a picture where there is one, else a text.
class CGraphicalView {
 public:
  static constexpr std::string_view kText = "Here should be the bathymetry";

  void OnInitialUpdate();
  // The picture to draw in the whole pane; nothing when the text is to stand in its middle.
  const std::optional<std::string>& picture() const { return picture_; }
  // Whether a change with this hint asks for a repaint.
  static bool OnUpdate(int hint) { return hint != 1 && hint != 3 && hint != 4; }

 private:
  std::optional<std::string> picture_;
};

}  // namespace gridbay

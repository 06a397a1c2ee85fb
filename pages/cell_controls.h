#pragma once

#include <string>
#include <string_view>
#include <vector>

#include "pages/host.h"

namespace gridbay {

// The edit of a cell that holds the name of a file which the engine will make.
class CVdGridResultFileEditCtrl {
 public:
  explicit CVdGridResultFileEditCtrl(SetupHost& host) : host_(host) {}

  // The filter of the file dialog ("Maps (*.tsb2)|*.tsb2||"), and the extension without its dot.
  void SetDialogPara(std::string_view filter, std::string_view extension);
  // Lets the user pick a name, starting from the text; false when he left it at that.
  bool ShowDialog(std::string* text);
  // The name with the extension: appended where there is none, in place of another one.
  std::string AdjustFileExtension(std::string_view text) const;

 private:
  SetupHost& host_;
  std::string filter_;
  std::string extension_;
};

// The list of a cell that holds a map projection: what it holds, local coordinates, and the zones of UTM.
class CVdMapProjectionGXComboBox {
 public:
  void UpdateMapProjection(std::string_view text);
  const std::string& GetMapProjection() const { return projection_; }
  const std::vector<std::string>& choices() const { return choices_; }

 private:
  std::string projection_;
  std::vector<std::string> choices_;
};

}  // namespace gridbay

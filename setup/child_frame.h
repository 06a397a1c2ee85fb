#pragma once

#include <string>
#include <string_view>

namespace gridbay {

// The frame of a document: the navigation pane on the left, the page pane on the right.
class CV27SetupChildFrame {
 public:
  virtual ~CV27SetupChildFrame() = default;

  // The class of the navigation pane, and of what the page pane shows before a page is chosen.
  const std::string& navigationClass() const { return navigationClass_; }
  virtual std::string_view firstViewClass() const = 0;
  // What a click that would activate the frame leads to.
  virtual int OnMouseActivate() const = 0;

 protected:
  explicit CV27SetupChildFrame(std::string_view navigationClass) : navigationClass_(navigationClass) {}

 private:
  std::string navigationClass_;
};

class CChildFrame final : public CV27SetupChildFrame {
 public:
  static constexpr int kNoActivation = 3;

  CChildFrame() : CV27SetupChildFrame("CNavigationView") {}
  std::string_view firstViewClass() const override { return "CGraphicalView"; }
  int OnMouseActivate() const override { return kNoActivation; }
};

}  // namespace gridbay

#pragma once

#include <QLabel>
#include <QScrollArea>

#include "plugin/setup_editor.h"

namespace gridbay::shell {

// The cover page of an item without a page of its own: a drawing, a title, and what the item's group is for.
class CoverView final : public QScrollArea {
  Q_OBJECT
 public:
  explicit CoverView(QWidget* parent);

  void showCover(const SetupEditor::Cover& cover);
  QLabel& title() { return *title_; }
  QLabel& text() { return *text_; }

 private:
  class Picture;

  Picture* picture_;
  QLabel* title_;
  QLabel* text_;
};

}  // namespace gridbay::shell

#pragma once

#include <QFrame>
#include <QVBoxLayout>
#include <vector>

#include "advice/advice.h"

namespace gridbay::shell {

// What is doubtful on the page that is open, below it; hidden while there is nothing.
class AdviceStrip final : public QFrame {
  Q_OBJECT
 public:
  explicit AdviceStrip(QWidget* parent);

  // Shows the advice of the given places in a list.
  void showAdvice(const std::vector<Advice>& advice, const std::vector<int>& places);

 signals:
  // By the place in the list.
  void chosen(int place);
  void fixWanted(int place);

 private:
  void addLine(const Advice& advice, int place);

  QVBoxLayout* lines_;
};

// An advice in a few words, and with its reason.
QString adviceTip(const Advice& advice);

}  // namespace gridbay::shell

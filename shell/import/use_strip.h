#pragma once

#include <QComboBox>
#include <QLabel>
#include <QPushButton>
#include <functional>
#include <vector>

namespace gridbay::shell {

// Offers a file that has been made to the places that can take it, or says why there are none.
class UseStrip final : public QWidget {
  Q_OBJECT
 public:
  // Where the file can be put to use, "Area 1 of harbour.v27", and how.
  struct Use {
    QString text;
    std::function<void(const QString& file)> act;
  };
  struct Offer {
    std::vector<Use> uses;
    QString why = {};  // there are none
  };

  // The question has the accelerator of the list; `seek` is asked for the places of a file.
  UseStrip(const QString& question, std::function<Offer(const QString& file)> seek, QWidget* parent);

  // Shows what can be done with a file, and again after the places may have changed. What is chosen stays.
  void offer(const QString& file);
  void seekAgain();
  // The inputs as they stand.
  std::vector<QWidget*> inputs() const { return {use_, act_, view_}; }

 signals:
  void viewWanted(const QString& file);

 private:
  std::function<Offer(const QString&)> seek_;
  QString file_;
  Offer offer_;
  QLabel* label_;
  QLabel* why_;
  QComboBox* use_;
  QPushButton* act_;
  QPushButton* view_;
};

}  // namespace gridbay::shell

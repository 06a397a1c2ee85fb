#pragma once

#include <QDateTime>
#include <QLockFile>
#include <QString>
#include <memory>
#include <vector>

namespace gridbay::shell {

// Where unsaved edits are kept while the program runs, so that they outlive its sudden end. Each run has a
// folder of its own with a lock that ends with it; a folder whose lock is free was left behind.
class Recovery {
 public:
  // A document whose edits were left behind.
  struct Left {
    QString copy;
    QString path;       // of the setup; empty for one that was never saved
    QString extension;  // of its editor, with the dot
    QDateTime time;
  };

  // A folder for all runs of all documents.
  explicit Recovery(const QString& folder);
  // A run that ends as it should leaves nothing.
  ~Recovery();

  // Where a document's edits are to be written; the document is told apart by its number.
  QString copyOf(int document) const;
  // Notes what the copy is of. False when nothing can be written there.
  bool note(int document, const QString& path, const QString& extension);
  void forget(int document);

  // What runs that ended suddenly left behind, and its end.
  std::vector<Left> left() const;
  static void discard(const Left& left);

 private:
  QString folder_;
  QString own_;
  std::unique_ptr<QLockFile> lock_;
};

}  // namespace gridbay::shell

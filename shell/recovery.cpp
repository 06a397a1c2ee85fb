#include "shell/recovery.h"

#include <QDir>
#include <QFile>
#include <QFileInfo>
#include <QJsonDocument>
#include <QJsonObject>
#include <QSaveFile>
#include <QUuid>

namespace gridbay::shell {
namespace {

constexpr const char* kLock = "lock";
constexpr const char* kCopy = ".setup";
constexpr const char* kNote = ".json";

}  // namespace

Recovery::Recovery(const QString& folder)
    : folder_(folder), own_(folder + "/" + QUuid::createUuid().toString(QUuid::WithoutBraces)) {
  QDir().mkpath(own_);
  lock_ = std::make_unique<QLockFile>(own_ + "/" + kLock);
  lock_->setStaleLockTime(0);
  lock_->tryLock();
}

Recovery::~Recovery() {
  lock_->unlock();
  QDir(own_).removeRecursively();
}

QString Recovery::copyOf(int document) const {
  return QString("%1/%2%3").arg(own_).arg(document).arg(kCopy);
}

bool Recovery::note(int document, const QString& path, const QString& extension) {
  QSaveFile file(QString("%1/%2%3").arg(own_).arg(document).arg(kNote));
  if (!file.open(QFile::WriteOnly)) return false;
  const QString absolute = path.isEmpty() ? path : QFileInfo(path).absoluteFilePath();
  file.write(QJsonDocument(QJsonObject{{"path", absolute}, {"extension", extension}}).toJson());
  return file.commit();
}

void Recovery::forget(int document) {
  for (const char* ending : {kCopy, kNote})
    QFile::remove(QString("%1/%2%3").arg(own_).arg(document).arg(ending));
}

std::vector<Recovery::Left> Recovery::left() const {
  std::vector<Left> found;
  for (const QFileInfo& run : QDir(folder_).entryInfoList(QDir::Dirs | QDir::NoDotAndDotDot)) {
    if (run.absoluteFilePath() == QFileInfo(own_).absoluteFilePath()) continue;
    QLockFile lock(run.absoluteFilePath() + "/" + kLock);
    lock.setStaleLockTime(0);
    if (!lock.tryLock()) continue;
    std::size_t documents = 0;
    for (const QFileInfo& copy : QDir(run.absoluteFilePath()).entryInfoList({QString("*") + kCopy})) {
      QFile note(copy.absolutePath() + "/" + copy.completeBaseName() + kNote);
      const QJsonObject of =
          note.open(QFile::ReadOnly) ? QJsonDocument::fromJson(note.readAll()).object() : QJsonObject();
      found.push_back(
          {copy.absoluteFilePath(), of["path"].toString(), of["extension"].toString(), copy.lastModified()});
      ++documents;
    }
    lock.unlock();
    if (documents == 0) QDir(run.absoluteFilePath()).removeRecursively();
  }
  return found;
}

void Recovery::discard(const Left& left) {
  const QFileInfo copy(left.copy);
  QFile::remove(copy.absolutePath() + "/" + copy.completeBaseName() + kNote);
  QFile::remove(left.copy);
  const QDir run(copy.absolutePath());
  if (run.entryList({QString("*") + kCopy}).isEmpty()) QDir(run).removeRecursively();
}

}  // namespace gridbay::shell

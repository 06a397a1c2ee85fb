#include "shell/help_dock.h"

#include <QDir>

#include "platform/files/program_path.h"

namespace gridbay::shell {

HelpDock::HelpDock(QWidget* parent)
    : QDockWidget(tr("Help"), parent),
      folder_(QString::fromStdString(CKTOConfigFiles::GetProgramPath(1)) + "help"),
      browser_(new QTextBrowser(this)) {
  setObjectName("help");
  setWidget(browser_);
  browser_->setOpenExternalLinks(true);
}

bool HelpDock::showTopic(int topic, const QString& caption, QString* error) {
  const QDir folder(folder_);
  const QStringList found = folder.entryList({QString("%1-*.md").arg(topic)}, QDir::Files);
  if (found.isEmpty()) {
    *error = tr("There is no help on \"%1\" yet: page %2 was looked for in %3.")
                 .arg(caption)
                 .arg(topic)
                 .arg(folder.absolutePath());
    return false;
  }
  browser_->setSearchPaths({folder.absolutePath()});
  browser_->setSource(QUrl::fromLocalFile(folder.absoluteFilePath(found.first())),
                      QTextDocument::MarkdownResource);
  show();
  raise();
  return true;
}

}  // namespace gridbay::shell

#pragma once

#include <QApplication>
#include <QFile>
#include <QFileDialog>
#include <QLineEdit>
#include <QMessageBox>
#include <QProcess>
#include <QSettings>
#include <QTemporaryDir>
#include <QTest>
#include <QTimer>

#include "shell/main_window.h"

namespace gridbay::shell {

// A window with one setup of two nested grids open, in a folder of its own.
class DesktopFixture : public QObject {
 public:
  static std::vector<std::unique_ptr<EditorLibrary>> libraries() {
    std::vector<std::unique_ptr<EditorLibrary>> found;
    for (const char* name : {"v27nested", "v27nestedwsk"}) {
      QString error;
      found.push_back(EditorLibrary::load(name, &error));
      if (found.back() == nullptr) qFatal("%s", qPrintable(error));
    }
    return found;
  }

 protected:
  void makeEmptyFolder() {
    folder_ = std::make_unique<QTemporaryDir>();
    QSettings::setDefaultFormat(QSettings::IniFormat);
    QSettings::setPath(QSettings::IniFormat, QSettings::UserScope, folder_->path());
    for (const char* home : {"XDG_DATA_HOME", "XDG_CONFIG_HOME"}) qputenv(home, folder_->path().toUtf8());
  }
  void makeFolder() {
    makeEmptyFolder();
    run("make_estuary", {folder_->path()});
    for (const QString name : {"estuary", "inlet"})
      run("v27setup", {"convert", "raster", name + ".asc", name + ".tsb2", "--land", "5", "--crs", "UTM-32"});
  }
  // A fresh window with nothing open, and a fresh setup on disk.
  void makeWindow() {
    QSettings().clear();
    run("v27setup", {"new", "s.v27", "--force", "--area", "estuary.tsb2", "--area", "inlet.tsb2@36,33"});
    openWindow();
  }
  void openWindow() {
    window_ = std::make_unique<MainWindow>(libraries());
    window_->show();
    window_->activateWindow();
    QVERIFY(QTest::qWaitForWindowActive(window_.get()));
  }

  // Runs the command-line tool or the terrain maker of this build.
  void run(const QString& program, const QStringList& arguments) {
    QProcess process;
    process.setWorkingDirectory(folder_->path());
    process.start(QCoreApplication::applicationDirPath() + "/" + program, arguments);
    QVERIFY(process.waitForFinished());
    QCOMPARE(process.exitCode(), 0);
  }
  QString file(const QString& name) const { return folder_->filePath(name); }
  // Chooses the files of the next dialogs, one after the other.
  static void chooseFiles(QStringList names) {
    auto* poll = new QTimer(qApp);
    QObject::connect(poll, &QTimer::timeout, qApp, [poll, names = std::move(names)]() mutable {
      auto* files = qobject_cast<QFileDialog*>(QApplication::activeModalWidget());
      if (files == nullptr) return;
      files->findChild<QLineEdit*>()->setText(names.takeFirst());
      if (names.isEmpty()) poll->deleteLater();
      QMetaObject::invokeMethod(files, "accept");
    });
    poll->start(20);
  }
  static QString textOf(const QString& path) {
    QFile opened(path);
    return opened.open(QFile::ReadOnly) ? QString::fromUtf8(opened.readAll()) : QString();
  }
  static void write(const QString& path, const QByteArray& text) {
    QFile made(path);
    QVERIFY(made.open(QFile::WriteOnly));
    made.write(text);
  }

  DocumentTab& tab() { return *window_->currentDocument(); }
  QLineEdit& edit(const QString& label) {
    QWidget* widget = tab().pane().widgetOf(label);
    return *qobject_cast<QLineEdit*>(widget->focusProxy() != nullptr ? widget->focusProxy() : widget);
  }
  // Types without entering it.
  void type(const QString& label, const QString& text) {
    edit(label).setFocus();
    edit(label).selectAll();
    QTest::keyClicks(&edit(label), text);
  }
  void enter(const QString& label, const QString& text) {
    type(label, text);
    QTest::keyClick(&edit(label), Qt::Key_Return);
  }

  // Answers the message boxes that an action brings, in their order, and returns their texts. A box beyond
  // the answers is left by Escape, and told.
  static QStringList answers(QList<QMessageBox::StandardButton> buttons, const std::function<void()>& act) {
    QStringList texts;
    QTimer poll;
    QObject::connect(&poll, &QTimer::timeout, qApp, [&] {
      auto* box = qobject_cast<QMessageBox*>(QApplication::activeModalWidget());
      if (box == nullptr) return;
      texts << box->text();
      if (buttons.isEmpty()) {
        box->reject();
      } else {
        box->button(buttons.takeFirst())->click();
      }
    });
    poll.start(5);
    act();
    QCoreApplication::processEvents();
    return texts;
  }

  std::unique_ptr<QTemporaryDir> folder_;
  std::unique_ptr<MainWindow> window_;
};

}  // namespace gridbay::shell

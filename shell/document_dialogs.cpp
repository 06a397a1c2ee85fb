// What a document asks of its user: texts, questions, files and small forms.

#include <QApplication>
#include <QDialog>
#include <QEventLoop>
#include <QFileDialog>
#include <QFileInfo>
#include <QGridLayout>
#include <QInputDialog>
#include <QMessageBox>
#include <QMetaMethod>
#include <QPointer>
#include <QProgressDialog>
#include <QPushButton>
#include <QSettings>
#include <QVBoxLayout>
#include <algorithm>
#include <iterator>
#include <numeric>

#include "shell/document_tab.h"

namespace gridbay::shell {
namespace {

constexpr const char* kLastFileGroup = "files/";

// "Grids (*.tsb2)|*.tsb2; *.tb2|All Files (*.*)|*.*||" as the toolkit writes it.
QString toolkitFilter(std::string_view filter) {
  const QStringList parts =
      QString::fromUtf8(filter.data(), static_cast<qsizetype>(filter.size())).split('|', Qt::SkipEmptyParts);
  QStringList filters;
  for (qsizetype i = 0; i + 1 < parts.size(); i += 2) {
    filters << QString("%1 (%2)").arg(parts[i].section(" (", 0, 0), QString(parts[i + 1]).replace(';', ' '));
  }
  return filters.join(";;");
}

// The numbers of the items of a file that meet a request; of all where none does.
std::vector<std::uint32_t> itemsFor(const CVdRqTsbItem& request, const TsbHeader& file) {
  std::vector<std::uint32_t> all(static_cast<std::size_t>(tsbGetNoOfItems(file)));
  std::iota(all.begin(), all.end(), 1U);
  std::vector<std::uint32_t> fitting;
  std::ranges::copy_if(all, std::back_inserter(fitting), [&](std::uint32_t number) {
    return request.fault(file, static_cast<int>(number)).empty();
  });
  return fitting.empty() ? all : fitting;
}

// Lets the user pick an item for each request that wants one; false when he gives up. There is nothing to ask
// where only one will do, or where the file cannot be read.
bool chooseItems(QWidget* parent, CVdFileSelectorDlg& selector) {
  std::vector<std::uint32_t> items = selector.GetSelectedItems();
  TsbHeader file;
  if (items.empty() || tsbFileRead(selector.fileName(), &file) != 0) return true;
  for (std::size_t i = 0; i < std::min(items.size(), selector.requests().size()); ++i) {
    const CVdRqTsbItem& request = *selector.requests()[i];
    const std::vector<std::uint32_t> numbers = itemsFor(request, file);
    QStringList names;
    for (const std::uint32_t number : numbers) {
      const TsbItem& item = *tsbItemD(file, static_cast<int>(number));
      names << QString("%1 %2").arg(number).arg(QString::fromStdString(item.name));
    }
    const auto current = std::ranges::find(numbers, items[i]);
    const auto place = static_cast<int>(current == numbers.end() ? 0 : current - numbers.begin());
    bool chosen = true;
    const QString name = names.size() == 1
                             ? names[0]
                             : QInputDialog::getItem(parent, DocumentTab::tr("Item"),
                                                     QString::fromStdString(request.description()), names,
                                                     place, false, &chosen);
    if (!chosen) return false;
    items[i] = numbers[static_cast<std::size_t>(names.indexOf(name))];
  }
  selector.SetSelectedItems(items);
  return true;
}

}  // namespace

void DocumentTab::show(const std::string& text) {
  QMessageBox::information(this, QApplication::applicationDisplayName(), QString::fromStdString(text));
}

bool DocumentTab::askYesNo(const std::string& question) {
  return QMessageBox::question(this, QApplication::applicationDisplayName(),
                               QString::fromStdString(question)) == QMessageBox::Yes;
}

bool DocumentTab::chooseFile(std::string_view filter, std::string_view extension, std::string* name) {
  QFileDialog dialog(this, {}, QString::fromStdString(*name), toolkitFilter(filter));
  dialog.setDefaultSuffix(QString::fromUtf8(extension.data(), static_cast<qsizetype>(extension.size())));
  if (dialog.exec() != QDialog::Accepted) return false;
  *name = dialog.selectedFiles().value(0).toStdString();
  return true;
}

bool DocumentTab::chooseSaveFile(std::string_view filter, std::string_view extension, std::string* name) {
  QFileDialog dialog(this, {}, QString::fromStdString(*name), toolkitFilter(filter));
  dialog.setAcceptMode(QFileDialog::AcceptSave);
  dialog.setDefaultSuffix(QString::fromUtf8(extension.data(), static_cast<qsizetype>(extension.size())));
  if (dialog.exec() != QDialog::Accepted) return false;
  *name = dialog.selectedFiles().value(0).toStdString();
  return true;
}

// The toolkit's own dialog: into that of a desktop no controls can be put.
bool DocumentTab::chooseFileWithForm(const FileQuestion& question, Form& panel, std::string* name) {
  const auto text = [](std::string_view utf8) {
    return QString::fromUtf8(utf8.data(), static_cast<qsizetype>(utf8.size()));
  };
  const QString key = kLastFileGroup + text(question.purpose);
  const QString last = QSettings().value(key).toString();
  QFileDialog dialog(this, text(question.title), QFileInfo(last).path(), toolkitFilter(question.filter));
  dialog.setOption(QFileDialog::DontUseNativeDialog);
  dialog.setFileMode(QFileDialog::ExistingFile);
  dialog.setDefaultSuffix(text(question.extension));
  if (QFileInfo::exists(last)) dialog.selectFile(last);
  auto* pane = new PagePane(&dialog);
  pane->showForm({}, panel);
  pane->setSizePolicy(QSizePolicy::Preferred, QSizePolicy::Maximum);
  if (auto* layout = qobject_cast<QGridLayout*>(dialog.layout()))
    layout->addWidget(pane, layout->rowCount(), 0, 1, layout->columnCount());
  if (dialog.exec() != QDialog::Accepted) return false;
  pane->commit();
  const QString chosen = dialog.selectedFiles().value(0);
  QSettings().setValue(key, chosen);
  *name = chosen.toStdString();
  return true;
}

// The user can do nothing meanwhile but stop the work, and sees so once it has taken a moment. Where the
// document is closed all the same, as at the end of a session, the work is to stop too.
void DocumentTab::doLongWork(std::string_view title, const std::function<void(const Progress&)>& work) {
  constexpr int kParts = 1000;
  constexpr int kMoment = 500;  // milliseconds
  const QPointer dialog(new QProgressDialog(
      QString::fromUtf8(title.data(), static_cast<qsizetype>(title.size())), tr("Cancel"), 0, kParts, this));
  dialog->setWindowModality(Qt::ApplicationModal);
  dialog->setMinimumDuration(kMoment);
  dialog->setAutoClose(false);
  dialog->setAutoReset(false);
  dialog->setValue(0);
  work([&dialog](double done) {
    const int value = static_cast<int>(done * kParts);
    if (dialog && value != dialog->value()) dialog->setValue(value);
    QCoreApplication::processEvents();
    return dialog && !dialog->wasCanceled();
  });
  delete dialog;
}

// Picks the file, and an item for each request where the file has more than one; a file that does not meet
// the request is told why.
bool DocumentTab::choose(CVdFileSelectorDlg& selector) {
  std::string name = selector.fileName();
  if (!chooseFile(selector.filter(), selector.kind(), &name)) return false;
  selector.SetFileName(name);
  if (!chooseItems(this, selector)) return false;
  const std::vector<std::uint32_t>& items = selector.GetSelectedItems();
  std::string why;
  const bool valid =
      items.empty() ? selector.IsTsbFileValid(name, &why) : selector.IsTsbFileValid(name, items, &why);
  return valid || askYesNo(why + "\n\nTake the file all the same?");
}

bool DocumentTab::editForm(std::string_view title, Form& form, const std::function<std::string()>& fault) {
  return editFormWithPicks(title, form, {}, fault);
}

bool DocumentTab::editFormWithPicks(std::string_view title, Form& form, std::span<const FieldPick> picks,
                                    const std::function<std::string()>& fault) {
  QDialog dialog(this);
  dialog.setWindowTitle(QString::fromUtf8(title.data(), static_cast<qsizetype>(title.size())));
  auto* layout = new QVBoxLayout(&dialog);
  auto* pane = new PagePane(&dialog);
  pane->showForm({}, form, picks);
  auto* buttons = new QDialogButtonBox(QDialogButtonBox::Ok | QDialogButtonBox::Cancel, &dialog);
  connect(buttons, &QDialogButtonBox::accepted, &dialog, [&] {
    pane->commit();
    const std::string text = fault();
    pane->refresh();
    const bool isMarked =
        std::ranges::any_of(form.controls(), [](const Control& control) { return !control.fault.empty(); });
    if (text.empty()) {
      dialog.accept();
    } else if (!isMarked) {
      show(text);
    }
  });
  connect(buttons, &QDialogButtonBox::rejected, &dialog, &QDialog::reject);
  layout->addWidget(pane);
  layout->addWidget(buttons);
  if (isSignalConnected(QMetaMethod::fromSignal(&DocumentTab::pickWanted))) offerPick(*pane, *buttons);
  // It is hidden while the map is pointed at for it, which does not end it.
  QEventLoop untilItEnds;
  connect(&dialog, &QDialog::finished, &untilItEnds, &QEventLoop::quit);
  dialog.setModal(true);
  dialog.show();
  untilItEnds.exec();
  return dialog.result() == QDialog::Accepted;
}

// A button beside those of a dialog, where that has points, for the ones that are at work.
void DocumentTab::offerPick(PagePane& pane, QDialogButtonBox& buttons) {
  connect(&pane, &PagePane::pickWanted, this, [this, &pane] { emit pickWanted(&pane); });
  QPushButton* button = buttons.addButton(tr("Pick on the map"), QDialogButtonBox::ActionRole);
  button->setShortcut(Qt::CTRL | Qt::SHIFT | Qt::Key_M);
  button->setToolTip(tr("Pick on the map what the current cell or field is to hold (%1)")
                         .arg(button->shortcut().toString(QKeySequence::NativeText)));
  button->setFocusPolicy(Qt::NoFocus);  // the cell or field keeps it
  connect(button, &QPushButton::clicked, &pane, &PagePane::pickWanted);
  const auto show = [&pane, button] {
    button->setVisible(pane.hasPoints());
    button->setEnabled(pane.pointPlace().has_value());
  };
  connect(&pane, &PagePane::cellChosen, button, show);
  show();
}

bool DocumentTab::isShiftHeld() {
  return QApplication::keyboardModifiers().testFlag(Qt::ShiftModifier);
}

}  // namespace gridbay::shell

#include "desktop/dialogs.h"

#include <QApplication>
#include <QDir>
#include <QFileDialog>
#include <QFontDialog>

#include "data/runtime_error.h"
#include "desktop/encoding.h"
#include "desktop/printer_font.h"
#include "desktop/printer_setup.h"

namespace marlowbeck {
namespace {

/// "*.qza" is a wish for a name, not one.
bool IsPattern(const std::string& name) { return name.find_first_of("*?") != std::string::npos; }

void DressFileDialog(QFileDialog& dialog, const FileDialogRequest& request) {
  const bool open = request.mode == FileDialogRequest::Mode::Open;
  dialog.setWindowTitle(ToQt(request.title));
  dialog.setDirectory(ToQt(request.folder));
  dialog.setNameFilter(ToQt(request.filter));
  dialog.setDefaultSuffix(ToQt(request.extension));
  dialog.setAcceptMode(open ? QFileDialog::AcceptOpen : QFileDialog::AcceptSave);
  dialog.setFileMode(open ? QFileDialog::ExistingFile : QFileDialog::AnyFile);
  dialog.setOptions(QFileDialog::DontUseNativeDialog | QFileDialog::HideNameFilterDetails);
  // Elsewhere the program asks in its own words.
  dialog.setOption(QFileDialog::DontConfirmOverwrite, !request.asks_before_overwriting);
  if (!request.name.empty() && !IsPattern(request.name)) dialog.selectFile(ToQt(request.name));
}

/// A path with letters that the program has not would be another file's.
std::string InTheProgramsLetters(const QString& path) {
  std::string text = FromQt(path);
  if (ToQt(text) != path) throw RunTimeError(ErrorNumber::BadFileName);
  return text;
}

}  // namespace

std::optional<std::string> DesktopDialogs::File(const FileDialogRequest& request) {
  before_();
  QFileDialog dialog(QApplication::activeWindow());
  DressFileDialog(dialog, request);
  if (dialog.exec() != QDialog::Accepted || dialog.selectedFiles().isEmpty()) return std::nullopt;
  return InTheProgramsLetters(QDir::toNativeSeparators(dialog.selectedFiles().constFirst()));
}

std::optional<FontChoice> DesktopDialogs::Font(const FontChoice& present) {
  before_();
  const QFont font =
      FontOnScreen({present.name, present.size, present.bold, present.italic, false});
  QFontDialog dialog(font, QApplication::activeWindow());
  dialog.setOption(QFontDialog::DontUseNativeDialog);
  const QString shown = dialog.currentFont().family();
  if (dialog.exec() != QDialog::Accepted) return std::nullopt;
  const QFont chosen = dialog.selectedFont();
  // A font keeps its name where only its stand-in was seen.
  const bool same = chosen.family() == shown && HasStandIn(present.name);
  return FontChoice{same ? present.name : FromQt(chosen.family()), chosen.pointSize(),
                    chosen.bold(), chosen.italic()};
}

std::optional<Orientation> DesktopDialogs::PrinterSetup(Orientation present) {
  before_();
  PrinterSetupDialog dialog(printer_.Target(), present, QApplication::activeWindow());
  if (dialog.exec() != QDialog::Accepted) return std::nullopt;
  printer_.SetTarget(dialog.ChosenTarget());
  return dialog.ChosenOrientation();
}

}  // namespace marlowbeck

#include <stdexcept>

#include <QApplication>
#include <QDir>
#include <QFile>
#include <QFileInfo>

#include "desktop/encoding.h"
#include "desktop/input_filter.h"
#include "desktop/page_printer.h"
#include "desktop/scripted/gestures.h"
#include "desktop/scripted/scripted_boxes.h"
#include "desktop/scripted/window_hand.h"
#include "desktop/theme.h"
#include "desktop/windows.h"
#include "drive/face.h"

namespace marlowbeck {
namespace {

/// One for the whole process: a second one is not to be had.
void NeedApplication(int& argc, char** argv) {
  if (QApplication::instance() != nullptr) return;
  if (qEnvironmentVariableIsEmpty("QT_QPA_PLATFORM")) qputenv("QT_QPA_PLATFORM", "offscreen");
  new QApplication(argc, argv);  // lives to the end
  ApplyTheme();
}

/// Works the real windows, and sees what they show.
class WindowFace : public Face {
 public:
  explicit WindowFace(BoxAnswers& answers) : boxes_(answers, [this] { Refresh(); }) {}
  ~WindowFace() override {
    if (filter_) qApp->removeEventFilter(filter_.get());
  }

  Boxes& GetBoxes() override { return boxes_; }
  void Attach(Program& program) override;
  void Refresh() override;
  Outcome Perform(const Action& action) override { return hand_->Perform(action); }
  ControlState Read(const Control& control) override;
  ScreenState Read(const Screen& screen) override;
  std::string FrontScreen() override;
  std::string FocusedControl() override;
  std::optional<std::pair<int, int>> Shot(const std::string& file,
                                          std::optional<std::pair<int, int>> size) override;
  std::unique_ptr<Printer> MakePdfPrinter(const std::string& folder) override;

 private:
  void NameForScreen(const QString& pdf_file);

  ScriptedBoxes boxes_;
  std::unique_ptr<Windows> windows_;
  std::unique_ptr<InputFilter> filter_;
  std::unique_ptr<WindowHand> hand_;
};

void WindowFace::Attach(Program& program) {
  windows_ = std::make_unique<Windows>(program.GetScreens(), program.GetHand(), nullptr);
  windows_->KeepFailures();
  filter_ = std::make_unique<InputFilter>(*windows_);
  hand_ = std::make_unique<WindowHand>(*windows_, boxes_);
  qApp->installEventFilter(filter_.get());
}

void WindowFace::Refresh() {
  windows_->Refresh();
  QApplication::processEvents(QEventLoop::ExcludeUserInputEvents);
}

ControlState WindowFace::Read(const Control& control) {
  const ScreenWindow* const window = windows_->WindowOf(control.InScreen());
  const View* const view = window == nullptr ? nullptr : window->ViewOf(control);
  if (view == nullptr) throw std::logic_error(control.Name() + " is in no window");
  return view->Read();
}

/// A screen without controls has no window, and is never seen.
ScreenState WindowFace::Read(const Screen& screen) {
  const ScreenWindow* const window = windows_->WindowOf(screen);
  if (window == nullptr) return {screen.Name(), screen.Title(), false, screen.Enabled()};
  const QWidget& shown = window->Window();
  return {screen.Name(), FromQt(shown.windowTitle()), shown.isVisible(), shown.isEnabled()};
}

std::string WindowFace::FrontScreen() {
  const ScreenWindow* const active = windows_->WindowOf(QApplication::activeWindow());
  const ScreenWindow* const front = active != nullptr ? active : windows_->Front();
  return front == nullptr || !front->Window().isVisible() ? std::string()
                                                          : front->GetScreen().Name();
}

std::string WindowFace::FocusedControl() {
  const ScreenWindow* const front = windows_->Front();
  const QWidget* const focus = front == nullptr ? nullptr : front->Window().focusWidget();
  const View* const view = focus == nullptr ? nullptr : front->ViewAt(focus);
  if (view == nullptr || !focus->isVisible() || !focus->isEnabled()) return {};
  return front->GetScreen().Name() + "." + view->GetControl().Name();
}

std::unique_ptr<Printer> WindowFace::MakePdfPrinter(const std::string& folder) {
  const QString path = QString::fromStdString(folder);
  return std::make_unique<PagePrinter>([this](const QString& file) { NameForScreen(file); }, path);
}

/// "frmLadder.pdf", and for its next document "frmLadder-2.pdf".
void WindowFace::NameForScreen(const QString& pdf_file) {
  const QDir folder = QFileInfo(pdf_file).dir();
  const QString screen = QString::fromStdString(FrontScreen());
  QString name = screen + ".pdf";
  for (int n = 2; folder.exists(name); ++n) name = screen + '-' + QString::number(n) + ".pdf";
  QFile::rename(pdf_file, folder.filePath(name));
}

std::optional<std::pair<int, int>> WindowFace::Shot(const std::string& file,
                                                    std::optional<std::pair<int, int>> size) {
  const ScreenWindow* const front = windows_->Front();
  if (front == nullptr) return std::nullopt;
  QWidget& window = front->Window();
  if (size) window.resize(size->first, size->second);
  window.activateWindow();  // the focus is only seen in a window that has it
  SettleEvents();
  const QPixmap picture = window.grab();
  if (!picture.save(QString::fromStdString(file), "PNG")) return std::nullopt;
  return std::pair(picture.width(), picture.height());
}

}  // namespace

std::unique_ptr<Face> MakeWindowFace(BoxAnswers& answers, int& argc, char** argv) {
  NeedApplication(argc, argv);
  return std::make_unique<WindowFace>(answers);
}

}  // namespace marlowbeck

#include "desktop/message_boxes.h"

#include <algorithm>
#include <array>
#include <stdexcept>
#include <utility>

#include <QApplication>
#include <QHBoxLayout>
#include <QVBoxLayout>

#include "desktop/encoding.h"

namespace marlowbeck {
namespace {

constexpr const char* kTopic = "topic";
constexpr const char* kAsksName = "asks_name";

struct Look {
  BoxStyle style;
  QMessageBox::Icon icon;
  QMessageBox::StandardButtons buttons;
  QMessageBox::StandardButton focused;  ///< the safe one for whatever deletes
};

const std::array<Look, 7>& Looks() {
  using Box = QMessageBox;
  static const std::array<Look, 7> kLooks = {{
      {BoxStyle::StopOk, Box::Critical, Box::Ok, Box::Ok},
      {BoxStyle::StopOkCancel, Box::Critical, Box::Ok | Box::Cancel, Box::Cancel},
      {BoxStyle::StopYesNo, Box::Critical, Box::Yes | Box::No, Box::No},
      {BoxStyle::WarningOk, Box::Warning, Box::Ok, Box::Ok},
      {BoxStyle::InformationOk, Box::Information, Box::Ok, Box::Ok},
      {BoxStyle::InformationYesNoCancel, Box::Information, Box::Yes | Box::No | Box::Cancel,
       Box::Yes},
      {BoxStyle::InformationYesNo, Box::Information, Box::Yes | Box::No, Box::Yes},
  }};
  return kLooks;
}

constexpr std::array<std::pair<QMessageBox::StandardButton, int>, 4> kNumbers = {{
    {QMessageBox::Ok, kAnswerOk},
    {QMessageBox::Cancel, kAnswerCancel},
    {QMessageBox::Yes, kAnswerYes},
    {QMessageBox::No, kAnswerNo},
}};

/// A box in the middle of long work is no time to wait.
class PlainPointer {
 public:
  PlainPointer() { QApplication::setOverrideCursor(Qt::ArrowCursor); }
  PlainPointer(const PlainPointer&) = delete;
  PlainPointer& operator=(const PlainPointer&) = delete;
  ~PlainPointer() { QApplication::restoreOverrideCursor(); }
};

}  // namespace

void DressBox(QMessageBox& box, BoxStyle style) {
  for (const Look& look : Looks()) {
    if (look.style != style) continue;
    box.setIcon(look.icon);
    box.setStandardButtons(look.buttons);
    box.setDefaultButton(look.focused);
    for (const auto escape : {QMessageBox::Cancel, QMessageBox::No, QMessageBox::Ok}) {
      if (!look.buttons.testFlag(escape)) continue;
      box.setEscapeButton(escape);
      break;
    }
  }
}

BoxStyle StyleOf(const QMessageBox& box) {
  const auto place = std::find_if(Looks().begin(), Looks().end(), [&](const Look& look) {
    return look.icon == box.icon() && look.buttons == box.standardButtons();
  });
  if (place == Looks().end()) throw std::logic_error("a box of no known style");
  return place->style;
}

int NumberOf(QMessageBox::StandardButton button) {
  for (const auto& [known, number] : kNumbers) {
    if (known == button) return number;
  }
  return kAnswerCancel;
}

QMessageBox::StandardButton ButtonNumbered(int number) {
  for (const auto& [button, known] : kNumbers) {
    if (known == number) return button;
  }
  return QMessageBox::NoButton;
}

InputDialog::InputDialog(const InputBoxRequest& request, QWidget* parent,
                         const std::function<void(int topic)>& help)
    : QDialog(parent),
      prompt_(new QLabel(ToQt(request.prompt), this)),
      entry_(new QLineEdit(ToQt(request.default_text), this)),
      ok_(new QPushButton("OK", this)),
      cancel_(new QPushButton("Cancel", this)) {
  setWindowTitle(ToQt(request.title));
  setProperty(kAsksName, request.is_name);
  prompt_->setTextFormat(Qt::PlainText);
  prompt_->setBuddy(entry_);
  entry_->setAccessibleName(Spoken(request.prompt));
  entry_->selectAll();
  ok_->setDefault(true);
  connect(ok_, &QPushButton::clicked, this, &QDialog::accept);
  connect(cancel_, &QPushButton::clicked, this, &QDialog::reject);

  auto* const buttons = new QHBoxLayout;
  if (request.help_topic) {
    help_ = new QPushButton("Help", this);
    help_->setAutoDefault(false);
    help_->setProperty(kTopic, *request.help_topic);
    connect(help_, &QPushButton::clicked, this, [=] { help(*request.help_topic); });
    buttons->addWidget(help_);
  }
  buttons->addStretch();
  buttons->addWidget(ok_);
  buttons->addWidget(cancel_);
  auto* const column = new QVBoxLayout(this);
  column->setContentsMargins(24, 24, 24, 24);
  column->setSpacing(16);
  column->addWidget(prompt_);
  column->addWidget(entry_);
  column->addLayout(buttons);
  entry_->setFocus();
}

std::optional<int> InputDialog::HelpTopic() const {
  return help_ == nullptr ? std::nullopt : std::optional(help_->property(kTopic).toInt());
}

bool InputDialog::AsksName() const { return property(kAsksName).toBool(); }

MessageBoxes::MessageBoxes(std::function<void()> before, std::function<void(int topic)> help)
    : before_(std::move(before)), help_(std::move(help)) {}

int MessageBoxes::ShowMessage(const MessageBoxRequest& request) {
  before_();
  const PlainPointer pointer;
  QMessageBox box(QApplication::activeWindow());
  box.setWindowTitle(ToQt(request.title));
  box.setTextFormat(Qt::PlainText);
  box.setText(ToQt(request.text));
  DressBox(box, request.style);
  Run(box);
  return NumberOf(box.standardButton(box.clickedButton()));
}

std::string MessageBoxes::ShowInput(const InputBoxRequest& request) {
  before_();
  const PlainPointer pointer;
  InputDialog box(request, QApplication::activeWindow(), help_);
  Run(box);
  if (box.result() != QDialog::Accepted) return {};
  const QString text = box.Entry().text();
  return request.is_name ? NameFromQt(text) : FromQt(text);
}

}  // namespace marlowbeck

#pragma once

#include <functional>
#include <optional>

#include <QDialog>
#include <QLabel>
#include <QLineEdit>
#include <QMessageBox>
#include <QPushButton>

#include "platform/platform.h"

namespace marlowbeck {

/// An input box: prompt, entry, OK and Cancel, and Help where there is a topic.
class InputDialog : public QDialog {
 public:
  InputDialog(const InputBoxRequest& request, QWidget* parent,
              const std::function<void(int topic)>& help);
  [[nodiscard]] QLabel& Prompt() const { return *prompt_; }
  [[nodiscard]] QLineEdit& Entry() const { return *entry_; }
  [[nodiscard]] QPushButton& OkButton() const { return *ok_; }
  [[nodiscard]] QPushButton& CancelButton() const { return *cancel_; }
  /// Of the Help button; nothing where there is none.
  [[nodiscard]] std::optional<int> HelpTopic() const;
  [[nodiscard]] bool AsksName() const;

 private:
  QLabel* prompt_;
  QLineEdit* entry_;
  QPushButton* ok_;
  QPushButton* cancel_;
  QPushButton* help_ = nullptr;
};

/// The modal boxes, on the screen.
class MessageBoxes : public Boxes {
 public:
  /// `before` brings the windows up to date; `help` opens a topic.
  MessageBoxes(std::function<void()> before, std::function<void(int topic)> help);

 protected:
  int ShowMessage(const MessageBoxRequest& request) override;
  std::string ShowInput(const InputBoxRequest& request) override;
  /// Waits until a box is answered.
  virtual void Run(QMessageBox& box) { box.exec(); }
  virtual void Run(InputDialog& box) { box.exec(); }

 private:
  std::function<void()> before_;
  std::function<void(int)> help_;
};

/// The buttons, icon and default of a style; Esc answers Cancel, else No, else OK.
void DressBox(QMessageBox& box, BoxStyle style);
/// The style that a box looks like.
[[nodiscard]] BoxStyle StyleOf(const QMessageBox& box);
/// The platform's number of a button.
[[nodiscard]] int NumberOf(QMessageBox::StandardButton button);
[[nodiscard]] QMessageBox::StandardButton ButtonNumbered(int number);

}  // namespace marlowbeck

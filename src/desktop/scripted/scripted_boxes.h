#pragma once

#include <exception>

#include "desktop/message_boxes.h"
#include "drive/face.h"

namespace marlowbeck {

/// Real boxes: what they show is read back and handed to the script, whose answer is then clicked
/// or typed into them.
class ScriptedBoxes : public MessageBoxes {
 public:
  ScriptedBoxes(BoxAnswers& answers, std::function<void()> before)
      : MessageBoxes(std::move(before), [](int) {}), answers_(answers) {}

 protected:
  void Run(QMessageBox& box) override;
  void Run(InputDialog& box) override;

 private:
  void Answer(QDialog& box, const std::function<void()>& answer);

  BoxAnswers& answers_;
};

}  // namespace marlowbeck

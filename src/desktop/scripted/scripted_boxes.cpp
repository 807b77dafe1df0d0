#include "desktop/scripted/scripted_boxes.h"

#include <QAbstractButton>
#include <QTimer>

#include "desktop/encoding.h"
#include "desktop/scripted/gestures.h"

namespace marlowbeck {
namespace {

void ClickOn(QWidget& widget) { ClickMouse(widget, widget.rect().center()); }

MessageBoxRequest Seen(const QMessageBox& box) {
  return {NameFromQt(box.text()), FromQt(box.windowTitle()), StyleOf(box)};
}

InputBoxRequest Seen(const InputDialog& box) {
  return {NameFromQt(box.Prompt().text()), FromQt(box.windowTitle()), FromQt(box.Entry().text()),
          box.HelpTopic(), box.AsksName()};
}

}  // namespace

void ScriptedBoxes::Run(QMessageBox& box) {
  Answer(box, [&] {
    const int number = answers_.ToMessage(Seen(box));
    ClickOn(*box.button(ButtonNumbered(number)));
  });
}

void ScriptedBoxes::Run(InputDialog& box) {
  Answer(box, [&] {
    const auto text = answers_.ToInput(Seen(box));
    if (text) TypeOver(box.Entry(), ToQt(*text));
    ClickOn(text ? box.OkButton() : box.CancelButton());
  });
}

/// Answers once the box stands. What the answering throws takes its way round the box's own loop.
void ScriptedBoxes::Answer(QDialog& box, const std::function<void()>& answer) {
  std::exception_ptr failure;
  QTimer::singleShot(0, &box, [&] {
    try {
      answer();
    } catch (...) {
      failure = std::current_exception();
      box.reject();
    }
  });
  box.exec();
  if (failure) std::rethrow_exception(failure);
}

}  // namespace marlowbeck

#include "session/messages.h"

#include "data/text.h"
#include "session/error_table.h"

namespace marlowbeck {
namespace {

constexpr const char* kTitle = "Marlowbeck Message";
constexpr const char* kErrorTitle = "Marlowbeck Error!";

int Show(const Context& context, std::string_view text, const char* title, BoxStyle style) {
  context.session.MessageText = text;
  context.session.MessageAnswer =
      context.platform.boxes.Message({context.session.MessageText, title, style});
  return context.session.MessageAnswer;
}

int ShowAfter(Beep beep, const Context& context, std::string_view text, BoxStyle style) {
  if (beep == Beep::First) context.platform.sound.Beep();
  return Show(context, text, kTitle, style);
}

}  // namespace

int Warning(const Context& context, std::string_view text, Beep beep) {
  return ShowAfter(beep, context, text, BoxStyle::WarningOk);
}

int GoodMessage(const Context& context, std::string_view text) {
  return Show(context, text, kTitle, BoxStyle::InformationOk);
}

int WarningYesNo(const Context& context, std::string_view text, Beep beep) {
  return ShowAfter(beep, context, text, BoxStyle::InformationYesNo);
}

int WarningYesNoCancel(const Context& context, std::string_view text) {
  return Show(context, text, kTitle, BoxStyle::InformationYesNoCancel);
}

int Confirm(const Context& context, std::string_view text) {
  return Show(context, text, kTitle, BoxStyle::StopOkCancel);
}

int DangerYN(const Context& context, std::string_view text) {
  return Show(context, text, kTitle, BoxStyle::StopYesNo);
}

void GetMessage(const Context& context) {
  const std::string words = UpperCase(ErrorText(context.session.ErrorNumber));
  Show(context, words + "    ", kErrorTitle, BoxStyle::StopOk);
}

void SetWave(const Context& context) { context.platform.sound.Prepare("ok.WAV"); }

void OKSound(const Context& context) { context.platform.sound.Play(); }

}  // namespace marlowbeck

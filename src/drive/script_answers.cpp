#include "drive/script_answers.h"

#include <algorithm>
#include <vector>

#include "data/text.h"

namespace marlowbeck {
namespace {

constexpr int kUnexpectedAnswers = 20;

/// The buttons of a box, the one for somebody who does not know last.
std::vector<int> ButtonsOf(BoxStyle style) {
  switch (style) {
    case BoxStyle::StopOk:
    case BoxStyle::WarningOk:
    case BoxStyle::InformationOk:
      return {kAnswerOk};
    case BoxStyle::StopOkCancel:
      return {kAnswerOk, kAnswerCancel};
    case BoxStyle::InformationYesNoCancel:
      return {kAnswerYes, kAnswerNo, kAnswerCancel};
    case BoxStyle::StopYesNo:
    case BoxStyle::InformationYesNo:
      return {kAnswerYes, kAnswerNo};
  }
  return {kAnswerOk};
}

}  // namespace

void ScriptAnswers::Forget() {
  messages.Forget();
  inputs.Forget();
  files.Forget();
  fonts.Forget();
  setups.Forget();
}

void ScriptAnswers::CountUnexpected(const std::string& asked) {
  if (++unexpected_[asked] > kUnexpectedAnswers) throw BrokenOff{};
}

int ScriptAnswers::ButtonFor(const MessageBoxRequest& seen, bool& unexpected) {
  const std::vector<int> buttons = ButtonsOf(seen.style);
  if (buttons.size() == 1) return buttons.front();
  const int prepared = messages.Take(unexpected).value_or(0);
  // A button that the box does not have cannot be clicked.
  if (std::find(buttons.begin(), buttons.end(), prepared) != buttons.end()) return prepared;
  unexpected = true;
  CountUnexpected(seen.title + '\n' + seen.text);
  return buttons.back();
}

int ScriptAnswers::ToMessage(const MessageBoxRequest& seen) {
  bool unexpected = false;
  const int answer = ButtonFor(seen, unexpected);
  Json box = {{"text", TextAsJson(seen.text)},
              {"title", TextAsJson(seen.title)},
              {"style", static_cast<int>(seen.style)},
              {"answer", answer}};
  if (unexpected) box["unexpected"] = true;
  log_.Add("box", std::move(box));
  return answer;
}

std::optional<std::string> ScriptAnswers::ToInput(const InputBoxRequest& seen) {
  bool unexpected = false;
  std::optional<std::string> answer = inputs.Take(unexpected);
  if (unexpected) CountUnexpected(seen.title + '\n' + seen.prompt);
  if (answer && !seen.is_name) answer = WithoutEscapes(*answer);
  Json input = {{"prompt", TextAsJson(seen.prompt)},
                {"title", TextAsJson(seen.title)},
                {"default", TextAsJson(seen.default_text)}};
  if (seen.help_topic) input["topic"] = *seen.help_topic;
  input["answer"] = TextAsJson(answer.value_or(""));
  if (unexpected) input["unexpected"] = true;
  log_.Add("input", std::move(input));
  return answer;
}

}  // namespace marlowbeck

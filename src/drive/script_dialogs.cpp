#include "drive/script_dialogs.h"

#include <utility>

#include "data/file_system.h"

namespace marlowbeck {
namespace {

/// What the dialog hands back for what the script chose.
std::string HandedBack(const std::string& chosen, const FileDialogRequest& request) {
  if (chosen.starts_with('*')) return request.name.starts_with('*') ? request.name : request.filter;
  if (FileNameOf(chosen) != chosen) return chosen;
  return PathIn(request.folder, chosen);
}

Json FontAsJson(const FontChoice& font) {
  return {{"size", font.size},
          {"name", TextAsJson(font.name)},
          {"bold", font.bold},
          {"italic", font.italic}};
}

}  // namespace

const char* WordOf(Orientation orientation) {
  return orientation == Orientation::Portrait ? "Portrait" : "Landscape";
}

std::optional<std::string> ScriptDialogs::File(const FileDialogRequest& request) {
  bool unexpected = false;
  std::optional<std::string> answer = answers_.files.Take(unexpected);
  if (unexpected) answers_.CountUnexpected(request.title);
  if (answer) answer = HandedBack(*answer, request);
  Json file = {{"mode", request.mode == FileDialogRequest::Mode::Open ? "open" : "save"},
               {"title", TextAsJson(request.title)},
               {"filter", TextAsJson(request.filter)},
               {"folder", TextAsJson(request.folder)},
               {"name", TextAsJson(request.name)},
               {"ext", TextAsJson(request.extension)},
               {"answer", TextAsJson(answer.value_or(""))}};
  if (unexpected) file["unexpected"] = true;
  log_.Add("file", std::move(file));
  return answer;
}

std::optional<FontChoice> ScriptDialogs::Font(const FontChoice& present) {
  bool unexpected = false;
  std::optional<FontChoice> answer = answers_.fonts.Take(unexpected);
  if (unexpected) answers_.CountUnexpected("font");
  Json font = FontAsJson(present);
  font["answer"] = answer ? FontAsJson(*answer) : Json();
  if (unexpected) font["unexpected"] = true;
  log_.Add("font", std::move(font));
  return answer;
}

std::optional<Orientation> ScriptDialogs::PrinterSetup(Orientation /*present*/) {
  bool unexpected = false;
  const std::optional<Orientation> answer = answers_.setups.Take(unexpected);
  if (unexpected) answers_.CountUnexpected("setup");
  Json setup = Json::object({{"answer", answer ? Json(WordOf(*answer)) : Json()}});
  if (unexpected) setup["unexpected"] = true;
  log_.Add("setup", std::move(setup));
  return answer;
}

}  // namespace marlowbeck

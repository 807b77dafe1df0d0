#include "drive/state_json.h"

#include "data/runtime_error.h"

namespace marlowbeck {
namespace {

Json TextsAsJson(const std::vector<std::string>& texts) {
  Json list = Json::array();
  for (const std::string& text : texts) list.push_back(TextAsJson(text));
  return list;
}

/// null for a day that no calendar has.
Json DateAsJson(Date date) {
  try {
    return IsoDate(date);
  } catch (const RunTimeError&) {
    return nullptr;
  }
}

Json DateOrNull(Date date) { return date == Date{} ? Json() : DateAsJson(date); }

const char* WordOf(Meaning meaning) {
  switch (meaning) {
    case Meaning::Red:
      return "red";
    case Meaning::Green:
      return "green";
    case Meaning::Black:
      return "black";
    case Meaning::None:
      break;
  }
  return "";
}

void AddCells(Json& json, const ControlState& state) {
  json["rows"] = state.cells->size();
  json["cols"] = state.cols.value_or(0);
  Json& cells = json["cells"] = Json::array();
  for (const auto& row : *state.cells) cells.push_back(TextsAsJson(row));
  json["row"] = state.row.value_or(0);
  json["col"] = state.col.value_or(0);
}

struct AnyAsJson {
  Json operator()(const std::string& text) const { return TextAsJson(text); }
  Json operator()(int number) const { return number; }
  Json operator()(bool truth) const { return truth; }
  Json operator()(double number) const { return number; }
  Json operator()(Date date) const { return DateOrNull(date); }
  Json operator()(const std::vector<std::string>& texts) const { return TextsAsJson(texts); }
  Json operator()(const std::vector<Date>& dates) const {
    Json list = Json::array();
    for (const Date date : dates) list.push_back(DateOrNull(date));
    return list;
  }
};

}  // namespace

Json AsJson(const ControlState& state) {
  Json json = {{"name", TextAsJson(state.name)},
               {"kind", WordOf(state.kind)},
               {"visible", state.visible},
               {"shown", state.shown},
               {"enabled", state.enabled}};
  if (state.caption) json["caption"] = TextAsJson(*state.caption);
  if (state.text) json["text"] = TextAsJson(*state.text);
  if (state.value) json["value"] = *state.value;
  if (state.lines) json["lines"] = TextsAsJson(*state.lines);
  if (state.index) json["index"] = *state.index;
  if (state.selected) json["selected"] = *state.selected;
  if (state.path) json["path"] = TextAsJson(*state.path);
  if (state.locked) json["locked"] = *state.locked;
  if (state.cells) AddCells(json, state);
  if (state.date) json["value"] = DateAsJson(*state.date);
  if (state.progress) {
    json["min"] = state.progress->min;
    json["max"] = state.progress->max;
    json["value"] = state.progress->value;
  }
  if (state.color != Meaning::None) json["color"] = WordOf(state.color);
  return json;
}

Json AsJson(const ScreenState& state) {
  return {{"name", TextAsJson(state.name)},
          {"title", TextAsJson(state.title)},
          {"visible", state.visible},
          {"enabled", state.enabled}};
}

Json AsJson(const Session& session) {
  Json json = Json::object();
  for (const SessionField& field : FieldsOf(session)) {
    json[std::string(field.name)] = std::visit(AnyAsJson{}, field.value);
  }
  return json;
}

}  // namespace marlowbeck

#pragma once

#include <string_view>

#include <nlohmann/json.hpp>

#include "data/text.h"

namespace marlowbeck {

/// Keeps the order in which fields are set, so that an answer begins with how it went.
using Json = nlohmann::ordered_json;

/// A text of the program as JSON has it.
[[nodiscard]] inline Json TextAsJson(std::string_view text) { return ShownText(text); }

}  // namespace marlowbeck

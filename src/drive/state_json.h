#pragma once

#include "data/session.h"
#include "drive/face.h"
#include "drive/json.h"

namespace marlowbeck {

/// The state of a control with the fields that its kind has.
[[nodiscard]] Json AsJson(const ControlState& state);
[[nodiscard]] Json AsJson(const ScreenState& state);
[[nodiscard]] Json AsJson(const Session& session);

}  // namespace marlowbeck

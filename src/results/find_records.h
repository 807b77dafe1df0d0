#pragma once

#include <cstdint>
#include <optional>
#include <string>
#include <string_view>

#include "data/channels.h"
#include "data/records.h"
#include "data/session.h"

namespace marlowbeck {

/// The first player of the team and grade in hand whose surname, `separator` and first name are
/// `line`. Leaves all channels closed.
[[nodiscard]] std::optional<PlayerRecord> FindPlayerByLine(Session& session, Channels& channels,
                                                           std::string_view line,
                                                           std::string_view separator);

/// Whose result, against whom and when. Names are trimmed.
struct ResultKey {
  std::int32_t id = 0;
  std::string team;
  std::string opposition;
  Date date;

  [[nodiscard]] bool Fits(const ResultView& result) const {
    return result.GameDate() == date && result.ID() == id && result.Team() == team &&
           result.Opposition() == opposition;
  }
};

}  // namespace marlowbeck

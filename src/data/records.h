#pragma once

#include <array>
#include <bit>
#include <cstddef>
#include <cstdint>
#include <span>
#include <string>
#include <string_view>

#include "data/date.h"
#include "data/integer.h"

namespace marlowbeck {

// The fixed-length records of a competition, told once as bytes. All numbers are little-endian,
// without padding; a text is left-justified single bytes filled with blanks; a date is an 8-byte
// IEEE double. Records are numbered from 1, record r of length L begins at byte (r - 1) * L.

enum class FieldKind : std::uint8_t { Integer16, Long32, Text, Day };

struct Field {
  std::string_view name;
  std::size_t offset;
  std::size_t width;
  FieldKind kind;
};

inline constexpr std::size_t kPlayerLength = 156;
inline constexpr std::size_t kResultLength = 148;
inline constexpr std::size_t kLadderLength = 80;

inline constexpr std::array<Field, 8> kPlayerFields = {{
    {"ID", 0, 4, FieldKind::Long32},
    {"Surname", 4, 30, FieldKind::Text},
    {"FirstName", 34, 30, FieldKind::Text},
    {"Team", 64, 30, FieldKind::Text},
    {"Grade", 94, 20, FieldKind::Text},
    {"Reserved1", 114, 8, FieldKind::Day},
    {"Reserved2", 122, 30, FieldKind::Text},
    {"BestOfThree", 152, 4, FieldKind::Long32},
}};

inline constexpr std::array<Field, 18> kResultFields = {{
    {"ID", 0, 4, FieldKind::Long32},
    {"Team", 4, 30, FieldKind::Text},
    {"Opposition", 34, 30, FieldKind::Text},
    {"Grade", 64, 20, FieldKind::Text},
    {"GameDate", 84, 8, FieldKind::Day},
    {"Forfeit", 92, 30, FieldKind::Text},
    {"Legs", 122, 2, FieldKind::Integer16},
    {"Aggregate", 124, 2, FieldKind::Integer16},
    {"Shots", 126, 4, FieldKind::Long32},
    {"HighScore", 130, 2, FieldKind::Integer16},
    {"Centuries", 132, 2, FieldKind::Integer16},
    {"Scores180", 134, 2, FieldKind::Integer16},
    {"Peg1", 136, 2, FieldKind::Integer16},
    {"Peg2", 138, 2, FieldKind::Integer16},
    {"Peg3", 140, 2, FieldKind::Integer16},
    {"Peg4", 142, 2, FieldKind::Integer16},
    {"Peg5", 144, 2, FieldKind::Integer16},
    {"Peg6", 146, 2, FieldKind::Integer16},
}};

inline constexpr std::array<Field, 9> kLadderFields = {{
    {"HomeTeam", 0, 30, FieldKind::Text},
    {"AwayTeam", 30, 30, FieldKind::Text},
    {"HomeScore", 60, 2, FieldKind::Integer16},
    {"AwayScore", 62, 2, FieldKind::Integer16},
    {"HomePenalty", 64, 2, FieldKind::Integer16},
    {"AwayPenalty", 66, 2, FieldKind::Integer16},
    {"Reserved1", 68, 2, FieldKind::Integer16},
    {"Reserved2", 70, 2, FieldKind::Integer16},
    {"GameDate", 72, 8, FieldKind::Day},
}};

/// True when the fields follow each other without gaps and fill the record.
template <std::size_t N>
constexpr bool FillsRecord(const std::array<Field, N>& fields, std::size_t length) {
  std::size_t next = 0;
  for (const Field& field : fields) {
    if (field.offset != next) return false;
    next += field.width;
  }
  return next == length;
}
static_assert(FillsRecord(kPlayerFields, kPlayerLength));
static_assert(FillsRecord(kResultFields, kResultLength));
static_assert(FillsRecord(kLadderFields, kLadderLength));

/// The field of that name, which must be there.
template <std::size_t N>
consteval Field FieldNamed(const std::array<Field, N>& fields, std::string_view name) {
  for (const Field& field : fields) {
    if (field.name == name) return field;
  }
  throw "there is no such field";
}

using Bytes = std::span<const std::byte>;

/// Numbers and texts at an offset of a record's bytes.
template <typename Unsigned>
[[nodiscard]] Unsigned ReadUnsigned(Bytes record, std::size_t offset) {
  Unsigned value = 0;
  for (std::size_t i = sizeof(Unsigned); i-- > 0;) {
    value = static_cast<Unsigned>(value << 8) | std::to_integer<Unsigned>(record[offset + i]);
  }
  return value;
}
[[nodiscard]] inline std::int16_t ReadInteger(Bytes record, std::size_t offset) {
  return static_cast<std::int16_t>(ReadUnsigned<std::uint16_t>(record, offset));
}
[[nodiscard]] inline std::int32_t ReadLong(Bytes record, std::size_t offset) {
  return static_cast<std::int32_t>(ReadUnsigned<std::uint32_t>(record, offset));
}
[[nodiscard]] inline Date ReadDate(Bytes record, std::size_t offset) {
  return Date{std::bit_cast<double>(ReadUnsigned<std::uint64_t>(record, offset))};
}
[[nodiscard]] std::string_view ReadText(Bytes record, std::size_t offset, std::size_t width);
/// Fills a field with a text, cut or padded to its width.
void WriteText(std::span<std::byte> record, const Field& field, std::string_view text);

/// One player of one grade. Texts are as the record holds them, padding included, once decoded.
struct PlayerRecord {
  std::int32_t ID = 0;
  std::string Surname;
  std::string FirstName;
  std::string Team;
  std::string Grade;
  Date Reserved1;         ///< carried along unread
  std::string Reserved2;  ///< always blank
  std::int32_t BestOfThree = 0;
};

/// One player's game night.
struct ResultRecord {
  std::int32_t ID = 0;
  std::string Team;
  std::string Opposition;
  std::string Grade;  ///< nothing relies on it: the grade of a result is that of its file
  Date GameDate;
  std::string Forfeit;  ///< "F" for a forfeit, else blank
  std::int16_t Legs = 0;
  std::int16_t Aggregate = 0;
  std::int32_t Shots = 0;
  std::int16_t HighScore = 0;
  std::int16_t Centuries = 0;
  std::int16_t Scores180 = 0;
  std::array<std::int16_t, 6> Pegs{};  ///< Peg1 to Peg6, two to each game
};

/// One match between two teams.
struct LadderRecord {
  std::string HomeTeam;
  std::string AwayTeam;
  std::int16_t HomeScore = 0;
  std::int16_t AwayScore = 0;
  std::int16_t HomePenalty = 0;
  std::int16_t AwayPenalty = 0;
  std::int16_t Reserved1 = 0;
  std::int16_t Reserved2 = 0;
  Date GameDate;
};

using PlayerBytes = std::array<std::byte, kPlayerLength>;
using ResultBytes = std::array<std::byte, kResultLength>;
using LadderBytes = std::array<std::byte, kLadderLength>;

[[nodiscard]] PlayerBytes Encode(const PlayerRecord& record);
[[nodiscard]] ResultBytes Encode(const ResultRecord& record);
[[nodiscard]] LadderBytes Encode(const LadderRecord& record);

[[nodiscard]] PlayerRecord DecodePlayer(Bytes bytes);
[[nodiscard]] ResultRecord DecodeResult(Bytes bytes);
[[nodiscard]] LadderRecord DecodeLadder(Bytes bytes);

/// A player record read in place: fields are decoded when they are asked for, texts trimmed and
/// pointing into the bytes. For the passes over whole files.
class PlayerView {
 public:
  explicit PlayerView(Bytes bytes) : bytes_(bytes) {}
  [[nodiscard]] std::int32_t ID() const { return ReadLong(bytes_, 0); }
  [[nodiscard]] std::string_view Surname() const;
  [[nodiscard]] std::string_view FirstName() const;
  [[nodiscard]] std::string_view Team() const;
  [[nodiscard]] std::string_view Grade() const;
  [[nodiscard]] std::int32_t BestOfThree() const { return ReadLong(bytes_, 152); }
  /// Surname, `separator`, first name.
  [[nodiscard]] std::string FullName(std::string_view separator) const;

 private:
  Bytes bytes_;
};

/// A result record read in place, as PlayerView.
class ResultView {
 public:
  explicit ResultView(Bytes bytes) : bytes_(bytes) {}
  [[nodiscard]] std::int32_t ID() const { return ReadLong(bytes_, 0); }
  [[nodiscard]] std::string_view Team() const;
  [[nodiscard]] std::string_view Opposition() const;
  [[nodiscard]] std::string_view OppositionAsStored() const;  ///< padding included
  [[nodiscard]] Date GameDate() const { return ReadDate(bytes_, 84); }
  [[nodiscard]] bool IsForfeit() const;  ///< the mark, trimmed, is "F"
  [[nodiscard]] std::int16_t Legs() const { return ReadInteger(bytes_, 122); }
  [[nodiscard]] std::int16_t Aggregate() const { return ReadInteger(bytes_, 124); }
  [[nodiscard]] std::int32_t Shots() const { return ReadLong(bytes_, 126); }
  [[nodiscard]] std::int16_t HighScore() const { return ReadInteger(bytes_, 130); }
  [[nodiscard]] std::int16_t Centuries() const { return ReadInteger(bytes_, 132); }
  [[nodiscard]] std::int16_t Scores180() const { return ReadInteger(bytes_, 134); }
  /// `peg` from 0 to 5.
  [[nodiscard]] std::int16_t Peg(std::size_t peg) const {
    return ReadInteger(bytes_, 136 + 2 * peg);
  }

 private:
  Bytes bytes_;
};

/// A ladder record read in place, as PlayerView.
class LadderView {
 public:
  explicit LadderView(Bytes bytes) : bytes_(bytes) {}
  [[nodiscard]] std::string_view HomeTeam() const;
  [[nodiscard]] std::string_view AwayTeam() const;
  [[nodiscard]] std::int16_t HomeScore() const { return ReadInteger(bytes_, 60); }
  [[nodiscard]] std::int16_t AwayScore() const { return ReadInteger(bytes_, 62); }
  [[nodiscard]] std::int16_t HomePenalty() const { return ReadInteger(bytes_, 64); }
  [[nodiscard]] std::int16_t AwayPenalty() const { return ReadInteger(bytes_, 66); }
  [[nodiscard]] Date GameDate() const { return ReadDate(bytes_, 72); }
  /// The two names as they lie in the record, padding included.
  [[nodiscard]] Bytes HomeField() const { return bytes_.first(30); }
  [[nodiscard]] Bytes AwayField() const { return bytes_.subspan(30, 30); }

 private:
  Bytes bytes_;
};

}  // namespace marlowbeck

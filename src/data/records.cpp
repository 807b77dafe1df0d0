#include "data/records.h"

#include <algorithm>
#include <bit>

#include "data/text.h"

namespace marlowbeck {
namespace {

template <typename Unsigned>
void WriteUnsigned(std::span<std::byte> record, std::size_t offset, Unsigned value) {
  for (std::size_t i = 0; i < sizeof(Unsigned); ++i) {
    record[offset + i] = static_cast<std::byte>(value >> (8 * i));
  }
}

/// Writes the fields of a record one after another, in the order of its field table.
class FieldWriter {
 public:
  FieldWriter(std::span<std::byte> record, std::span<const Field> fields)
      : record_(record), fields_(fields) {}

  void Integer(std::int16_t value) {
    WriteUnsigned(record_, Next().offset, static_cast<std::uint16_t>(value));
  }
  void Long(std::int32_t value) {
    WriteUnsigned(record_, Next().offset, static_cast<std::uint32_t>(value));
  }
  void Day(Date value) {
    WriteUnsigned(record_, Next().offset, std::bit_cast<std::uint64_t>(value.days));
  }
  void Text(std::string_view value) { WriteText(record_, Next(), value); }

 private:
  const Field& Next() { return fields_[next_++]; }

  std::span<std::byte> record_;
  std::span<const Field> fields_;
  std::size_t next_ = 0;
};

/// Reads the fields of a record one after another, in the order of its field table.
class FieldReader {
 public:
  FieldReader(Bytes record, std::span<const Field> fields) : record_(record), fields_(fields) {}

  std::int16_t Integer() { return ReadInteger(record_, Next().offset); }
  std::int32_t Long() { return ReadLong(record_, Next().offset); }
  Date Day() { return ReadDate(record_, Next().offset); }
  std::string Text() {
    const Field& field = Next();
    return std::string(ReadText(record_, field.offset, field.width));
  }

 private:
  const Field& Next() { return fields_[next_++]; }

  Bytes record_;
  std::span<const Field> fields_;
  std::size_t next_ = 0;
};

}  // namespace

std::string_view ReadText(Bytes record, std::size_t offset, std::size_t width) {
  // Bytes may be looked at as characters: this is no cast of a record's layout.
  return {reinterpret_cast<const char*>(record.data()) + offset, width};
}

void WriteText(std::span<std::byte> record, const Field& field, std::string_view text) {
  for (std::size_t i = 0; i < field.width; ++i) {
    record[field.offset + i] = static_cast<std::byte>(i < text.size() ? text[i] : ' ');
  }
}

PlayerBytes Encode(const PlayerRecord& record) {
  PlayerBytes bytes{};
  FieldWriter write(bytes, kPlayerFields);
  write.Long(record.ID);
  write.Text(record.Surname);
  write.Text(record.FirstName);
  write.Text(record.Team);
  write.Text(record.Grade);
  write.Day(record.Reserved1);
  write.Text(record.Reserved2);
  write.Long(record.BestOfThree);
  return bytes;
}

ResultBytes Encode(const ResultRecord& record) {
  ResultBytes bytes{};
  FieldWriter write(bytes, kResultFields);
  write.Long(record.ID);
  write.Text(record.Team);
  write.Text(record.Opposition);
  write.Text(record.Grade);
  write.Day(record.GameDate);
  write.Text(record.Forfeit);
  write.Integer(record.Legs);
  write.Integer(record.Aggregate);
  write.Long(record.Shots);
  write.Integer(record.HighScore);
  write.Integer(record.Centuries);
  write.Integer(record.Scores180);
  for (const std::int16_t peg : record.Pegs) write.Integer(peg);
  return bytes;
}

LadderBytes Encode(const LadderRecord& record) {
  LadderBytes bytes{};
  FieldWriter write(bytes, kLadderFields);
  write.Text(record.HomeTeam);
  write.Text(record.AwayTeam);
  write.Integer(record.HomeScore);
  write.Integer(record.AwayScore);
  write.Integer(record.HomePenalty);
  write.Integer(record.AwayPenalty);
  write.Integer(record.Reserved1);
  write.Integer(record.Reserved2);
  write.Day(record.GameDate);
  return bytes;
}

PlayerRecord DecodePlayer(Bytes bytes) {
  FieldReader read(bytes, kPlayerFields);
  PlayerRecord record;
  record.ID = read.Long();
  record.Surname = read.Text();
  record.FirstName = read.Text();
  record.Team = read.Text();
  record.Grade = read.Text();
  record.Reserved1 = read.Day();
  record.Reserved2 = read.Text();
  record.BestOfThree = read.Long();
  return record;
}

ResultRecord DecodeResult(Bytes bytes) {
  FieldReader read(bytes, kResultFields);
  ResultRecord record;
  record.ID = read.Long();
  record.Team = read.Text();
  record.Opposition = read.Text();
  record.Grade = read.Text();
  record.GameDate = read.Day();
  record.Forfeit = read.Text();
  record.Legs = read.Integer();
  record.Aggregate = read.Integer();
  record.Shots = read.Long();
  record.HighScore = read.Integer();
  record.Centuries = read.Integer();
  record.Scores180 = read.Integer();
  for (std::int16_t& peg : record.Pegs) peg = read.Integer();
  return record;
}

LadderRecord DecodeLadder(Bytes bytes) {
  FieldReader read(bytes, kLadderFields);
  LadderRecord record;
  record.HomeTeam = read.Text();
  record.AwayTeam = read.Text();
  record.HomeScore = read.Integer();
  record.AwayScore = read.Integer();
  record.HomePenalty = read.Integer();
  record.AwayPenalty = read.Integer();
  record.Reserved1 = read.Integer();
  record.Reserved2 = read.Integer();
  record.GameDate = read.Day();
  return record;
}

std::string_view PlayerView::Surname() const { return Trimmed(ReadText(bytes_, 4, 30)); }
std::string_view PlayerView::FirstName() const { return Trimmed(ReadText(bytes_, 34, 30)); }
std::string_view PlayerView::Team() const { return Trimmed(ReadText(bytes_, 64, 30)); }
std::string_view PlayerView::Grade() const { return Trimmed(ReadText(bytes_, 94, 20)); }

std::string PlayerView::FullName(std::string_view separator) const {
  std::string name(Surname());
  name += separator;
  name += FirstName();
  return name;
}

std::string_view ResultView::Team() const { return Trimmed(ReadText(bytes_, 4, 30)); }
std::string_view ResultView::Opposition() const { return Trimmed(ReadText(bytes_, 34, 30)); }
std::string_view ResultView::OppositionAsStored() const { return ReadText(bytes_, 34, 30); }
bool ResultView::IsForfeit() const { return Trimmed(ReadText(bytes_, 92, 30)) == "F"; }

std::string_view LadderView::HomeTeam() const { return Trimmed(ReadText(bytes_, 0, 30)); }
std::string_view LadderView::AwayTeam() const { return Trimmed(ReadText(bytes_, 30, 30)); }

}  // namespace marlowbeck

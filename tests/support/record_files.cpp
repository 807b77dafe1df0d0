#include "support/record_files.h"

#include <sstream>

namespace marlowbeck {
namespace {

constexpr int kDifferencesTold = 20;

Bytes AsBytes(std::string_view text) { return std::as_bytes(std::span(text)); }

template <typename Decode>
auto Decoded(std::string_view file, std::size_t length, Decode decode) {
  std::vector<decltype(decode(Bytes()))> records;
  for (std::size_t at = 0; at + length <= file.size(); at += length) {
    records.push_back(decode(AsBytes(file.substr(at, length))));
  }
  return records;
}

template <typename Record>
std::string Encoded(const std::vector<Record>& records) {
  std::string file;
  for (const Record& record : records) {
    for (const std::byte byte : Encode(record)) file += static_cast<char>(byte);
  }
  return file;
}

/// A field's value in words.
std::string ValueOf(const Field& field, Bytes record) {
  std::ostringstream words;
  switch (field.kind) {
    case FieldKind::Integer16:
      words << ReadInteger(record, field.offset);
      break;
    case FieldKind::Long32:
      words << ReadLong(record, field.offset);
      break;
    case FieldKind::Day:
      words << ReadDate(record, field.offset).days;
      break;
    case FieldKind::Text:
      words << '"' << ReadText(record, field.offset, field.width) << '"';
      break;
  }
  return words.str();
}

class Comparison {
 public:
  Comparison(std::string_view actual, std::string_view expected, std::size_t length)
      : actual_(actual), expected_(expected), length_(length) {}

  ::testing::AssertionResult Over(std::span<const Field> fields) {
    if (actual_ == expected_) return ::testing::AssertionSuccess();
    if (actual_.size() != expected_.size()) {
      words_ << actual_.size() << " bytes, expected " << expected_.size() << '\n';
    }
    const std::size_t whole = std::min(actual_.size(), expected_.size()) / length_;
    for (std::size_t number = 0; number < whole; ++number) CompareRecord(number, fields);
    if (told_ > kDifferencesTold) words_ << "and " << told_ - kDifferencesTold << " more\n";
    if (told_ == 0 && actual_.size() == expected_.size()) words_ << "the bytes behind differ\n";
    return ::testing::AssertionFailure() << words_.str();
  }

 private:
  void CompareRecord(std::size_t number, std::span<const Field> fields) {
    const Bytes actual = AsBytes(actual_.substr(number * length_, length_));
    const Bytes expected = AsBytes(expected_.substr(number * length_, length_));
    for (const Field& field : fields) {
      const auto mine = actual.subspan(field.offset, field.width);
      const auto theirs = expected.subspan(field.offset, field.width);
      if (std::equal(mine.begin(), mine.end(), theirs.begin(), theirs.end())) continue;
      if (++told_ > kDifferencesTold) continue;
      words_ << "record " << number + 1 << ", " << field.name << ": " << ValueOf(field, actual)
             << ", expected " << ValueOf(field, expected) << '\n';
    }
  }

  std::string_view actual_;
  std::string_view expected_;
  std::size_t length_;
  int told_ = 0;
  std::ostringstream words_;
};

}  // namespace

std::vector<PlayerRecord> PlayersIn(std::string_view file) {
  return Decoded(file, kPlayerLength, DecodePlayer);
}

std::vector<ResultRecord> ResultsIn(std::string_view file) {
  return Decoded(file, kResultLength, DecodeResult);
}

std::vector<LadderRecord> MatchesIn(std::string_view file) {
  return Decoded(file, kLadderLength, DecodeLadder);
}

std::string FileOf(const std::vector<PlayerRecord>& players) { return Encoded(players); }
std::string FileOf(const std::vector<ResultRecord>& results) { return Encoded(results); }
std::string FileOf(const std::vector<LadderRecord>& matches) { return Encoded(matches); }

PlayerRecord Player(int id, std::string_view surname, std::string_view first_name,
                    std::string_view team, std::string_view grade, int code) {
  PlayerRecord player;
  player.ID = id;
  player.Surname = surname;
  player.FirstName = first_name;
  player.Team = team;
  player.Grade = grade;
  player.BestOfThree = code;
  return player;
}

::testing::AssertionResult SamePlayers(std::string_view actual, std::string_view expected) {
  return Comparison(actual, expected, kPlayerLength).Over(kPlayerFields);
}

::testing::AssertionResult SameResults(std::string_view actual, std::string_view expected) {
  return Comparison(actual, expected, kResultLength).Over(kResultFields);
}

::testing::AssertionResult SameMatches(std::string_view actual, std::string_view expected) {
  return Comparison(actual, expected, kLadderLength).Over(kLadderFields);
}

}  // namespace marlowbeck

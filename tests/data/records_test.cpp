#include "data/records.h"

#include <cmath>
#include <string>

#include <gtest/gtest.h>

#include "data/text.h"

namespace marlowbeck {
namespace {

using namespace std::string_literals;

template <typename Encoded>
std::string Text(const Encoded& bytes) {
  return {reinterpret_cast<const char*>(bytes.data()), bytes.size()};
}

Bytes AsBytes(const std::string& text) { return std::as_bytes(std::span(text)); }

std::string Blanks(std::size_t count) { return std::string(count, ' '); }

// 31 March 2004, day 38077, is 0x40E297A000000000 as a double.
const std::string kDay38077 = "\x00\x00\x00\x00\xA0\x97\xE2\x40"s;

const std::string kPlayer = "\x04\x03\x02\x01"s       // 0x01020304
                            + "Archer" + Blanks(24)   //
                            + "Jo" + Blanks(28)       //
                            + "Rovers" + Blanks(24)   //
                            + "A Grade" + Blanks(13)  //
                            + kDay38077 + Blanks(30)  //
                            + "\x4A\x01\x00\x00"s;    // 330

PlayerRecord Player() {
  PlayerRecord player;
  player.ID = 0x01020304;
  player.Surname = "Archer";
  player.FirstName = "Jo";
  player.Team = "Rovers";
  player.Grade = "A Grade";
  player.Reserved1 = Date{38077};
  player.BestOfThree = 330;
  return player;
}

const std::string kResult = "\xFF\xFF\xFF\xFF"s             // -1
                            + "Rovers" + Blanks(24)         //
                            + "Hawks" + Blanks(25)          //
                            + Blanks(20)                    //
                            + kDay38077                     //
                            + "F" + Blanks(29)              //
                            + "\xFE\xFF"s                   // legs -2
                            + "\xFF\x7F"s                   // aggregate 32767
                            + "\xA0\x86\x01\x00"s           // shots 100000
                            + "\xB4\x00"s                   // high score 180
                            + "\x01\x00\x02\x00"s           // centuries, 180s
                            + "\x0B\x00\x0C\x00\x0D\x00"s   // pegs 11, 12, 13
                            + "\x0E\x00\x0F\x00\x00\x80"s;  // pegs 14, 15, -32768

ResultRecord Result() {
  ResultRecord result;
  result.ID = -1;
  result.Team = "Rovers";
  result.Opposition = "Hawks";
  result.GameDate = Date{38077};
  result.Forfeit.assign(1, 'F');
  result.Legs = -2;
  result.Aggregate = 32767;
  result.Shots = 100000;
  result.HighScore = 180;
  result.Centuries = 1;
  result.Scores180 = 2;
  result.Pegs = {11, 12, 13, 14, 15, -32768};
  return result;
}

const std::string kLadder = "Rovers" + Blanks(24)   //
                            + "Hawks" + Blanks(25)  //
                            + "\x09\x00\x06\x00"s   // 9 to 6
                            + "\x02\x00\xFD\xFF"s   // +2, -3
                            + "\x00\x00\x00\x00"s + kDay38077;

TEST(PlayerRecord, LiesByteByByteAtItsOffsets) {
  EXPECT_EQ(Text(Encode(Player())), kPlayer);
  EXPECT_EQ(kPlayer.size(), 156U);
}

TEST(ResultRecord, LiesByteByByteAtItsOffsets) {
  EXPECT_EQ(Text(Encode(Result())), kResult);
  EXPECT_EQ(kResult.size(), 148U);
}

TEST(LadderRecord, LiesByteByByteAtItsOffsets) {
  LadderRecord ladder;
  ladder.HomeTeam = "Rovers";
  ladder.AwayTeam = "Hawks";
  ladder.HomeScore = 9;
  ladder.AwayScore = 6;
  ladder.HomePenalty = 2;
  ladder.AwayPenalty = -3;
  ladder.GameDate = Date{38077};
  EXPECT_EQ(Text(Encode(ladder)), kLadder);
  EXPECT_EQ(kLadder.size(), 80U);

  const LadderRecord back = DecodeLadder(AsBytes(kLadder));
  EXPECT_EQ(Trim(back.HomeTeam), "Rovers");
  EXPECT_EQ(Trim(back.AwayTeam), "Hawks");
  EXPECT_EQ(back.HomeScore, 9);
  EXPECT_EQ(back.AwayScore, 6);
  EXPECT_EQ(back.HomePenalty, 2);
  EXPECT_EQ(back.AwayPenalty, -3);
  EXPECT_EQ(back.GameDate.days, 38077);
}

TEST(PlayerRecord, IsReadFromItsOffsets) {
  const PlayerRecord player = DecodePlayer(AsBytes(kPlayer));
  EXPECT_EQ(player.ID, 0x01020304);
  EXPECT_EQ(player.Surname, "Archer" + Blanks(24)) << "padding included";
  EXPECT_EQ(Trim(player.FirstName), "Jo");
  EXPECT_EQ(Trim(player.Team), "Rovers");
  EXPECT_EQ(Trim(player.Grade), "A Grade");
  EXPECT_EQ(player.Reserved1.days, 38077);
  EXPECT_EQ(player.BestOfThree, 330);
}

TEST(ResultRecord, IsReadFromItsOffsets) {
  const ResultRecord result = DecodeResult(AsBytes(kResult));
  EXPECT_EQ(result.ID, -1);
  EXPECT_EQ(Trim(result.Opposition), "Hawks");
  EXPECT_EQ(result.Legs, -2);
  EXPECT_EQ(result.Aggregate, 32767);
  EXPECT_EQ(result.Shots, 100000);
  EXPECT_EQ(result.HighScore, 180);
  EXPECT_EQ(result.Scores180, 2);
  EXPECT_EQ(result.Pegs, (std::array<std::int16_t, 6>{11, 12, 13, 14, 15, -32768}));
}

TEST(Views, ReadTheSameAsTheRecords) {
  const PlayerView player(AsBytes(kPlayer));
  EXPECT_EQ(player.ID(), 0x01020304);
  EXPECT_EQ(player.FullName(",  "), "Archer,  Jo");
  EXPECT_EQ(player.Team(), "Rovers");
  EXPECT_EQ(player.Grade(), "A Grade");
  EXPECT_EQ(player.BestOfThree(), 330);

  const ResultView result(AsBytes(kResult));
  EXPECT_EQ(result.ID(), -1);
  EXPECT_EQ(result.Team(), "Rovers");
  EXPECT_EQ(result.Opposition(), "Hawks");
  EXPECT_EQ(result.GameDate().days, 38077);
  EXPECT_TRUE(result.IsForfeit());
  EXPECT_EQ(result.Legs(), -2);
  EXPECT_EQ(result.Aggregate(), 32767);
  EXPECT_EQ(result.Shots(), 100000);
  EXPECT_EQ(result.HighScore(), 180);
  EXPECT_EQ(result.Centuries(), 1);
  EXPECT_EQ(result.Scores180(), 2);
  EXPECT_EQ(result.Peg(0), 11);
  EXPECT_EQ(result.Peg(5), -32768);
}

TEST(Records, TextsAreCutToTheirWidth) {
  PlayerRecord player = Player();
  player.Surname = std::string(31, 'x');
  player.Grade = "A grade with a long name";
  const PlayerRecord back = DecodePlayer(Encode(player));
  EXPECT_EQ(back.Surname, std::string(30, 'x'));
  EXPECT_EQ(back.Grade, "A grade with a long ");
  EXPECT_EQ(Trim(back.FirstName), "Jo") << "the neighbour is untouched";
}

TEST(Records, AnyBytesComeBackAsTheyWere) {
  for (int seed = 0; seed < 64; ++seed) {
    std::string bytes(148, '\0');
    for (std::size_t i = 0; i < bytes.size(); ++i) {
      bytes[i] = static_cast<char>((i * 73 + static_cast<std::size_t>(seed) * 151) % 256);
    }
    EXPECT_EQ(Text(Encode(DecodeResult(AsBytes(bytes)))), bytes);
    bytes.resize(80);
    EXPECT_EQ(Text(Encode(DecodeLadder(AsBytes(bytes)))), bytes);
    bytes.resize(156, '\xE9');
    EXPECT_EQ(Text(Encode(DecodePlayer(AsBytes(bytes)))), bytes);
  }
}

TEST(Records, ADateThatIsNoNumberIsCarriedAlong) {
  ResultRecord result = Result();
  result.GameDate = Date{std::nan("")};
  EXPECT_TRUE(std::isnan(DecodeResult(Encode(result)).GameDate.days));
}

TEST(Records, FieldTablesHoldNamesThatDiffer) {
  EXPECT_EQ(kPlayerFields[4].name, "Grade");
  EXPECT_EQ(kPlayerFields[4].offset, 94U);
  EXPECT_EQ(kResultFields[12].name, "Peg1");
  EXPECT_EQ(kResultFields[12].offset, 136U);
  EXPECT_EQ(kLadderFields[8].name, "GameDate");
  EXPECT_EQ(kLadderFields[8].offset, 72U);
}

}  // namespace
}  // namespace marlowbeck

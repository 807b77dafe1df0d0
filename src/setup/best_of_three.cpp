#include "setup/best_of_three.h"

#include <algorithm>

#include "data/records.h"
#include "data/text.h"

namespace marlowbeck {
namespace {

constexpr int kFirst = 300;
constexpr int kSecond = 30;
constexpr int kThird = 3;

}  // namespace

int CodeOf(const BestOfThreeChoice& choice) {
  if (choice.none) return kNoGames;
  return (choice.first ? kFirst : 0) + (choice.second ? kSecond : 0) + (choice.third ? kThird : 0);
}

BestOfThreeChoice ChoiceOf(int code) {
  BestOfThreeChoice choice;
  choice.none = code == kNoGames;
  for (const int games : {0, kFirst, kSecond, kThird, kFirst + kSecond, kFirst + kThird,
                          kSecond + kThird, kFirst + kSecond + kThird}) {
    if (code != games) continue;
    choice.first = games / 100 > 0;
    choice.second = games / 10 % 10 > 0;
    choice.third = games % 10 > 0;
  }
  return choice;
}

bool StampBestOfThree(std::span<std::byte> player, std::string_view grade, int code) {
  if (PlayerView(player).Grade() != Trimmed(grade)) return false;
  PlayerRecord stamped = DecodePlayer(player);
  stamped.BestOfThree = code;
  std::ranges::copy(Encode(stamped), player.begin());
  return true;
}

}  // namespace marlowbeck

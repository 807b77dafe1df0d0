#include "ladder/ladder_rules.h"

#include <array>
#include <deque>

#include "data/numbers.h"

namespace marlowbeck {
namespace {

/// The numbers of a text that holds several, one behind the other.
class NumbersInText {
 public:
  explicit NumbersInText(SideFileReader& reader) : reader_(reader) {}

  Integer Next() {
    while (words_.empty()) TakeItem();
    const Integer number = CInt(words_.front());
    words_.pop_front();
    return number;
  }

 private:
  void TakeItem() {
    const std::string item = reader_.Text();
    constexpr const char* kBlanks = " \t";
    for (auto first = item.find_first_not_of(kBlanks); first != std::string::npos;) {
      const auto end = item.find_first_of(kBlanks, first);
      words_.push_back(item.substr(first, end - first));
      first = item.find_first_not_of(kBlanks, end);
    }
  }

  SideFileReader& reader_;
  std::deque<std::string> words_;
};

/// A blank or a minus sign, the digits, and a blank.
std::string FreeText(int number) { return (number < 0 ? "" : " ") + std::to_string(number) + " "; }

}  // namespace

LadderRules ReadLadderRules(Channels& channels, const std::string& path) {
  channels.OpenInput(Channel::LadderConfig, path);
  NumbersInText numbers(channels.Reader(Channel::LadderConfig));
  LadderRules rules;
  for (Integer* rule : {&rules.WinPoints, &rules.LossPoints, &rules.DrawPoints, &rules.FinalsTeams,
                        &rules.GamesPerMatch}) {
    *rule = numbers.Next();
  }
  channels.Close(Channel::LadderConfig);
  return rules;
}

void WriteLadderRules(Channels& channels, const std::string& path, const LadderRules& rules) {
  std::string line;
  for (const int rule : {rules.WinPoints, rules.LossPoints, rules.DrawPoints, rules.FinalsTeams,
                         rules.GamesPerMatch}) {
    line += FreeText(rule);
  }
  channels.OpenOutput(Channel::LadderConfig, path, Keeping::Lasting);
  channels.Writer(Channel::LadderConfig).PlainLine(line);
  channels.Close(Channel::LadderConfig);
}

LadderRules RulesInHand(const Session& session) {
  return {session.WinPoints, session.LossPoints, session.DrawPoints, session.FinalsTeams,
          session.GamesPerMatch};
}

void TakeInHand(Session& session, const LadderRules& rules) {
  session.WinPoints = rules.WinPoints;
  session.LossPoints = rules.LossPoints;
  session.DrawPoints = rules.DrawPoints;
  session.FinalsTeams = rules.FinalsTeams;
  session.GamesPerMatch = rules.GamesPerMatch;
}

}  // namespace marlowbeck

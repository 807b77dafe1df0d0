#pragma once

#include <deque>
#include <map>
#include <optional>
#include <string>
#include <utility>

#include "drive/event_log.h"
#include "drive/face.h"

namespace marlowbeck {

/// Answers that wait for one kind of box or dialog; an empty one is its cancelling.
template <typename T>
class AnswerQueue {
 public:
  void Add(std::optional<T> answer) { waiting_.push_back(std::move(answer)); }
  [[nodiscard]] std::size_t Waiting() const { return waiting_.size(); }
  void Forget() { waiting_.clear(); }

  /// The first that waits; `missing` says whether there was none.
  std::optional<T> Take(bool& missing) {
    missing = waiting_.empty();
    if (missing) return std::nullopt;
    std::optional<T> first = std::move(waiting_.front());
    waiting_.pop_front();
    return first;
  }

 private:
  std::deque<std::optional<T>> waiting_;
};

/// The answers that a script has prepared. Boxes are answered here and told to the log.
class ScriptAnswers : public BoxAnswers {
 public:
  explicit ScriptAnswers(EventLog& log) : log_(log) {}

  AnswerQueue<int> messages;  ///< button numbers
  AnswerQueue<std::string> inputs;
  AnswerQueue<std::string> files;
  AnswerQueue<FontChoice> fonts;
  AnswerQueue<Orientation> setups;

  void Forget();
  /// A new command begins: boxes that came up before it count no more.
  void BeginCommand() { unexpected_.clear(); }
  /// Counts an answer that nobody prepared for the box or dialog that `asked` tells apart. Throws
  /// BrokenOff when it has had 20 already.
  void CountUnexpected(const std::string& asked);

  int ToMessage(const MessageBoxRequest& seen) override;
  std::optional<std::string> ToInput(const InputBoxRequest& seen) override;

 private:
  int ButtonFor(const MessageBoxRequest& seen, bool& unexpected);

  EventLog& log_;
  std::map<std::string, int> unexpected_;
};

}  // namespace marlowbeck

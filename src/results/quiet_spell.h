#pragma once

namespace marlowbeck {

/// Holds a screen's Quiet for as long as it lives, also when what runs meanwhile fails.
class QuietSpell {
 public:
  explicit QuietSpell(bool& quiet) : quiet_(quiet) { quiet_ = true; }
  QuietSpell(const QuietSpell&) = delete;
  QuietSpell& operator=(const QuietSpell&) = delete;
  ~QuietSpell() { quiet_ = false; }

 private:
  bool& quiet_;
};

}  // namespace marlowbeck

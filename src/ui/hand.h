#pragma once

#include <functional>
#include <string>
#include <string_view>
#include <vector>

#include "platform/platform.h"
#include "ui/controls.h"
#include "ui/screens.h"

namespace marlowbeck {

enum class Key { Enter, Tab, BackTab, Escape, Up, Down, F1 };

/// How a person's action went.
struct Outcome {
  std::string refusal;  ///< why it could not be carried out; nothing has changed then
  bool lost = false;    ///< leaving the control before showed a box or took the focus elsewhere

  [[nodiscard]] bool Done() const { return refusal.empty(); }
};

/// What a person can do with mouse and keyboard, told in the terms of controls. Every face works
/// the screens through it and through nothing else. Each procedure is one event: it moves the focus
/// first, which runs the leaving checks of the control left, then acts.
class Hand {
 public:
  Hand(Screens& screens, Boxes& boxes) : screens_(screens), boxes_(boxes) {}

  Outcome Click(Control& control);
  Outcome DoubleClick(Control& control);
  /// The second click of a double click, where the first has been told already.
  Outcome SecondClick(Control& control);
  /// Replaces the whole text of an entry box or free combo, character by character, as typed.
  Outcome Type(Control& control, std::string_view text);
  /// The text of an entry box or free combo has become another one by a keystroke. A keystroke
  /// moves no focus.
  Outcome Retype(Control& control, std::string_view text);
  Outcome Pick(Control& control, int line);
  Outcome PickTwice(Control& control, int line);
  /// The second click of a double click on a line, which opens a folder.
  Outcome SecondPick(Control& control, int line);
  /// Marks just these lines of a list: a click on the first and a control-click on each other one.
  /// None unmarks all. It ends where a click takes the list away.
  Outcome Select(Control& control, const std::vector<int>& lines);
  /// A control-click: marks a line of a list, or takes its mark away.
  Outcome Toggle(Control& control, int line);
  /// A shift-click on `to`: marks just the lines from `from` to there.
  Outcome MarkThrough(Control& control, int from, int to);
  /// The keyboard goes to a line of a list, other than by one step up or down.
  Outcome MoveToLine(Control& control, int line);
  Outcome ClickCell(Control& control, int row, int col);
  Outcome DoubleClickCell(Control& control, int row, int col);
  Outcome PickDate(Control& control, Date date);
  /// A key goes down.
  Outcome Press(Key key);
  /// A key comes up, in whatever has the focus by then.
  Outcome Release();
  /// A key goes down and comes up again. One that called up a box or a menu comes up in that.
  Outcome Strike(Key key);
  /// The mnemonic of a letter: the command with it, or a menu, and then an entry of that menu.
  Outcome PressMnemonic(char letter);
  /// The letter goes down and comes up again.
  Outcome StrikeMnemonic(char letter);
  /// The menu that was dropped down has gone again.
  void CloseMenu() { open_menu_ = nullptr; }
  Outcome Focus(Control& control);
  Outcome Hover(Control& control);
  Outcome HoverScreen(Screen& screen);
  Outcome CloseScreen(Screen& screen);

 private:
  Outcome Act(Control& control, const Handler& action);
  Outcome Whole(const Handler& action);
  Outcome Struck(const std::function<Outcome()>& press);
  Outcome DropDown(Control& menu);
  Outcome Twice(Control& control, const std::function<Outcome()>& click);
  bool TakeFocus(Control& control);
  void ClickWithFocus(Control& control);
  void PressOn(Control* focus, Screen& front, Key key);
  void PressEnter(Control* focus, Screen& front);
  static Outcome CheckMarking(Control& control, const std::vector<int>& lines);
  static void PickLine(LineHolder& list, int line);
  void MoveLine(LineHolder& list, int step);
  void GoToLine(LineHolder& list, int line);
  void MoveAmong(Control& focus, bool backward);
  [[nodiscard]] Control* WithMnemonic(const Screen& front, char letter) const;

  Screens& screens_;
  Boxes& boxes_;
  const Control* open_menu_ = nullptr;
};

/// A second click on the control means more than one click more.
[[nodiscard]] bool AnswersDoubleClick(const Control& control);

/// The letter after a single "&" in a caption, upper-cased; 0 for none.
[[nodiscard]] char MnemonicOf(std::string_view caption);

}  // namespace marlowbeck

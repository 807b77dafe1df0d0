#include "ui/hand.h"

#include <algorithm>
#include <utility>

#include "data/text.h"
#include "ui/disk_lists.h"

namespace marlowbeck {
namespace {

Outcome Refused(const Control& control, std::string_view why) {
  return {control.Name() + " " + std::string(why), false};
}

/// Why nobody could act on a control now; empty when somebody could.
Outcome CheckLive(const Control& control) {
  if (!control.Shown()) return Refused(control, "is hidden");
  if (!control.EnabledThroughout()) return Refused(control, "is disabled");
  return {};
}

/// The same of a screen.
Outcome CheckLive(const Screen& screen) {
  if (!screen.Visible()) return {screen.Name() + " is hidden", false};
  if (!screen.Enabled()) return {screen.Name() + " is disabled", false};
  return {};
}

template <typename T>
T* As(Control& control) {
  return dynamic_cast<T*>(&control);
}

bool CanBeClicked(const Control& control) {
  switch (control.GetKind()) {
    case Kind::Panel:
    case Kind::Label:
    case Kind::Progress:
      return static_cast<bool>(control.Click);
    default:
      return true;
  }
}

bool HasEntries(const Control& menu) {
  const auto& controls = menu.InScreen().Controls();
  return menu.GetKind() == Kind::Menu &&
         std::any_of(controls.begin(), controls.end(),
                     [&](const Control* entry) { return entry->InControl() == &menu; });
}

bool IsHeld(Control& control) {
  const auto* combo = As<ComboBox>(control);
  return combo != nullptr && combo->Held();
}

bool CanBeTypedInto(Control& control) {
  if (const auto* box = As<TextBox>(control)) return !box->Locked();
  if (const auto* combo = As<ComboBox>(control)) return !combo->Locked();
  return false;
}

const std::string& TextOf(Control& control) {
  if (const auto* combo = As<ComboBox>(control)) return combo->Text();
  return static_cast<TextBox&>(control).Text();
}

void AssignText(Control& control, std::string_view text) {
  if (auto* combo = As<ComboBox>(control)) {
    combo->SetText(text);
  } else {
    static_cast<TextBox&>(control).SetText(text);
  }
}

}  // namespace

Outcome Hand::Whole(const Handler& action) {
  CloseMenu();
  screens_.GetDispatcher().Run(action);
  screens_.Settle();
  return {};
}

/// Moves the focus to the control when it takes one and acts if the control is still there to be
/// acted on; otherwise the action is lost.
Outcome Hand::Act(Control& control, const Handler& action) {
  bool lost = true;
  Whole([&] {
    screens_.BringToFront(control.InScreen());
    lost = !TakeFocus(control);
    if (!lost) action();
  });
  return {{}, lost};
}

bool Hand::TakeFocus(Control& control) {
  if (!control.TakesFocus()) return true;
  const long boxes_before = boxes_.Shown();
  control.SetFocus();
  return boxes_.Shown() == boxes_before && control.InScreen().Focus() == &control;
}

Outcome Hand::Click(Control& control) {
  if (const Outcome check = CheckLive(control); !check.Done()) return check;
  if (!CanBeClicked(control)) return Refused(control, "has no click");
  if (HasEntries(control)) return DropDown(control);
  return Act(control, [&] { ClickWithFocus(control); });
}

/// A menu that has entries drops down, and stays down until something else is done.
Outcome Hand::DropDown(Control& menu) {
  Outcome outcome = Act(menu, [] {});
  open_menu_ = &menu;
  return outcome;
}

void Hand::ClickWithFocus(Control& control) {
  if (auto* check = As<CheckBox>(control)) {
    check->SetValue(!check->Value());
  } else if (auto* option = As<OptionButton>(control)) {
    if (option->Value()) return;
    option->SetValue(true);
  } else if (As<LineHolder>(control) != nullptr) {
    return control.Fire(control.MouseUp);  // beside the lines
  }
  control.Fire(control.Click);
}

/// A double click, after the click that comes with it. That one may have closed the screen.
Outcome Hand::Twice(Control& control, const std::function<Outcome()>& click) {
  const auto held = screens_.Hold(control.InScreen());
  const Outcome outcome = click();
  if (outcome.Done() && !outcome.lost) SecondClick(control);
  return outcome;
}

Outcome Hand::DoubleClick(Control& control) {
  return Twice(control, [&] { return Click(control); });
}

Outcome Hand::SecondClick(Control& control) {
  if (const Outcome check = CheckLive(control); !check.Done()) return check;
  if (!control.DoubleClick) return {};
  return Whole([&] { control.Fire(control.DoubleClick); });
}

Outcome Hand::Type(Control& control, std::string_view text) {
  if (const Outcome check = CheckLive(control); !check.Done()) return check;
  if (!CanBeTypedInto(control)) return Refused(control, "cannot be typed into");
  // What is typed first replaces the text that was marked; all else stands behind what the box then
  // holds, as it does for a person, to whom each keystroke is an event.
  const auto held = screens_.Hold(control.InScreen());
  const Outcome outcome = Act(control, [&] { AssignText(control, text.substr(0, 1)); });
  const auto still_there = [&] { return control.InScreen().Focus() == &control; };
  for (std::size_t i = 1; i < text.size() && !outcome.lost && still_there(); ++i) {
    Retype(control, TextOf(control) + text[i]);
  }
  return outcome;
}

Outcome Hand::Retype(Control& control, std::string_view text) {
  if (const Outcome check = CheckLive(control); !check.Done()) return check;
  if (!CanBeTypedInto(control)) return Refused(control, "cannot be typed into");
  return Whole([&] { AssignText(control, text); });
}

/// Makes a line the current one, and the only marked one where lines are marked.
void Hand::PickLine(LineHolder& list, int line) {
  if (auto* marks = As<ListBox>(list); marks != nullptr && marks->Multi()) {
    marks->ClearMarks();
    marks->SetMarked(line, true);
  }
  list.SetIndex(line);
}

Outcome Hand::Pick(Control& control, int line) {
  if (const Outcome check = CheckLive(control); !check.Done()) return check;
  auto* const list = As<LineHolder>(control);
  if (list == nullptr) return Refused(control, "has no lines");
  if (IsHeld(control)) return Refused(control, "is locked");
  if (line < 0 || line >= list->Count()) return Refused(control, "has no such line");
  // The focus may bring the list up to date: what is picked is the line that was seen.
  const std::string seen = list->Line(line);
  return Act(control, [=] {
    const bool stands = line < list->Count() && list->Line(line) == seen;
    const int place = stands ? line : list->Find(seen);
    if (place >= 0) PickLine(*list, place);
    list->Fire(list->MouseUp);
  });
}

Outcome Hand::PickTwice(Control& control, int line) {
  const auto held = screens_.Hold(control.InScreen());
  Outcome outcome = Pick(control, line);
  // The list of a combo has gone with the first click.
  const bool stays = As<ListBox>(control) != nullptr;
  if (stays && outcome.Done() && !outcome.lost) SecondPick(control, line);
  return outcome;
}

Outcome Hand::SecondPick(Control& control, int line) {
  auto* const folders = As<FolderList>(control);
  if (folders == nullptr) return SecondClick(control);
  if (Outcome check = CheckLive(control); !check.Done()) return check;
  return Whole([&] {
    if (line >= 0 && line < folders->Count()) folders->Open(line);
    control.Fire(control.DoubleClick);
  });
}

/// Why these lines of a list cannot be marked; empty when they can.
Outcome Hand::CheckMarking(Control& control, const std::vector<int>& lines) {
  if (Outcome check = CheckLive(control); !check.Done()) return check;
  const auto* const list = As<ListBox>(control);
  if (list == nullptr || !list->Multi()) return Refused(control, "marks one line only");
  for (const int line : lines) {
    if (line < 0 || line >= list->Count()) return Refused(control, "has no such line");
  }
  return {};
}

Outcome Hand::Select(Control& control, const std::vector<int>& lines) {
  if (Outcome check = CheckMarking(control, lines); !check.Done()) return check;
  const auto held = screens_.Hold(control.InScreen());
  const std::set<int> marked = static_cast<ListBox&>(control).Marked();
  std::vector<int> clicks = lines.empty() ? std::vector<int>(marked.begin(), marked.end()) : lines;
  Outcome outcome;
  for (std::size_t i = 0; i < clicks.size() && !outcome.lost; ++i) {
    Outcome click =
        i == 0 && !lines.empty() ? Pick(control, clicks[i]) : Toggle(control, clicks[i]);
    if (!click.Done()) break;
    outcome = std::move(click);
  }
  return outcome;
}

Outcome Hand::Toggle(Control& control, int line) {
  if (Outcome check = CheckMarking(control, {line}); !check.Done()) return check;
  auto& list = static_cast<ListBox&>(control);
  return Act(control, [&list, line] {
    if (line >= list.Count()) return;
    list.SetMarked(line, !list.Marked().contains(line));
    list.SetIndex(line);
    list.Fire(list.MouseUp);
  });
}

Outcome Hand::MarkThrough(Control& control, int from, int to) {
  if (Outcome check = CheckMarking(control, {from, to}); !check.Done()) return check;
  auto& list = static_cast<ListBox&>(control);
  return Act(control, [&list, from, to] {
    if (std::max(from, to) >= list.Count()) return;
    list.ClearMarks();
    for (int line = std::min(from, to); line <= std::max(from, to); ++line) {
      list.SetMarked(line, true);
    }
    list.SetIndex(to);
    list.Fire(list.MouseUp);
  });
}

Outcome Hand::MoveToLine(Control& control, int line) {
  if (const Outcome check = CheckLive(control); !check.Done()) return check;
  auto* const list = As<LineHolder>(control);
  if (list == nullptr) return Refused(control, "has no lines");
  return Whole([&] { GoToLine(*list, line); });
}

Outcome Hand::ClickCell(Control& control, int row, int col) {
  if (const Outcome check = CheckLive(control); !check.Done()) return check;
  auto* const grid = As<Grid>(control);
  if (grid == nullptr) return Refused(control, "has no cells");
  if (row < 0 || row >= grid->Rows() || col < 0 || col >= grid->Cols()) {
    return Refused(control, "has no such cell");
  }
  return Act(control, [=] {
    grid->SetCurrent(row, col);
    grid->Fire(grid->Click);
  });
}

Outcome Hand::DoubleClickCell(Control& control, int row, int col) {
  return Twice(control, [&] { return ClickCell(control, row, col); });
}

Outcome Hand::PickDate(Control& control, Date date) {
  if (const Outcome check = CheckLive(control); !check.Done()) return check;
  auto* const picker = As<DatePicker>(control);
  if (picker == nullptr) return Refused(control, "has no date");
  return Act(control, [=] {
    if (picker->Value() == date) return;
    picker->SetValue(date);
    picker->Fire(picker->Change);
  });
}

Outcome Hand::Focus(Control& control) {
  if (const Outcome check = CheckLive(control); !check.Done()) return check;
  if (!control.TakesFocus()) return Refused(control, "takes no focus");
  return Act(control, [] {});
}

Outcome Hand::Hover(Control& control) {
  if (const Outcome check = CheckLive(control); !check.Done()) return check;
  return Whole([&] { control.Fire(control.MouseMove); });
}

Outcome Hand::HoverScreen(Screen& screen) {
  if (Outcome check = CheckLive(screen); !check.Done()) return check;
  return Whole([&] { screen.MouseMove(); });
}

Outcome Hand::CloseScreen(Screen& screen) {
  if (Outcome check = CheckLive(screen); !check.Done()) return check;
  return Whole([&] { screen.CloseButton(); });
}

Outcome Hand::Press(Key key) {
  Screen* const front = screens_.Front();
  if (front == nullptr) return {"no screen is in front", false};
  if (!front->Enabled()) return {front->Name() + " is disabled", false};
  return Whole([&] { PressOn(front->Focus(), *front, key); });
}

Outcome Hand::Release() {
  const Control* const focus = screens_.Ended() ? nullptr : screens_.Focus();
  if (focus == nullptr || dynamic_cast<const ListBox*>(focus) == nullptr) return {};
  screens_.GetDispatcher().Run([focus] { focus->Fire(focus->KeyUp); });
  screens_.Settle();
  return {};
}

Outcome Hand::Struck(const std::function<Outcome()>& press) {
  const long boxes_before = boxes_.Shown();
  Outcome outcome = press();
  const bool comes_up_here = boxes_.Shown() == boxes_before && open_menu_ == nullptr;
  if (outcome.Done() && comes_up_here) Release();
  return outcome;
}

Outcome Hand::Strike(Key key) {
  return Struck([&] { return Press(key); });
}

Outcome Hand::StrikeMnemonic(char letter) {
  return Struck([&] { return PressMnemonic(letter); });
}

void Hand::PressOn(Control* focus, Screen& front, Key key) {
  switch (key) {
    case Key::Enter:
      return PressEnter(focus, front);
    case Key::Tab:
    case Key::BackTab:
      if (Control* const next = front.NextStop(key == Key::BackTab)) next->SetFocus();
      return;
    case Key::Escape:
      return front.Escape();
    case Key::F1:
      return front.HelpKey();
    case Key::Up:
    case Key::Down:
      if (focus == nullptr) return;
      if (auto* list = As<LineHolder>(*focus)) return MoveLine(*list, key == Key::Up ? -1 : 1);
      return MoveAmong(*focus, key == Key::Up);
  }
}

void Hand::PressEnter(Control* focus, Screen& front) {
  if (focus != nullptr && focus->Entered) return focus->Fire(focus->Entered);
  if (focus != nullptr) {
    switch (focus->GetKind()) {
      case Kind::Command:
      case Kind::Picture:
        return focus->Fire(focus->Click);
      case Kind::Text:
      case Kind::Combo:
        // Enter in an entry box is a Tab.
        if (Control* const next = front.NextStop(false)) next->SetFocus();
        return;
      case Kind::List:
        if (auto& list = static_cast<ListBox&>(*focus); list.PicksOnEnter()) {
          if (list.Cursor() >= 0) PickLine(list, list.Cursor());
          return;
        }
        break;
      case Kind::Folders:
        if (auto& folders = static_cast<FolderList&>(*focus); folders.Index() >= 0) {
          return folders.Open(folders.Index());
        }
        break;
      default:
        break;
    }
  }
  ClickFirstLive(front.Defaults);
}

void Hand::MoveLine(LineHolder& list, int step) {
  const auto* box = As<ListBox>(list);
  // Where Enter has taken the line away, the next one stands in its place.
  if (box != nullptr && box->Entered && box->Index() < 0) return GoToLine(list, box->Cursor());
  GoToLine(list, (box != nullptr && box->PicksOnEnter() ? box->Cursor() : list.Index()) + step);
}

void Hand::GoToLine(LineHolder& list, int line) {
  if (list.Count() == 0 || IsHeld(list)) return;
  const int target = std::clamp(line, 0, list.Count() - 1);
  if (auto* box = As<ListBox>(list); box != nullptr && box->PicksOnEnter()) {
    box->SetCursor(target);
  } else if (target != list.Index()) {
    PickLine(list, target);
  }
}

/// The arrow keys go from picture to picture, and from option to option, which selects it.
void Hand::MoveAmong(Control& focus, bool backward) {
  if (focus.GetKind() != Kind::Picture && focus.GetKind() != Kind::Option) return;
  std::vector<Control*> peers;
  for (Control* control : focus.InScreen().Controls()) {
    if (control->GetKind() == focus.GetKind() && control->InControl() == focus.InControl() &&
        control->Live()) {
      peers.push_back(control);
    }
  }
  const auto present = std::find(peers.begin(), peers.end(), &focus) - peers.begin();
  const auto next = present + (backward ? -1 : 1);
  if (next < 0 || next >= static_cast<std::ptrdiff_t>(peers.size())) return;
  Control& target = *peers[static_cast<std::size_t>(next)];
  if (TakeFocus(target) && target.GetKind() == Kind::Option) ClickWithFocus(target);
}

Outcome Hand::PressMnemonic(char letter) {
  Screen* const front = screens_.Front();
  if (front == nullptr) return {"no screen is in front", false};
  Control* const control = WithMnemonic(*front, UpperCase(std::string(1, letter)).front());
  CloseMenu();
  if (control == nullptr) {
    return {front->Name() + " has no live mnemonic " + std::string(1, letter), false};
  }
  return Click(*control);
}

Control* Hand::WithMnemonic(const Screen& front, char letter) const {
  for (const Control* menu : {open_menu_, static_cast<const Control*>(nullptr)}) {
    for (Control* control : front.Controls()) {
      const bool in_reach =
          control->GetKind() == Kind::Menu ? control->InControl() == menu : menu == nullptr;
      if (!in_reach || !control->Live() || MnemonicOf(control->Caption()) != letter) continue;
      if (control->TakesFocus() || CanBeClicked(*control)) return control;
    }
  }
  return nullptr;
}

bool AnswersDoubleClick(const Control& control) {
  return control.DoubleClick || control.GetKind() == Kind::Folders;
}

char MnemonicOf(std::string_view caption) {
  for (std::size_t i = 0; i + 1 < caption.size(); ++i) {
    if (caption[i] != '&') continue;
    const char letter = caption[++i];
    if (letter != '&' && letter != ' ') return UpperCase(std::string(1, letter)).front();
  }
  return 0;
}

}  // namespace marlowbeck

#include "setup/frmGameNames.h"

#include <algorithm>
#include <span>

#include "session/shared_procedures.h"
#include "ui/screens.h"

namespace marlowbeck {
namespace {

constexpr std::size_t kLongestName = 8;
constexpr std::size_t kLongestShortForm = 4;

using BoxSpan = std::span<TextBox* const>;

bool AnyLongerThan(std::size_t letters, BoxSpan boxes) {
  return std::ranges::any_of(boxes,
                             [=](const TextBox* box) { return box->Text().size() > letters; });
}

bool AnyEmpty(BoxSpan boxes) {
  return std::ranges::any_of(boxes, [](const TextBox* box) { return box->Text().empty(); });
}

}  // namespace

frmGameNames::frmGameNames(Screens& screens, const Context& context)
    : Screen(screens, "frmGameNames", "[Marlowbeck]  Change Game Names"),
      context_(context),
      boxes_{&txtFirst, &txtSecond, &txtThird, &txtShFirst, &txtShSecond, &txtShThird} {
  cmdSave.Click = [this] { cmdSave_Click(); };
  cmdExit.Click = [this] { InScreens().Unload(*this); };
  cmdHelp.Click = [this] { context_.platform.help.Open("qz1.HLP", 0); };
  Defaults = {&cmdSave};
  Cancels = {&cmdExit};
  Helps = {&cmdHelp};
}

void frmGameNames::Load() {
  context_.GoToWorkingFolder();
  GameNames(context_);
  for (std::size_t i = 0; i < boxes_.size(); ++i) {
    boxes_[i]->SetText(context_.session.GameNames[i]);
  }
  txtFirst.SetFocus();
}

void frmGameNames::Unload() { InScreens().Show("frmDB"); }

bool frmGameNames::Check() {
  const BoxSpan names = BoxSpan(boxes_).first(3);
  const BoxSpan short_forms = BoxSpan(boxes_).last(3);
  const char* fault = nullptr;
  if (AnyLongerThan(kLongestName, names)) {
    fault = "Game name/s exceed 8 letters.    ";
  } else if (AnyEmpty(names)) {
    fault = "Game name/s cannot be blank.    ";
  } else if (AnyLongerThan(kLongestShortForm, short_forms)) {
    fault = "Shortened Game name/s exceed 4 letters.    ";
  } else if (AnyEmpty(short_forms)) {
    fault = "Shortened Game name/s cannot be blank.    ";
  }
  if (fault != nullptr) Warning(context_, fault);
  return fault == nullptr;
}

void frmGameNames::cmdSave_Click() {
  if (!Check()) return;
  context_.GoToWorkingFolder();
  context_.channels.CloseAll();
  std::array<std::string, 6> names;
  std::ranges::transform(boxes_, names.begin(), [](const TextBox* box) { return box->Text(); });
  // KEPT: a name with a comma comes back as two, and those behind it are shifted; a repair would
  // refuse the comma.
  WriteGameNames(context_, names);
  OKSound(context_);
  GameNames(context_);
  InScreens().Unload(*this);
}

}  // namespace marlowbeck

#include "drive/face.h"

namespace marlowbeck {
namespace {

class ModelBoxes : public Boxes {
 public:
  explicit ModelBoxes(BoxAnswers& answers) : answers_(answers) {}

 protected:
  int ShowMessage(const MessageBoxRequest& request) override { return answers_.ToMessage(request); }
  std::string ShowInput(const InputBoxRequest& request) override {
    return answers_.ToInput(request).value_or("");
  }

 private:
  BoxAnswers& answers_;
};

/// Works the models by the program's own hand and sees what they hold.
class ModelFace : public Face {
 public:
  explicit ModelFace(BoxAnswers& answers) : boxes_(answers) {}

  Boxes& GetBoxes() override { return boxes_; }
  void Attach(Program& program) override { program_ = &program; }
  void Refresh() override {}
  Outcome Perform(const Action& action) override;
  ControlState Read(const Control& control) override { return StateOf(control); }
  ScreenState Read(const Screen& screen) override {
    return {screen.Name(), screen.Title(), screen.Visible(), screen.Enabled()};
  }
  std::string FrontScreen() override;
  std::string FocusedControl() override;
  std::unique_ptr<Printer> MakePdfPrinter(const std::string& /*folder*/) override {
    return nullptr;
  }
  std::optional<std::pair<int, int>> Shot(const std::string& /*file*/,
                                          std::optional<std::pair<int, int>> /*size*/) override {
    return std::nullopt;
  }

 private:
  ModelBoxes boxes_;
  Program* program_ = nullptr;
};

Outcome ModelFace::Perform(const Action& action) {
  using Verb = Action::Verb;
  Hand& hand = program_->GetHand();
  switch (action.verb) {
    case Verb::Click:
      return hand.Click(*action.control);
    case Verb::DoubleClick:
      return hand.DoubleClick(*action.control);
    case Verb::Type:
      return hand.Type(*action.control, action.text);
    case Verb::Pick:
      return hand.Pick(*action.control, action.numbers.at(0));
    case Verb::PickTwice:
      return hand.PickTwice(*action.control, action.numbers.at(0));
    case Verb::Select:
      return hand.Select(*action.control, action.numbers);
    case Verb::Cell:
      return hand.ClickCell(*action.control, action.numbers.at(0), action.numbers.at(1));
    case Verb::DoubleCell:
      return hand.DoubleClickCell(*action.control, action.numbers.at(0), action.numbers.at(1));
    case Verb::PickDate:
      return hand.PickDate(*action.control, action.date);
    case Verb::Press:
      return hand.Strike(action.key);
    case Verb::Mnemonic:
      return hand.StrikeMnemonic(action.letter);
    case Verb::Focus:
      return hand.Focus(*action.control);
    case Verb::Hover:
      return hand.Hover(*action.control);
    case Verb::HoverScreen:
      return hand.HoverScreen(*action.screen);
    case Verb::CloseScreen:
      return hand.CloseScreen(*action.screen);
  }
  return {};
}

std::string ModelFace::FrontScreen() {
  const Screen* const front = program_->GetScreens().Front();
  return front == nullptr ? std::string() : front->Name();
}

std::string ModelFace::FocusedControl() {
  const Control* const focus = program_->GetScreens().Focus();
  return focus == nullptr ? std::string() : focus->InScreen().Name() + "." + focus->Name();
}

}  // namespace

std::unique_ptr<Face> MakeModelFace(BoxAnswers& answers) {
  return std::make_unique<ModelFace>(answers);
}

}  // namespace marlowbeck

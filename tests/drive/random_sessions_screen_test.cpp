// People who click about without a plan: in every face the same must come of it.

#include <array>
#include <cstdlib>
#include <random>

#include "support/sample.h"

namespace marlowbeck {
namespace {

/// A number of the environment, for longer runs by hand.
unsigned Setting(const char* name, unsigned otherwise) {
  const char* const text = std::getenv(name);
  return text == nullptr ? otherwise : static_cast<unsigned>(std::stoul(text));
}

/// Makes up one line of a script after another, mostly such as a person could carry out.
class Whim {
 public:
  explicit Whim(unsigned seed) : engine_(seed) {}

  /// `screen` is the state of the screen in front, control by control.
  std::string Line(const Json& screen) {
    if (OneIn(6)) return Prepared();
    if (OneIn(6)) return "key " + OneOf(kKeys);
    if (screen.empty()) return "screens";
    const Json& control = Chosen(screen);
    const std::string name = control["name"];
    if (OneIn(12)) return OneOf(kOnAnything) + " " + name;
    if (OneIn(60)) return OneOf(kSomeScreen);
    return OnControl(name, control);
  }

 private:
  using Choice = std::vector<std::string>;

  int Below(std::size_t count) {
    return count == 0 ? 0
                      : std::uniform_int_distribution<int>(0, static_cast<int>(count) - 1)(engine_);
  }
  bool OneIn(int chances) { return Below(static_cast<std::size_t>(chances)) == 0; }
  const std::string& OneOf(const Choice& choice) {
    return choice[static_cast<std::size_t>(Below(choice.size()))];
  }

  /// Any control now and then, otherwise one that can be acted on.
  const Json& Chosen(const Json& screen) {
    for (int tries = 0;; ++tries) {
      const Json& control = *std::next(screen.begin(), Below(screen.size()));
      const std::string kind = control["kind"];
      const bool answers = kind != "label" && kind != "panel" && kind != "progress";
      if (tries > 50 || (control["shown"] && control["enabled"] && answers)) return control;
      if (OneIn(40)) return control;
    }
  }

  std::string Prepared() {
    if (OneIn(10)) {
      return "fault " + OneOf({"open", "write", "read", "any", "rename"}) + " " +
             std::to_string(1 + Below(6)) + " " + OneOf({"57", "61", "70", "75"});
    }
    return OneOf(kPrepared);
  }

  std::string OnControl(const std::string& name, const Json& control) {
    const std::string kind = control["kind"];
    if (kind == "text") return OneIn(4) ? "focus " + name : "type " + name + " " + OneOf(kTexts);
    if (kind == "combo") return OnCombo(name, control);
    if (kind == "date") return "date " + name + " " + OneOf(kDays);
    if (kind == "grid") {
      return OneOf({"cell ", "dblcell "}) + name + " " + Number(control["rows"]) + " " +
             Number(control["cols"]);
    }
    if (control.contains("lines")) {
      return OneOf({"pick ", "pick ", "dblpick "}) + name + " " + Number(control["lines"].size());
    }
    return (OneIn(8) ? "dblclick " : "click ") + name;
  }

  std::string OnCombo(const std::string& name, const Json& control) {
    if (!control["locked"] && OneIn(2)) return "type " + name + " " + OneOf(kTexts);
    return "pick " + name + " " + Number(control["lines"].size());
  }

  /// One of so many, seldom one too high.
  std::string Number(std::size_t count) {
    return std::to_string(Below(OneIn(20) ? count + 1 : count));
  }

  const Choice kKeys = {"Enter", "Tab",   "Shift+Tab", "Esc",   "Up",    "Down",
                        "F1",    "Alt+F", "Alt+H",     "Alt+C", "Alt+A", "Alt+S"};
  const Choice kOnAnything = {"hover", "focus", "click", "dblclick", "type", "select", "date"};
  const Choice kSomeScreen = {"close frmResults", "close frmNames", "close frmDB",
                              "close frmPMenu",   "hover frmDB",    "clock 2004-11-05"};
  const Choice kPrepared = {"answer yes",   "answer yes",      "answer no",   "answer cancel",
                            "answer ok",    "input 3",         "input",       "input Darts & Co",
                            "input-cancel", "file Winter.qza", "file-cancel", "file New.qza",
                            "setup-cancel", "forget",          "fault off"};
  const Choice kTexts = {"",   "0",   "5",      "45",       "180",           "1000", "99999",
                         "-3", "1.5", "Archer", "Jo  Ann ", "O'Neil, \"B\"", "x",    "A Grade"};
  const Choice kDays = {"2004-03-31", "2003-10-08", "2003-10-15", "2004-12-01", "1999-12-31"};

  std::mt19937 engine_;
};

class RandomSession : public ClubTest {
 protected:
  RandomSession() { LaySample(*this); }

  /// Carries out so many lines; ends at the first at which something is wrong.
  void Live(unsigned whim_seed, unsigned lines) {
    Whim whim(whim_seed);
    std::string script;
    for (unsigned i = 0; i < lines && !HasFailure(); ++i) {
      const std::string line = NextLine(whim);
      script += line + "\n";
      const Json answer = Try(line);
      const std::string error = answer.value("error", std::string());
      EXPECT_EQ(error.find("fault in the program"), std::string::npos) << error;
      if (!answer.contains("ended")) continue;
      Restart();
      script += "# started anew\n";
    }
    EXPECT_FALSE(HasFailure()) << "seed " << whim_seed << ", after:\n" << script;
  }

 private:
  /// The file copier is left as soon as it opens: it would be let loose on the machine's own disks,
  /// and each face would see the other's folder there. It has random sessions of its own.
  std::string NextLine(Whim& whim) {
    if (Try("screens")["front"] == "frmBackup") return "close frmBackup";
    return whim.Line(Try("state").value("controls", Json::object()));
  }
};

class RandomSessions : public RandomSession, public ::testing::WithParamInterface<unsigned> {};

TEST_P(RandomSessions, GoTheSameWayInEveryFace) {
  Live(Setting("MARLOWBECK_SEED", 20040407) + GetParam(), Setting("MARLOWBECK_LINES", 60));
}

INSTANTIATE_TEST_SUITE_P(On, RandomSessions,
                         ::testing::Range(0U, Setting("MARLOWBECK_SESSIONS", 4)));

}  // namespace
}  // namespace marlowbeck

#pragma once

#include <cstdint>
#include <functional>
#include <memory>
#include <string>

#include "data/fault_file_system.h"
#include "data/real_file_system.h"
#include "drive/page_recorder.h"
#include "drive/script_answers.h"
#include "drive/script_dialogs.h"
#include "drive/script_services.h"

namespace marlowbeck {

/// What a program is started with.
struct WorldSettings {
  std::string folder;  ///< the working folder: whole path, code page 1252; it exists
  Date today;
  std::uint64_t seed = 1;
  int screen_width = 15360;  ///< twips
  std::string pdf_folder{};  ///< where documents go as PDF files, UTF-8; empty: they are told
};

using FaceMaker = std::function<std::unique_ptr<Face>(BoxAnswers&)>;

/// A running program with all that it can reach: the script's answers, printer and clock, a disk
/// that can be made to fail, and the face that works it.
class World {
 public:
  /// Starts the program.
  World(const WorldSettings& settings, const FaceMaker& make_face,
        const Program::Registration& registration);
  World(const World&) = delete;
  World& operator=(const World&) = delete;
  /// Runs no closing steps of the program.
  ~World() { face_.reset(); }

  [[nodiscard]] Face& GetFace() { return *face_; }
  [[nodiscard]] Program& GetProgram() { return *program_; }
  [[nodiscard]] Screens& GetScreens() { return program_->GetScreens(); }
  [[nodiscard]] FaultPlan& Faults() { return files_.Plan(); }

  /// Runs something that works the program. Answers false when it was broken off.
  bool Run(const std::function<void()>& work);
  [[nodiscard]] bool Ended() { return GetScreens().Ended(); }

  EventLog log;
  ScriptAnswers answers{log};
  PageRecorder printer{log};
  ScriptClipboard clipboard{log};
  ScriptClock clock;

 private:
  [[nodiscard]] Platform MakePlatform();

  ScriptDialogs dialogs_{answers, log};
  ScriptSound sound_{log};
  ScriptHelp help_{log};
  ScriptTimer timer_;
  ScriptObserver observer_{log};
  RealFileSystem real_files_;
  FaultFileSystem files_{real_files_};
  std::unique_ptr<Face> face_;
  std::unique_ptr<Printer> pdf_printer_;  ///< null where documents are told
  ScriptDisplay display_;
  Platform platform_;
  std::unique_ptr<Program> program_;
};

}  // namespace marlowbeck

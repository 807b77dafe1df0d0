#include "drive/world.h"

namespace marlowbeck {

World::World(const WorldSettings& settings, const FaceMaker& make_face,
             const Program::Registration& registration)
    : clock(settings.today),
      timer_(settings.seed),
      face_(make_face(answers)),
      pdf_printer_(settings.pdf_folder.empty() ? nullptr
                                               : face_->MakePdfPrinter(settings.pdf_folder)),
      display_(settings.screen_width, *face_),
      platform_(MakePlatform()) {
  files_.ChangeFolder(settings.folder);
  program_ = std::make_unique<Program>(platform_, files_, settings.folder, registration);
  face_->Attach(*program_);
  Run([this] { program_->Start(); });
  face_->Refresh();
}

Platform World::MakePlatform() {
  Printer& paper = pdf_printer_ ? *pdf_printer_ : printer;
  return {face_->GetBoxes(), dialogs_, paper, clipboard, sound_, help_, clock, timer_,
          display_,          observer_};
}

bool World::Run(const std::function<void()>& work) {
  answers.BeginCommand();
  bool whole = true;
  try {
    work();
  } catch (const BrokenOff&) {
    program_->GiveUpEvent();
    whole = false;
  }
  if (Ended()) log.AddEnd();
  return whole;
}

}  // namespace marlowbeck

#include "program/program.h"

#include <cstdint>
#include <utility>

namespace marlowbeck {

Program::Program(Platform& platform, FileSystem& files, std::string working_folder,
                 const Registration& registration)
    : working_folder_(std::move(working_folder)),
      platform_(platform),
      channels_(files),
      context_{session_, channels_, platform_, working_folder_},
      screens_([this](int number) { ReportError(number); }),
      hand_(screens_, platform_.boxes) {
  registration(screens_, context_);
}

void Program::Start() {
  screens_.GetDispatcher().Run([this] { screens_.Show("frmDB"); });
  screens_.Settle();
}

void Program::GiveUpEvent() {
  channels_.AbandonAll();
  screens_.Settle();
}

void Program::ReportError(int number) {
  channels_.AbandonAll();
  session_.ErrorNumber = static_cast<std::int16_t>(number);
  platform_.observer.ErrorRaised(number);
  if (Screen* const errors = screens_.ShowQuietly("frmErrors")) errors->Activate();
}

}  // namespace marlowbeck

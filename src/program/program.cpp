#include "program/program.h"

#include <utility>

#include "program/register_screens.h"

namespace marlowbeck {

Program::Program(Platform& platform, FileSystem& files, std::string working_folder)
    : working_folder_(std::move(working_folder)),
      platform_(platform),
      channels_(files),
      context_{session_, channels_, platform_, working_folder_},
      screens_([this](int number) { ReportError(number); }),
      hand_(screens_, platform_.boxes) {
  RegisterScreens(screens_, context_);
}

void Program::Start() {
  screens_.GetDispatcher().Run([this] { screens_.Show("frmDB"); });
  screens_.Settle();
}

void Program::ReportError(int number) {
  channels_.AbandonAll();
  session_.ErrorNumber = Integer::Narrow(number);
  platform_.observer.ErrorRaised(number);
  if (Screen* const errors = screens_.ShowQuietly("frmErrors")) errors->Activate();
}

}  // namespace marlowbeck

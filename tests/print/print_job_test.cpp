#include "print/print_job.h"

#include "data/runtime_error.h"
#include "drive/workbench.h"

namespace marlowbeck {
namespace {

class PrintJobTest : public WorkbenchTest {};

TEST_F(PrintJobTest, AFailureClosesAllFilesBeforeItIsTold) {
  WriteFile("S.qzs", "\"Winter 2004\"\r\n");
  OnDo([](Workbench& bench) {
    Channels& channels = bench.context.channels;
    PrintJob::Run(bench.context, {}, [&](PrintJob& /*job*/) {
      channels.OpenInput(Channel::Side, "S.qzs");
      throw RunTimeError(ErrorNumber::DiskFull);
    });
    try {
      static_cast<void>(channels.Reader(Channel::Side));
      bench.Tell("open");
    } catch (const RunTimeError&) {
      bench.Tell("closed");
    }
  });
  EXPECT_EQ(ToldBy("click cmdDo"), "closed;");
  EXPECT_EQ(BoxTexts(), TextList{"An unrecognised error occurred while trying to print.    "});
  EXPECT_EQ(Count("killed"), 1);
}

}  // namespace
}  // namespace marlowbeck

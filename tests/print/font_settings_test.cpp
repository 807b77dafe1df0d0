#include "print/font_settings.h"

#include <filesystem>

#include "drive/workbench.h"

namespace marlowbeck {
namespace {

// Where the file of the printer font lies.
class FontSettings : public WorkbenchTest {};

TEST_F(FontSettings, LieInTheWorkingFolderWhereverElseAFileWasLookedFor) {
  WriteFile("FontName.qz3", "12,\"Liberation Serif\",#FALSE#,#TRUE#\r\n");
  OnDo([](Workbench& bench) {
    const Context& context = bench.context;
    const std::string elsewhere = context.working_folder + "/elsewhere";
    context.channels.Files().MakeFolder(elsewhere);
    context.channels.Files().ChangeFolder(elsewhere);
    ReadFontSettings(context);
    bench.Tell(context.session.PrintFontName);
    context.channels.Files().ChangeFolder(elsewhere);
    context.session.PrintFontSize = 14;
    WriteFontSettings(context);
  });
  EXPECT_EQ(ToldBy("click cmdDo"), "Liberation Serif;");
  EXPECT_EQ(File("FontName.qz3"), "14,\"Liberation Serif\",#FALSE#,#TRUE#\r\n");
  EXPECT_TRUE(std::filesystem::is_empty(FilePath("elsewhere")));
}

}  // namespace
}  // namespace marlowbeck

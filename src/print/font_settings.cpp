#include "print/font_settings.h"

#include <string>

#include "data/integer.h"
#include "data/runtime_error.h"

namespace marlowbeck {
namespace {

constexpr const char* kFontFile = "FontName.qz3";

void Take(Session& session, std::int32_t size, std::string_view name, bool bold, bool italic) {
  session.PrintFontSize = size;
  session.PrintFontName = name;
  session.PrintFontBold = bold;
  session.PrintFontItalic = italic;
}

void Read(const Context& context) {
  context.channels.OpenInput(Channel::Side, kFontFile);
  SideFileReader& reader = context.channels.Reader(Channel::Side);
  const std::int32_t size = NarrowToLong(reader.Number());
  const std::string name = reader.Text();
  const bool bold = reader.Truth();
  const bool italic = reader.Truth();
  context.channels.Close(Channel::Side);
  if (size < 1 || name.empty()) throw RunTimeError(ErrorNumber::TypeMismatch);
  Take(context.session, size, name, bold, italic);
}

}  // namespace

void ReadFontSettings(const Context& context) {
  context.GoToWorkingFolder();
  try {
    Read(context);
  } catch (const RunTimeError&) {
    context.channels.AbandonAll();
    Take(context.session, 10, "MS Sans Serif", false, false);
    WriteFontSettings(context);
  }
}

void WriteFontSettings(const Context& context) {
  const Session& session = context.session;
  context.GoToWorkingFolder();
  context.channels.OpenOutput(Channel::Side, kFontFile, Keeping::Lasting);
  SideFileWriter& writer = context.channels.Writer(Channel::Side);
  writer.Number(session.PrintFontSize).Text(session.PrintFontName);
  writer.Truth(session.PrintFontBold).Truth(session.PrintFontItalic).EndLine();
  context.channels.Close(Channel::Side);
}

PrinterFont PrinterFontOf(const Session& session) {
  return {session.PrintFontName, session.PrintFontSize, session.PrintFontBold,
          session.PrintFontItalic, false};
}

}  // namespace marlowbeck

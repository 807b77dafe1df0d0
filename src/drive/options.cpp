#include "drive/options.h"

#include <cstdint>
#include <filesystem>
#include <iostream>
#include <system_error>

#include <CLI/CLI.hpp>

#include "data/text.h"

namespace marlowbeck {
namespace {

namespace fs = std::filesystem;

constexpr int kSenseless = 2;

/// The folder's whole path, without a separator at its end.
fs::path WholePath(const std::string& folder) {
  const fs::path whole = fs::absolute(fs::path(folder)).lexically_normal();
  return whole.has_filename() ? whole : whole.parent_path();
}

/// Makes a folder unless it is there and answers its path as the program names it. Throws
/// CLI::ValidationError when it can be neither.
std::string MakeWorkingFolder(const std::string& folder) {
  if (folder.empty()) throw CLI::ValidationError("FOLDER", "has no name");
  const fs::path whole = WholePath(folder);
  const std::string text = TextOfPath(whole);
  const std::u8string utf8 = whole.u8string();
  if (Utf8FromCp1252(text) != std::string(utf8.begin(), utf8.end())) {
    throw CLI::ValidationError("FOLDER", folder + " has characters that the program cannot name");
  }
  std::error_code error;
  fs::create_directories(whole, error);
  if (!fs::is_directory(whole, error)) {
    throw CLI::ValidationError("FOLDER", folder + " is no folder and cannot be made");
  }
  return text;
}

struct Words {
  std::string folder;
  std::string today = "2004-03-31";
  std::uint64_t seed = 1;
  int screen_width = 15360;
  bool window = false;
  std::string pdf_folder;
};

void Describe(CLI::App& app, Words& words) {
  const CLI::Validator is_date(
      [](const std::string& text) {
        return DateFromIso(text) ? std::string() : text + " is no date of the form YYYY-MM-DD";
      },
      "YYYY-MM-DD");
  app.add_option("--today", words.today, "the system clock's date")->check(is_date);
  app.add_option("--seed", words.seed, "what the system timer gives the first time it is asked")
      ->check(CLI::NonNegativeNumber);
  app.add_option("--screen-width", words.screen_width, "the screen's width in twips")
      ->check(CLI::PositiveNumber);
  auto* const window = app.add_flag("--window", words.window, "work the real windows");
  app.add_option("--pdf", words.pdf_folder, "make PDF files of documents in this folder")
      ->needs(window)
      ->check(CLI::ExistingDirectory);
  app.add_option("FOLDER", words.folder, "the working folder, made if it is missing")->required();
}

DriveOptions Resolve(const Words& words) {
  DriveOptions options;
  options.world.folder = MakeWorkingFolder(words.folder);
  options.world.today = DateFromIso(words.today).value_or(Date{});
  options.world.seed = words.seed;
  options.world.screen_width = words.screen_width;
  options.window = words.window;
  options.world.pdf_folder = words.pdf_folder;
  return options;
}

}  // namespace

std::optional<DriveOptions> ReadOptions(int argc, const char* const* argv, int& exit_status) {
  CLI::App app("Marlowbeck worked by a script: a command a line in, a line of JSON out.");
  Words words;
  Describe(app, words);
  try {
    app.parse(argc, argv);
    return Resolve(words);
  } catch (const CLI::ParseError& error) {
    exit_status = app.exit(error, std::cout, std::cerr) == 0 ? 0 : kSenseless;
    return std::nullopt;
  }
}

}  // namespace marlowbeck

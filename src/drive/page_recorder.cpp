#include "drive/page_recorder.h"

#include <cmath>
#include <utility>

#include "data/runtime_error.h"

namespace marlowbeck {
namespace {

constexpr int kCharacterWidth = 10;  // twips for each point of the size
constexpr int kTextHeight = 24;

/// Twips, without a point where they are whole.
Json Twips(double value) {
  if (std::trunc(value) == value && std::abs(value) < 1e15) return static_cast<long long>(value);
  return value;
}

Json Corners(double x1, double y1, double x2, double y2) {
  return Json::array({Twips(x1), Twips(y1), Twips(x2), Twips(y2)});
}

}  // namespace

double PageRecorder::TextWidth(const std::string& text) {
  return static_cast<double>(text.size()) * font_.size * kCharacterWidth;
}

double PageRecorder::TextHeight(const std::string& /*text*/) { return font_.size * kTextHeight; }

void PageRecorder::Begin() {
  if (!fail_in_ || --*fail_in_ > 0) return;
  fail_in_.reset();
  throw RunTimeError(ErrorNumber::PrinterOff);
}

void PageRecorder::Print(double x, double y, const std::string& text) {
  Begin();
  Add({{"text", TextAsJson(text)},
       {"x", Twips(x)},
       {"y", Twips(y)},
       {"font", TextAsJson(font_.name)},
       {"size", font_.size},
       {"bold", font_.bold},
       {"italic", font_.italic},
       {"underline", font_.underline}});
}

void PageRecorder::Line(double x1, double y1, double x2, double y2) {
  Begin();
  Add(Json::object({{"line", Corners(x1, y1, x2, y2)}}));
}

void PageRecorder::Box(double x1, double y1, double x2, double y2) {
  Begin();
  Add(Json::object({{"box", Corners(x1, y1, x2, y2)}}));
}

void PageRecorder::NewPage() {
  Begin();
  pages_.push_back(Json::array());
}

void PageRecorder::EndDoc() {
  Begin();
  if (pages_.back().empty()) pages_.erase(pages_.size() - 1);
  log_.Add("printed", Json::object({{"pages", std::exchange(pages_, NoPages())}}));
}

void PageRecorder::KillDoc() {
  pages_ = NoPages();
  log_.Add("killed", true);
}

}  // namespace marlowbeck

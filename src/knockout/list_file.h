#pragma once

#include <string>

#include "data/date.h"
#include "data/side_file.h"
#include "knockout/entrants.h"

namespace marlowbeck {

// The two files of a knock-out. A list file, "*.ko4", is saved by name: 130 items, one to a line,
// which are the players of all places, their grades, the date, and the grade that they were picked
// from. The work file has a place to a line, and the grade in the last.

struct KnockOutList {
  Places places;
  Date date;
  std::string grade;
};

void WriteList(SideFileWriter& writer, const KnockOutList& list);

/// What a list file was found to hold.
struct ListReading {
  KnockOutList list;  ///< as far as it could be read
  bool whole = false;
  std::string last_item;  ///< the last of all there are, which is the grade in a whole file
};

/// Reads all of a file's bytes. One with fewer or more items, with a last one that is cut short, or
/// without a date in its place, is not whole.
[[nodiscard]] ListReading ReadList(const std::string& content);

struct WorkingList {
  Places places;
  std::string grade;
};

void WriteWorkFile(SideFileWriter& writer, const WorkingList& list);
/// Throws InputPastEnd where lines are missing, and TypeMismatch where one has no second item.
[[nodiscard]] WorkingList ReadWorkFile(SideFileReader& reader);

}  // namespace marlowbeck

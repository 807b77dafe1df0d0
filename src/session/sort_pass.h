#pragma once

#include <functional>
#include <string>

#include "data/channels.h"

namespace marlowbeck {

/// A file of records of one length that each hold a date.
struct DatedFile {
  std::string path;
  std::size_t record_length;
  std::size_t date_offset;
};

/// Puts a file in ascending order of dates by way of a work file that then takes its place in one
/// step; records of one date keep their order. `moved` is told the number of each record read. A
/// failure before the last step leaves the file as it was and a useless work file.
///
/// KEPT: a work file that is there already is written over as it is, so that records of it beyond
/// the new ones end up in the file; a repair would empty it first.
void SortByDate(Channels& channels, const DatedFile& file, const std::string& work_file,
                const std::function<void(int record)>& moved);

/// The same for a results file.
void SortResults(Channels& channels, const std::string& results_file, const std::string& work_file,
                 const std::function<void(int record)>& moved);

}  // namespace marlowbeck

#pragma once

#include <string>

#include "data/channels.h"

namespace marlowbeck {

/// Copies every record of the results file that is open, but for one, to a work file, in order and
/// numbered from 1. Leaves all channels closed, and the copy on the disk.
///
/// KEPT: a work file that is there already is written over as it is, so that a longer one's last
/// records end up behind the copied ones; a repair would empty it first.
void CopyResultsWithout(Channels& channels, int number, const std::string& work_file);

}  // namespace marlowbeck

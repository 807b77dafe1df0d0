#pragma once

#include "support/club.h"

namespace marlowbeck {

/// Lays the sample season into the folders of a club, with its player file open at the start.
void LaySample(Club& club);

}  // namespace marlowbeck

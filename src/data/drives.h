#pragma once

#include <istream>
#include <string>
#include <vector>

namespace marlowbeck {

/// The drives of the machine: letters as "C:" where it has them, otherwise the folders at which
/// disks are mounted, "/" first and all others by name. Texts as TextOfName has them.
[[nodiscard]] std::vector<std::string> DrivesOfMachine();

/// The mount points that somebody may keep files at, out of the system's table of mounts. What the
/// system mounts for itself is left out.
[[nodiscard]] std::vector<std::string> MountPointsIn(std::istream& mounts);

}  // namespace marlowbeck

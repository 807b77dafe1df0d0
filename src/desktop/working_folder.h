#pragma once

#include <QString>
#include <QStringList>

namespace marlowbeck {

/// Whether a file can be made in a folder.
[[nodiscard]] bool CanBeWritten(const QString& folder);

/// The folder that the program works in: its own or, where that cannot be written to, the one for
/// the user's data. That one is made when it is missing, and begins with a copy of what was laid
/// beside the program.
[[nodiscard]] QString WorkingFolder(const QString& program_folder, const QString& data_folder);

/// The first of some folders in which a file lies; the last of them when it lies in none.
[[nodiscard]] QString FolderWith(const QString& file, const QStringList& folders);

}  // namespace marlowbeck

#include "desktop/working_folder.h"

#include <QDir>
#include <QFile>
#include <QSaveFile>
#include <QTemporaryFile>

#include "data/side_file.h"
#include "desktop/encoding.h"

namespace marlowbeck {
namespace {

constexpr const char* kOpenFile = "FileName.qz3";
constexpr const char* kSample = "Winter.qza";
/// What belongs to the sample and its night. The player file, by which a copy is told from none,
/// and the file that opens it come after these.
const QStringList kBesideSample = {"Winter_*", "Association.qz3", "GameName.qz3", "WkDate.qz3"};

/// Whole or not at all, and never in the place of another. What the copy may be used for does not
/// depend on what its source may.
void Lay(const QString& path, const QByteArray& content) {
  if (QFile::exists(path)) return;
  QSaveFile file(path);
  if (file.open(QIODevice::WriteOnly) && file.write(content) == content.size()) file.commit();
}

void LayCopy(const QDir& from, const QDir& to, const QString& name) {
  QFile source(from.filePath(name));
  if (source.open(QIODevice::ReadOnly)) Lay(to.filePath(name), source.readAll());
}

/// A path that a side file cannot hold is left to the working folder.
QByteArray OpenFileNaming(const QString& path) {
  const QString native = QDir::toNativeSeparators(path);
  const std::string text = FromQt(native);
  SideFileWriter writer;
  writer.Text(ToQt(text) == native ? text : kSample).EndLine();
  return QByteArray::fromStdString(writer.Content());
}

/// Lays the sample with its side files, open, where nothing has been opened before.
void LaySample(const QDir& from, const QDir& to) {
  if (to.exists(kOpenFile) || to.exists(kSample) || !from.exists(kSample)) return;
  for (const QString& name : from.entryList(kBesideSample, QDir::Files)) LayCopy(from, to, name);
  LayCopy(from, to, kSample);
  if (to.exists(kSample)) Lay(to.filePath(kOpenFile), OpenFileNaming(to.filePath(kSample)));
}

}  // namespace

bool CanBeWritten(const QString& folder) {
  QTemporaryFile file(QDir(folder).filePath("marlowbeck-XXXXXX.tmp"));
  return file.open();
}

QString WorkingFolder(const QString& program_folder, const QString& data_folder) {
  if (CanBeWritten(program_folder)) return program_folder;
  QDir().mkpath(data_folder);
  LaySample(QDir(program_folder), QDir(data_folder));
  return data_folder;
}

QString FolderWith(const QString& file, const QStringList& folders) {
  for (const QString& folder : folders) {
    if (QFile::exists(QDir(folder).filePath(file))) return folder;
  }
  return folders.isEmpty() ? QString() : folders.constLast();
}

}  // namespace marlowbeck

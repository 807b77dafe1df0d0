#pragma once

#include <unistd.h>

#include <string>

#include <QDir>
#include <QFile>
#include <QTemporaryDir>
#include <gtest/gtest.h>

namespace marlowbeck {

inline constexpr uid_t kNobody = 65534;

inline std::string ContentOf(const QString& path) {
  QFile file(path);
  return file.open(QIODevice::ReadOnly) ? file.readAll().toStdString() : "(no such file)";
}

inline void WriteFile(const QString& path, const QByteArray& content) {
  QFile file(path);
  ASSERT_TRUE(file.open(QIODevice::WriteOnly)) << path.toStdString();
  file.write(content);
}

/// A folder that anybody may look into, as a program's is, and only its owner may write to.
class OwnersFolder {
 public:
  OwnersFolder() { Permit(QFile::ReadOwner | QFile::WriteOwner | QFile::ExeOwner | kOthers); }
  ~OwnersFolder() { Permit(QFile::ReadOwner | QFile::WriteOwner | QFile::ExeOwner); }
  [[nodiscard]] QString Path(const QString& name = {}) const { return folder_.filePath(name); }
  [[nodiscard]] QStringList Files() const {
    return QDir(folder_.path()).entryList(QDir::Files | QDir::Hidden, QDir::Name);
  }
  /// Nobody may write to it any more, but whom the system asks nothing.
  void Close() { Permit(QFile::ReadOwner | QFile::ExeOwner | kOthers); }
  /// Anybody may write to it.
  void Open() { Permit(QFile::Permissions(0x7777)); }

 private:
  static constexpr QFile::Permissions kOthers =
      QFile::ReadGroup | QFile::ExeGroup | QFile::ReadOther | QFile::ExeOther;
  void Permit(QFile::Permissions permissions) {
    EXPECT_TRUE(QFile::setPermissions(folder_.path(), permissions));
  }

  QTemporaryDir folder_;
};

/// For as long as it lives the test has no more rights than a visitor, also where it is run by one
/// who may do everything.
class AsVisitor {
 public:
  AsVisitor() : was_(geteuid()) { Become(kNobody); }
  AsVisitor(const AsVisitor&) = delete;
  AsVisitor& operator=(const AsVisitor&) = delete;
  ~AsVisitor() { Become(was_); }

 private:
  void Become(uid_t user) const {
    if (was_ != 0) return;
    EXPECT_EQ(seteuid(user), 0);
  }

  uid_t was_;
};

}  // namespace marlowbeck

#pragma once

#include <map>
#include <string>

#include <QTextBrowser>

#include "platform/platform.h"

namespace marlowbeck {

/// The manual in a window of its own, which stays open beside the program's. Topic numbers stand
/// for pages in a table that lies with them.
class HelpWindow : public Help {
 public:
  /// `folder` holds the pages and the table, and need not be there.
  explicit HelpWindow(QString folder) : folder_(std::move(folder)) {}
  ~HelpWindow() override { delete browser_; }
  void Open(const std::string& file, int topic) override;

 private:
  void ReadTopics();
  void MakeBrowser();
  void ShowPage(const QString& page);

  QString folder_;
  std::map<int, QString> topics_;  ///< "page.md#heading"
  QTextBrowser* browser_ = nullptr;
};

}  // namespace marlowbeck

#include "desktop/help_window.h"

#include <QDir>
#include <QFile>
#include <QRegularExpression>
#include <QTextBlock>
#include <QTextDocument>
#include <QTextStream>

#include "desktop/theme.h"

namespace marlowbeck {
namespace {

constexpr const char* kContents = "index.md";
constexpr int kPageMargin = 24;

/// How a heading is called in a link: lower case, words joined by hyphens.
QString AnchorOf(const QString& heading) {
  static const QRegularExpression kOther("[^\\w\\- ]");
  return heading.toLower().remove(kOther).trimmed().replace(' ', '-');
}

/// Pages with links to headings of pages, which plain text documents know nothing of.
class Pages : public QTextBrowser {
 public:
  void doSetSource(const QUrl& url, QTextDocument::ResourceType type) override {
    QUrl page = url;
    page.setFragment(QString());
    QTextBrowser::doSetSource(page, type);
    if (url.hasFragment()) GoTo(url.fragment());
  }

 private:
  void GoTo(const QString& anchor) {
    for (QTextBlock block = document()->begin(); block.isValid(); block = block.next()) {
      if (block.blockFormat().headingLevel() == 0 || AnchorOf(block.text()) != anchor) continue;
      moveCursor(QTextCursor::End);  // so that the heading comes to the top
      setTextCursor(QTextCursor(block));
      return;
    }
  }
};

}  // namespace

void HelpWindow::Open(const std::string& /*file*/, int topic) {
  if (browser_ == nullptr) {
    ReadTopics();
    MakeBrowser();
  }
  const auto place = topics_.find(topic);
  ShowPage(place == topics_.end() ? kContents : place->second);
}

void HelpWindow::ReadTopics() {
  QFile table(QDir(folder_).filePath("topics.txt"));
  if (!table.open(QIODevice::ReadOnly | QIODevice::Text)) return;
  QTextStream lines(&table);
  while (!lines.atEnd()) {
    const QStringList fields = lines.readLine().split('\t');
    bool is_number = false;
    const int topic = fields[0].toInt(&is_number);
    if (is_number && fields.size() > 1) topics_[topic] = fields[1].trimmed();
  }
}

void HelpWindow::MakeBrowser() {
  browser_ = new Pages;
  browser_->setWindowTitle("Marlowbeck Help");
  browser_->setSearchPaths({folder_});
  browser_->document()->setDocumentMargin(kPageMargin);
  browser_->setOpenExternalLinks(true);
  browser_->resize(720, 560);
}

void HelpWindow::ShowPage(const QString& page) {
  QUrl url = QUrl::fromLocalFile(QDir(folder_).filePath(page.section('#', 0, 0)));
  url.setFragment(page.section('#', 1));
  browser_->setSource(url, QTextDocument::MarkdownResource);
  browser_->show();
  browser_->raise();
  browser_->activateWindow();
}

}  // namespace marlowbeck

#include "desktop/help_window.h"

#include <QApplication>
#include <QFile>
#include <QTemporaryDir>
#include <QTextBlock>
#include <gtest/gtest.h>

namespace marlowbeck {
namespace {

class Manual : public testing::Test {
 protected:
  Manual() {
    Write("topics.txt", "0\tindex.md\n215\tleaving.md#copies-of-your-data\n");
    Write("index.md", "# Contents\n");
    Write("leaving.md", "# Leaving\n\ntext\n\n## Copies of your data\n\ntext\n");
  }

  void Write(const QString& name, const QByteArray& text) const {
    QFile file(folder_.filePath(name));
    ASSERT_TRUE(file.open(QIODevice::WriteOnly));
    file.write(text);
  }

  /// The window that shows the manual; null while there is none.
  static QTextBrowser* Shown() {
    for (QWidget* widget : QApplication::topLevelWidgets()) {
      auto* const browser = qobject_cast<QTextBrowser*>(widget);
      if (browser != nullptr && browser->isVisible()) return browser;
    }
    return nullptr;
  }

  QTemporaryDir folder_;
  HelpWindow help_{folder_.path()};
};

TEST_F(Manual, TopicNoughtIsTheContents) {
  help_.Open("qz1.HLP", 0);
  ASSERT_NE(Shown(), nullptr);
  EXPECT_EQ(Shown()->toPlainText().trimmed(), QString("Contents"));
}

TEST_F(Manual, ATopicOpensItsPageAtItsHeading) {
  help_.Open("qz1.HLP", 215);
  ASSERT_NE(Shown(), nullptr);
  EXPECT_EQ(Shown()->textCursor().block().text(), QString("Copies of your data"));
}

TEST_F(Manual, AnUnknownTopicOpensTheContents) {
  help_.Open("qz1.HLP", 999);
  ASSERT_NE(Shown(), nullptr);
  EXPECT_EQ(Shown()->toPlainText().trimmed(), QString("Contents"));
}

TEST_F(Manual, OneWindowShowsWhatIsAskedForNext) {
  help_.Open("qz1.HLP", 0);
  const QTextBrowser* const first = Shown();
  help_.Open("qz1.HLP", 215);
  EXPECT_EQ(Shown(), first);
  EXPECT_TRUE(Shown()->toPlainText().startsWith("Leaving"));
}

TEST(ManualThatIsNotThere, IsNoFailure) {
  HelpWindow help("/no/such/folder");
  EXPECT_NO_THROW(help.Open("qz1.HLP", 0));
}

}  // namespace
}  // namespace marlowbeck

// The dialogs for files, fonts and the printer as they stand on the screen.

#include "desktop/dialogs.h"

#include <QApplication>
#include <QComboBox>
#include <QDialogButtonBox>
#include <QFileDialog>
#include <QFontDialog>
#include <QLineEdit>
#include <QMessageBox>
#include <QPushButton>
#include <QRadioButton>
#include <QTimer>

#include "data/runtime_error.h"
#include "desktop/encoding.h"
#include "desktop/printer_setup.h"
#include "tests/desktop/folders.h"

namespace marlowbeck {
namespace {

class RealDialogs : public testing::Test {
 protected:
  /// Works a dialog once it stands.
  template <typename Shown>
  void OnceUp(const std::function<void(Shown&)>& work) {
    QTimer::singleShot(0, qApp, [=, this] {
      auto* const dialog = dynamic_cast<Shown*>(QApplication::activeModalWidget());
      ASSERT_NE(dialog, nullptr);
      ++seen_;
      work(*dialog);
      if (dialog->isVisible()) dialog->reject();  // a test that goes wrong goes on
    });
  }
  static void Press(const QDialog& dialog, QDialogButtonBox::StandardButton button) {
    auto* const found = dialog.findChild<QDialogButtonBox*>()->button(button);
    ASSERT_NE(found, nullptr);
    found->click();
  }

  int refreshed_ = 0;
  int seen_ = 0;
  PagePrinter printer_{[](const QString&) {}};
  DesktopDialogs dialogs_{printer_, [this] { ++refreshed_; }};
};

class FileDialogs : public RealDialogs {
 protected:
  FileDialogs() {
    WriteFile(folder_.Path("Winter.qza"), "");
    WriteFile(folder_.Path("notes.txt"), "");
  }
  [[nodiscard]] FileDialogRequest Asking(FileDialogRequest::Mode mode) const {
    return {mode, "[Marlowbeck] OPEN file.", "*.qza", FromQt(folder_.Path("")), "*.qza", "qza"};
  }
  static QLineEdit& NameBox(const QFileDialog& dialog) {
    return *dialog.findChild<QLineEdit*>("fileNameEdit");
  }
  /// Types a name and presses the button that goes on.
  void Answer(const QString& name, QDialogButtonBox::StandardButton button) {
    OnceUp<QFileDialog>([=](QFileDialog& dialog) {
      NameBox(dialog).setText(name);
      Press(dialog, button);
    });
  }

  static constexpr auto kOpen = FileDialogRequest::Mode::Open;
  static constexpr auto kSave = FileDialogRequest::Mode::Save;
  OwnersFolder folder_;
};

TEST_F(FileDialogs, OpenWithWhatIsAskedFor) {
  OnceUp<QFileDialog>([this](QFileDialog& dialog) {
    EXPECT_EQ(dialog.windowTitle(), QString("[Marlowbeck] OPEN file."));
    EXPECT_EQ(dialog.directory().absolutePath(), folder_.Path(""));
    EXPECT_EQ(dialog.nameFilters(), QStringList("*.qza"));
    EXPECT_EQ(dialog.defaultSuffix(), QString("qza"));
    EXPECT_EQ(dialog.acceptMode(), QFileDialog::AcceptOpen);
    EXPECT_EQ(dialog.fileMode(), QFileDialog::ExistingFile);
    EXPECT_EQ(NameBox(dialog).text(), QString());  // a pattern is no name
  });
  EXPECT_EQ(dialogs_.File(Asking(kOpen)), std::nullopt);
  EXPECT_EQ(seen_, 1);
  EXPECT_EQ(refreshed_, 1);
}

TEST_F(FileDialogs, OfferAName) {
  FileDialogRequest request = Asking(kSave);
  request.name = "Final.qza";
  OnceUp<QFileDialog>([](QFileDialog& dialog) {
    EXPECT_EQ(NameBox(dialog).text(), QString("Final.qza"));
    EXPECT_EQ(dialog.acceptMode(), QFileDialog::AcceptSave);
    EXPECT_EQ(dialog.fileMode(), QFileDialog::AnyFile);
    Press(dialog, QDialogButtonBox::Save);
  });
  EXPECT_EQ(dialogs_.File(request), FromQt(folder_.Path("Final.qza")));
}

TEST_F(FileDialogs, AnswerTheWholePath) {
  Answer("Winter.qza", QDialogButtonBox::Open);
  EXPECT_EQ(dialogs_.File(Asking(kOpen)), FromQt(folder_.Path("Winter.qza")));
}

TEST_F(FileDialogs, AnswerNothingWhenCancelled) {
  Answer("Winter.qza", QDialogButtonBox::Cancel);
  EXPECT_EQ(dialogs_.File(Asking(kOpen)), std::nullopt);
  EXPECT_EQ(seen_, 1);
}

TEST_F(FileDialogs, AddTheExtensionToANewName) {
  Answer("Summer", QDialogButtonBox::Save);
  EXPECT_EQ(dialogs_.File(Asking(kSave)), FromQt(folder_.Path("Summer.qza")));
}

TEST_F(FileDialogs, LeaveTheQuestionAboutAnExistingFileToTheProgram) {
  Answer("Winter.qza", QDialogButtonBox::Save);
  EXPECT_EQ(dialogs_.File(Asking(kSave)), FromQt(folder_.Path("Winter.qza")));
  EXPECT_EQ(seen_, 1);
}

TEST_F(FileDialogs, AskAboutAnExistingFileThemselvesWhereTheyAreTo) {
  int asked = 0;
  OnceUp<QFileDialog>([&asked](QFileDialog& dialog) {
    NameBox(dialog).setText("Winter.qza");
    QTimer::singleShot(0, qApp, [&asked] {
      auto* const question = dynamic_cast<QMessageBox*>(QApplication::activeModalWidget());
      ASSERT_NE(question, nullptr);
      ++asked;
      question->reject();
    });
    Press(dialog, QDialogButtonBox::Save);
  });
  FileDialogRequest request = Asking(kSave);
  request.asks_before_overwriting = true;
  EXPECT_EQ(dialogs_.File(request), std::nullopt) << "it is not to be written over";
  EXPECT_EQ(asked, 1);
}

TEST_F(FileDialogs, AnswerANameInTheProgramsLetters) {
  Answer(QString::fromUtf8("Zoë.qza"), QDialogButtonBox::Save);
  EXPECT_EQ(dialogs_.File(Asking(kSave)), FromQt(folder_.Path("")) + "/Zo\xEB.qza");
}

TEST_F(FileDialogs, RefuseANameThatTheProgramHasNoLettersFor) {
  // Anything else would open a file of another name.
  Answer(QString::fromUtf8("Дартс.qza"), QDialogButtonBox::Save);
  try {
    dialogs_.File(Asking(kSave));
    FAIL();
  } catch (const RunTimeError& error) {
    EXPECT_EQ(error.Number(), static_cast<int>(ErrorNumber::BadFileName));
  }
}

class FontDialogs : public RealDialogs {};

TEST_F(FontDialogs, OpenWithThePresentFont) {
  OnceUp<QFontDialog>([](QFontDialog& dialog) {
    EXPECT_EQ(dialog.currentFont().family(), QString("Liberation Serif"));
    EXPECT_EQ(dialog.currentFont().pointSize(), 14);
    EXPECT_TRUE(dialog.currentFont().bold());
    EXPECT_FALSE(dialog.currentFont().italic());
    Press(dialog, QDialogButtonBox::Ok);
  });
  const auto chosen = dialogs_.Font({"Liberation Serif", 14, true, false});
  ASSERT_TRUE(chosen.has_value());
  EXPECT_EQ(chosen->name, "Liberation Serif");
  EXPECT_EQ(chosen->size, 14);
  EXPECT_TRUE(chosen->bold);
  EXPECT_FALSE(chosen->italic);
  EXPECT_EQ(refreshed_, 1);
}

TEST_F(FontDialogs, AnswerTheFontThatWasChosen) {
  OnceUp<QFontDialog>([](QFontDialog& dialog) {
    QFont font("Liberation Mono", 24);
    font.setItalic(true);
    dialog.setCurrentFont(font);
    Press(dialog, QDialogButtonBox::Ok);
  });
  const auto chosen = dialogs_.Font({"Liberation Serif", 14, true, false});
  ASSERT_TRUE(chosen.has_value());
  EXPECT_EQ(chosen->name, "Liberation Mono");
  EXPECT_EQ(chosen->size, 24);
  EXPECT_FALSE(chosen->bold);
  EXPECT_TRUE(chosen->italic);
}

TEST_F(FontDialogs, AnswerNothingWhenCancelled) {
  OnceUp<QFontDialog>([](QFontDialog& dialog) { Press(dialog, QDialogButtonBox::Cancel); });
  EXPECT_EQ(dialogs_.Font({"Liberation Serif", 14, true, false}), std::nullopt);
  EXPECT_EQ(seen_, 1);
}

TEST_F(FontDialogs, AnswerTheFontThatTheyShowForOneThatTheMachineLacks) {
  QString shown;
  OnceUp<QFontDialog>([&](QFontDialog& dialog) {
    shown = dialog.currentFont().family();
    Press(dialog, QDialogButtonBox::Ok);
  });
  const auto chosen = dialogs_.Font({"No Such Font", 10, false, false});
  ASSERT_TRUE(chosen.has_value());
  EXPECT_EQ(chosen->name, FromQt(shown));
  EXPECT_EQ(chosen->size, 10);
}

TEST_F(FontDialogs, KeepTheNameOfAFontWhoseStandInTheyShow) {
  OnceUp<QFontDialog>([](QFontDialog& dialog) {
    EXPECT_EQ(dialog.currentFont().family(), QString("Liberation Sans"));
    QFont larger = dialog.currentFont();
    larger.setPointSize(12);
    dialog.setCurrentFont(larger);
    Press(dialog, QDialogButtonBox::Ok);
  });
  const auto chosen = dialogs_.Font({"MS Sans Serif", 10, false, false});
  ASSERT_TRUE(chosen.has_value());
  EXPECT_EQ(chosen->name, "MS Sans Serif");
  EXPECT_EQ(chosen->size, 12);
}

TEST_F(FontDialogs, AnswerAnotherFontThanTheStandIn) {
  OnceUp<QFontDialog>([](QFontDialog& dialog) {
    dialog.setCurrentFont(QFont("Liberation Serif", 12));
    Press(dialog, QDialogButtonBox::Ok);
  });
  const auto chosen = dialogs_.Font({"MS Sans Serif", 10, false, false});
  ASSERT_TRUE(chosen.has_value());
  EXPECT_EQ(chosen->name, "Liberation Serif");
}

class SetupDialogs : public RealDialogs {
 protected:
  SetupDialogs() { printer_.SetTarget({PrintTarget::Kind::Pdf, {}}); }
  static QComboBox& Targets(const PrinterSetupDialog& dialog) {
    return *dialog.findChild<QComboBox*>();
  }
  static QRadioButton& Way(const PrinterSetupDialog& dialog, const QString& text) {
    for (QRadioButton* button : dialog.findChildren<QRadioButton*>()) {
      if (button->text() == text) return *button;
    }
    throw std::logic_error("there is no such way");
  }
};

TEST_F(SetupDialogs, OfferPdfAndPreviewWithThePresentOnes) {
  printer_.SetTarget({PrintTarget::Kind::Preview, {}});
  OnceUp<PrinterSetupDialog>([](PrinterSetupDialog& dialog) {
    EXPECT_GE(Targets(dialog).findText("PDF file"), 0);
    EXPECT_EQ(Targets(dialog).currentText(), QString("Preview on the screen"));
    EXPECT_TRUE(Way(dialog, "&Landscape").isChecked());
    EXPECT_FALSE(Way(dialog, "&Portrait").isChecked());
    Press(dialog, QDialogButtonBox::Ok);
  });
  EXPECT_EQ(dialogs_.PrinterSetup(Orientation::Landscape), Orientation::Landscape);
  EXPECT_EQ(printer_.Target().kind, PrintTarget::Kind::Preview);
  EXPECT_EQ(refreshed_, 1);
}

TEST_F(SetupDialogs, AnswerTheWayThatWasChosenAndKeepTheTarget) {
  OnceUp<PrinterSetupDialog>([](PrinterSetupDialog& dialog) {
    Targets(dialog).setCurrentText("Preview on the screen");
    Way(dialog, "&Landscape").click();
    Press(dialog, QDialogButtonBox::Ok);
  });
  EXPECT_EQ(dialogs_.PrinterSetup(Orientation::Portrait), Orientation::Landscape);
  EXPECT_EQ(printer_.Target().kind, PrintTarget::Kind::Preview);
  EXPECT_EQ(printer_.DeviceName(), "Preview");
}

TEST_F(SetupDialogs, ChangeNothingWhenCancelled) {
  OnceUp<PrinterSetupDialog>([](PrinterSetupDialog& dialog) {
    Targets(dialog).setCurrentText("Preview on the screen");
    Way(dialog, "&Landscape").click();
    Press(dialog, QDialogButtonBox::Cancel);
  });
  EXPECT_EQ(dialogs_.PrinterSetup(Orientation::Portrait), std::nullopt);
  EXPECT_EQ(printer_.Target().kind, PrintTarget::Kind::Pdf);
}

TEST_F(SetupDialogs, ShowAPrinterThatHasGoneAsTheFirstThatThereIs) {
  const PrinterSetupDialog dialog({PrintTarget::Kind::Printer, "gone"}, Orientation::Portrait,
                                  nullptr);
  EXPECT_EQ(Targets(dialog).currentIndex(), 0);
}

}  // namespace
}  // namespace marlowbeck

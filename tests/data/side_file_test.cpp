#include "data/side_file.h"

#include <gtest/gtest.h>

#include "tests/data/expect_error.h"

namespace marlowbeck {
namespace {

TEST(SideFileWriter, WritesTheQuotedFormALineARecord) {
  SideFileWriter writer;
  writer.Text("Archer,  Jo").Number(47.5).Day(Date{38077}).Truth(true).EndLine();
  writer.Truth(false).Text("").EndLine();
  EXPECT_EQ(writer.Content(), "\"Archer,  Jo\",47.5,#2004-03-31#,#TRUE#\r\n#FALSE#,\"\"\r\n");
}

TEST(SideFileWriter, WritesThePlainFormALineAnItem) {
  SideFileWriter writer;
  writer.PlainLine("Triples").PlainLine("a, b");
  EXPECT_EQ(writer.Content(), "Triples\r\na, b\r\n");
}

TEST(SideFileReader, ReadsBackTheQuotedForm) {
  SideFileReader reader("\"Archer,  Jo\",47.5,#2004-03-31#,#TRUE#\r\n#FALSE#,\"\"\r\n");
  EXPECT_EQ(reader.Text(), "Archer,  Jo");
  EXPECT_EQ(reader.Number(), 47.5);
  EXPECT_EQ(reader.Day().days, 38077);
  EXPECT_TRUE(reader.Truth());
  EXPECT_FALSE(reader.Truth());
  EXPECT_FALSE(reader.AtEnd());
  EXPECT_EQ(reader.Text(), "");
  EXPECT_TRUE(reader.AtEnd());
}

TEST(SideFileReader, TakesEveryLineEnd) {
  for (const char* content : {"a\r\nb\r\n", "a\nb\n", "a\rb\r", "a\r\nb", "a\nb"}) {
    SideFileReader reader(content);
    EXPECT_EQ(reader.Text(), "a");
    EXPECT_EQ(reader.Text(), "b");
    EXPECT_TRUE(reader.AtEnd()) << content;
  }
}

TEST(SideFileReader, APlainItemWithACommaReadsBackAsTwo) {
  SideFileReader reader("Singles, best\r\nDoubles\r\n");
  EXPECT_EQ(reader.Text(), "Singles");
  EXPECT_EQ(reader.Text(), "best");
  EXPECT_EQ(reader.Text(), "Doubles");
}

TEST(SideFileReader, PassesOverBlanksRoundAnItem) {
  SideFileReader reader("  a b  , \" c \" ,\t7 \r\n");
  EXPECT_EQ(reader.Text(), "a b");
  EXPECT_EQ(reader.Text(), " c ");
  EXPECT_EQ(reader.Number(), 7);
}

TEST(SideFileReader, EmptyItemsAreItems) {
  SideFileReader reader("a,,b\r\n\r\nc");
  for (const char* item : {"a", "", "b", "", "c"}) EXPECT_EQ(reader.Text(), item);
  EXPECT_ERROR(62, (void)reader.Text());
}

TEST(SideFileReader, ReadingPastTheEndRaisesInputPastEnd) {
  SideFileReader empty("");
  EXPECT_TRUE(empty.AtEnd());
  EXPECT_ERROR(62, (void)empty.Text());
  EXPECT_ERROR(62, (void)empty.Number());
  EXPECT_ERROR(62, (void)empty.Day());
  EXPECT_ERROR(62, (void)empty.Truth());
}

TEST(SideFileReader, AnItemOfAnotherTypeRaisesTypeMismatch) {
  EXPECT_ERROR(13, (void)SideFileReader("Rovers").Number());
  EXPECT_ERROR(13, (void)SideFileReader("\"2004-03-31\"").Day());
  EXPECT_ERROR(13, (void)SideFileReader("#2004-02-30#").Day());
  EXPECT_ERROR(13, (void)SideFileReader("#").Day());
  EXPECT_ERROR(13, (void)SideFileReader("##").Day());
  EXPECT_ERROR(13, (void)SideFileReader("TRUE").Truth());
  EXPECT_ERROR(13, (void)SideFileReader("#2004-03-31#").Truth());
}

TEST(SideFileReader, ATextThatIsCutOffEndsWithTheFile) {
  EXPECT_EQ(SideFileReader("\"C:\\Data\\Win").Text(), "C:\\Data\\Win");
  EXPECT_EQ(SideFileReader("\"").Text(), "");
}

TEST(SideFile, NamesWithCommasAndQuotesComeBackAsTheyWere) {
  for (const char* name : {"O'Brien, Pat", "Jo \"Ace\" Archer", "\"Ace\"", "\"", "a\"b", "\"\"",
                           " leading", "trailing ", "#1", "semi;colon"}) {
    SideFileWriter writer;
    writer.Text(name).Text("next").Number(5).EndLine().Text("last").EndLine();
    SideFileReader reader(writer.Content());
    EXPECT_EQ(reader.Text(), name);
    EXPECT_EQ(reader.Text(), "next");
    EXPECT_EQ(reader.Number(), 5);
    EXPECT_EQ(reader.Text(), "last");
    EXPECT_TRUE(reader.AtEnd());
  }
}

TEST(SideFile, IsAtFaultWhereItIsMissingCutShortOrOfAnotherTypeAlone) {
  for (const int number : {53, 62, 13}) {
    EXPECT_TRUE(SideFileIsAtFault(RunTimeError(number))) << number;
  }
  for (const int number : {52, 57, 61, 70, 71, 75, 76}) {
    EXPECT_FALSE(SideFileIsAtFault(RunTimeError(number))) << number;
  }
}

TEST(SideFile, AnyByteButALineEndOrAQuoteComesBack) {
  std::string bytes;
  for (int byte = 1; byte < 256; ++byte) {
    if (byte != '"' && byte != '\r' && byte != '\n') bytes += static_cast<char>(byte);
  }
  SideFileWriter writer;
  writer.Text(bytes).EndLine();
  EXPECT_EQ(SideFileReader(writer.Content()).Text(), bytes);
}

}  // namespace
}  // namespace marlowbeck

// The list file and the work file as bytes.

#include "knockout/list_file.h"

#include <algorithm>
#include <string>

#include <gtest/gtest.h>

namespace marlowbeck {
namespace {

std::string Written(const KnockOutList& list) {
  SideFileWriter writer;
  WriteList(writer, list);
  return writer.Content();
}

ListReading Read(const std::string& content) { return ReadList(content); }

std::string Repeated(const std::string& line, int times) {
  std::string lines;
  for (int i = 0; i < times; ++i) lines += line;
  return lines;
}

/// The first line of a text, and those that follow so far.
std::string FirstLines(const std::string& content, int count) {
  std::size_t end = 0;
  for (int line = 0; line < count; ++line) end = content.find("\r\n", end) + 2;
  return content.substr(0, end);
}

KnockOutList Two() {
  KnockOutList list;
  list.places[0] = {"Archer, Jo", "A Grade"};
  list.places[1] = {"O\"Neil\", \"Ace\"", "B, \"x\""};
  list.date = *DateFromIso("2004-03-31");
  list.grade = "All Association Grades";
  return list;
}

KnockOutList Full() {
  KnockOutList list;
  for (std::size_t i = 0; i < 64; ++i) list.places[i] = {"P" + std::to_string(i), "G"};
  list.date = *DateFromIso("1999-12-31");
  list.grade = "G";
  return list;
}

TEST(ListFile, HoldsNamesThenGradesThenDateThenGrade) {
  EXPECT_EQ(Written(Two()), "\"Archer, Jo\"\r\n\"O\"Neil\", \"Ace\"\"\r\n" +
                                Repeated("\"\"\r\n", 62) + "\"A Grade\"\r\n\"B, \"x\"\"\r\n" +
                                Repeated("\"\"\r\n", 62) +
                                "#2004-03-31#\r\n\"All Association Grades\"\r\n");
}

TEST(ListFile, HasAHundredAndThirtyLinesAlways) {
  for (const KnockOutList& list : {KnockOutList{{}, Date{38077}, ""}, Two(), Full()}) {
    const std::string content = Written(list);
    EXPECT_EQ(std::count(content.begin(), content.end(), '\n'), 130);
    EXPECT_TRUE(content.ends_with("\r\n"));
  }
}

TEST(ListFile, ReadsWhatWasWritten) {
  for (const KnockOutList& list : {Two(), Full()}) {
    const ListReading reading = Read(Written(list));
    EXPECT_TRUE(reading.whole);
    EXPECT_EQ(reading.list.places, list.places);
    EXPECT_EQ(reading.list.date, list.date);
    EXPECT_EQ(reading.list.grade, list.grade);
    EXPECT_EQ(reading.last_item, list.grade);
  }
}

TEST(ListFile, ReadsLinesWithoutACarriageReturnAndTheLastWithoutAnEnd) {
  std::string content = Written(Two());
  std::erase(content, '\r');
  content.pop_back();
  EXPECT_TRUE(Read(content).whole);
  EXPECT_EQ(Read(content).list.places, Two().places);
}

TEST(ListFile, CutAfterAnyLineItIsNotWhole) {
  const std::string content = Written(Full());
  for (int lines = 0; lines < 130; ++lines) {
    const ListReading reading = Read(FirstLines(content, lines));
    EXPECT_FALSE(reading.whole) << lines;
    for (int place = 0; place < 64; ++place) {
      const Entrant& entrant = reading.list.places[static_cast<std::size_t>(place)];
      EXPECT_EQ(entrant.name.empty(), place >= lines) << lines;
      EXPECT_EQ(entrant.grade.empty(), 64 + place >= lines) << lines;
    }
  }
  EXPECT_TRUE(Read(content).whole);
}

TEST(ListFile, CutAtAnyByteItIsNotWhole) {
  const std::string content = Written(Two());
  const std::size_t all_but_its_line_end = content.size() - 2;
  for (std::size_t bytes = 0; bytes <= content.size(); ++bytes) {
    EXPECT_EQ(Read(content.substr(0, bytes)).whole, bytes >= all_but_its_line_end) << bytes;
  }
}

TEST(ListFile, AnEmptyGradeIsOneWhereItsQuotesAreThere) {
  KnockOutList list = Two();
  list.grade.clear();
  EXPECT_TRUE(Read(Written(list)).whole);
  std::string content = Written(list);
  content.resize(content.size() - 3);
  EXPECT_FALSE(Read(content).whole) << "a quote alone";
}

TEST(ListFile, ItemsWithoutQuotesAreReadAsWell) {
  std::string content = Written(Full());
  std::erase(content, '"');
  EXPECT_TRUE(Read(content).whole);
  EXPECT_EQ(Read(content).list.places, Full().places);
}

TEST(ListFile, ALineMoreMakesItNotWhole) {
  for (const char* more : {"\"x\"\r\n", "\r\n", "1\r\n", "\"\"\r\n"}) {
    EXPECT_FALSE(Read(Written(Full()) + more).whole) << more;
  }
  const ListReading long_file = Read(Repeated("\"Somebody, Else\"\r\n", 1000));
  EXPECT_FALSE(long_file.whole);
  EXPECT_EQ(long_file.last_item, "Somebody, Else");
}

TEST(ListFile, ATextWhereTheDateStandsMakesItNotWhole) {
  for (const char* other : {"\"Wednesday\"", "2004-03-31", "#31/03/2004#", "#2004-02-30#", "",
                            "#TRUE#", "##", "#", "38077"}) {
    std::string content = Written(Two());
    const auto place = content.find("#2004-03-31#");
    content.replace(place, 12, other);
    const ListReading reading = Read(content);
    EXPECT_FALSE(reading.whole) << other;
    EXPECT_EQ(reading.list.places, Two().places) << "filled as far as it goes";
  }
}

TEST(ListFile, AForeignFileIsNotWhole) {
  for (const std::string& foreign : {std::string(), std::string("\r\n"), std::string(5000, '\0'),
                                     std::string(5000, '"'), std::string("PK\x03\x04\xFF\xFE"),
                                     std::string(300, ','), Repeated("\"a\",\"b\"\r\n", 65)}) {
    EXPECT_FALSE(Read(foreign).whole) << foreign.substr(0, 10);
  }
}

TEST(WorkFile, HasAPlaceToALineAndTheGradeInTheLast) {
  SideFileWriter writer;
  WriteWorkFile(writer, {Two().places, "B Grade"});
  EXPECT_EQ(writer.Content(),
            "\"Archer, Jo\",\"A Grade\"\r\n\"O\"Neil\", \"Ace\"\",\"B, \"x\"\"\r\n" +
                Repeated("\"\",\"\"\r\n", 62) + "\"B Grade\"\r\n");
  SideFileReader reader(writer.Content());
  const WorkingList read = ReadWorkFile(reader);
  EXPECT_EQ(read.places, Two().places);
  EXPECT_EQ(read.grade, "B Grade");
  EXPECT_TRUE(reader.AtEnd());
}

TEST(WorkFile, ANameMayHoldWhatPartsTwoItems) {
  Places places;
  places[3] = {"A\",\"B, C", "D"};
  SideFileWriter writer;
  WriteWorkFile(writer, {places, ""});
  SideFileReader reader(writer.Content());
  EXPECT_EQ(ReadWorkFile(reader).places, places);
}

TEST(WorkFile, OneThatIsCutShortOrGarbledIsAnError) {
  SideFileReader empty("");
  EXPECT_THROW((void)ReadWorkFile(empty), RunTimeError);
  SideFileReader no_second_item(Repeated("\"a\"\r\n", 65));
  EXPECT_THROW((void)ReadWorkFile(no_second_item), RunTimeError);
}

}  // namespace
}  // namespace marlowbeck

#include "session/error_table.h"

#include <map>
#include <string>

#include <gtest/gtest.h>

namespace marlowbeck {
namespace {

const std::map<int, std::string> kWords = {
    {2, "Syntax error"},
    {3, "RETURN without GOSUB"},
    {4, "Out of DATA"},
    {5, "Invalid Procedure call"},
    {6, "Overflow"},
    {7, "Out of memory"},
    {9, "Subscript out of range"},
    {10, "The array is fixed or temporarily locked"},
    {11, "Division by zero"},
    {13, "Type mismatch"},
    {14, "Out of string space"},
    {16, "Expression too complex"},
    {17, "Can't perform requested operation"},
    {18, "User interuprt occured"},
    {20, "RESUME without error"},
    {24, "Device timeout"},
    {25, "Device fault"},
    {27, "Printer off or out of paper"},
    {28, "out of stack space"},
    {35, "Sub, function or property not defined"},
    {47, "Too many DLL application clients"},
    {48, "Error in loading DLL"},
    {49, "Bad DLL calling convention"},
    {50, "FIELD overflow or out of data"},
    {51, "Internal error"},
    {52, "Bad file name or number"},
    {53, "File not found or Read Only"},
    {54, "Bad file mode"},
    {55, "File already open"},
    {57, "Device i/o error"},
    {58, "File already exists"},
    {59, "Bad record length"},
    {61, "Disk full"},
    {62, "Input past end of file"},
    {63, "Bad record number in file"},
    {67, "Too many files"},
    {68, "Device unavailable"},
    {69, "Communication buffer overflow"},
    {70, "Disk is Write Protected. Access denied."},
    {71, "Disk not ready - check drive"},
    {72, "Disk media error"},
    {73, "Feature not available"},
    {74, "Can't rename with different drive"},
    {75, "Path/file access error"},
    {76, "Path not found"},
    {91, "Object variable or With block variable not set"},
    {92, "For loop not initialized"},
    {93, "Invalid pattern string"},
    {94, "Invalid use of null"},
    {424, "Object required"},
    {444, "Method not applicable in this context"},
    {452, "Invalid ordinal"},
    {453, "Special DLL function not found"},
};

TEST(ErrorText, HasTheWordsOfEveryNumber) {
  for (const auto& [number, words] : kWords) EXPECT_EQ(ErrorText(number), words) << number;
}

TEST(ErrorText, HasWordsOfItsOwnForEveryOtherNumber) {
  for (int number = -1; number <= 1000; ++number) {
    if (kWords.contains(number)) continue;
    EXPECT_EQ(ErrorText(number), "An Unrecognised error has Occured!") << number;
  }
  EXPECT_EQ(ErrorText(32767), "An Unrecognised error has Occured!");
}

}  // namespace
}  // namespace marlowbeck

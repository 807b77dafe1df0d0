#pragma once

#include <stdexcept>
#include <string>

namespace marlowbeck {

/// The run-time error numbers that the program itself raises. The whole list, with the words
/// shown for each, is the error table of session/error_table.h.
enum class ErrorNumber : int {
  InvalidProcedureCall = 5,
  Overflow = 6,
  OutOfMemory = 7,
  SubscriptOutOfRange = 9,
  DivisionByZero = 11,
  TypeMismatch = 13,
  PrinterOff = 27,
  InternalError = 51,
  BadFileName = 52,
  FileNotFound = 53,
  BadFileMode = 54,
  FileAlreadyOpen = 55,
  DeviceIoError = 57,
  FileAlreadyExists = 58,
  BadRecordLength = 59,
  DiskFull = 61,
  InputPastEnd = 62,
  BadRecordNumber = 63,
  TooManyFiles = 67,
  DeviceUnavailable = 68,
  PermissionDenied = 70,
  DiskNotReady = 71,
  RenameAcrossDrives = 74,
  PathFileAccess = 75,
  PathNotFound = 76,
};

/// A failure with a number of the error table. Files, conversions, table bounds and the printer
/// throw it; the dispatcher catches it and shows the error box.
class RunTimeError : public std::runtime_error {
 public:
  explicit RunTimeError(ErrorNumber number) : RunTimeError(static_cast<int>(number)) {}
  explicit RunTimeError(int number)
      : std::runtime_error("run-time error " + std::to_string(number)), number_(number) {}

  [[nodiscard]] int Number() const { return number_; }

 private:
  int number_;
};

}  // namespace marlowbeck

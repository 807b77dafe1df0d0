#include "data/channels.h"

#include <utility>

#include "data/runtime_error.h"

namespace marlowbeck {
namespace {

Bytes BytesOf(const std::string& text) { return std::as_bytes(std::span(text)); }

std::string TextOf(File& file) {
  std::string text(static_cast<std::size_t>(file.Length()), '\0');
  text.resize(file.ReadAt(0, std::as_writable_bytes(std::span(text))));
  return text;
}

}  // namespace

void Channels::OpenRandom(Channel channel, const std::string& path, std::size_t record_length) {
  Close(channel);
  Open open;
  open.file = files_.Open(path, OpenMode::ReadWrite);
  open.record_length = record_length;
  open.path = path;
  Slot(channel) = std::move(open);
}

void Channels::OpenInput(Channel channel, const std::string& path) {
  Close(channel);
  Open open;
  open.file = files_.Open(path, OpenMode::Read);
  open.reader = std::make_unique<SideFileReader>(TextOf(*open.file));
  open.path = path;
  Slot(channel) = std::move(open);
}

void Channels::OpenOutput(Channel channel, const std::string& path, Keeping keeping) {
  Close(channel);
  Open open;
  open.writer = std::make_unique<SideFileWriter>();
  open.path = path;
  open.keeping = keeping;
  Slot(channel) = std::move(open);
}

Channels::Open& Channels::Random(Channel channel) {
  Open& open = Slot(channel);
  if (!open.file || open.record_length == 0) throw RunTimeError(ErrorNumber::BadFileName);
  return open;
}

std::uint64_t Channels::Position(const Open& open, int number) {
  if (number < 1) throw RunTimeError(ErrorNumber::BadRecordNumber);
  return static_cast<std::uint64_t>(number - 1) * open.record_length;
}

Integer Channels::RecordCount(Channel channel) {
  Open& open = Random(channel);
  const std::uint64_t whole_records = open.file->Length() / open.record_length;
  return Integer::Narrow(static_cast<double>(whole_records));
}

void Channels::ReadRun(Open& open, int first, std::span<std::byte> into) {
  if (open.file->ReadAt(Position(open, first), into) < into.size()) {
    throw RunTimeError(ErrorNumber::InputPastEnd);
  }
}

void Channels::Get(Channel channel, int number, std::span<std::byte> into) {
  Open& open = Random(channel);
  if (into.size() != open.record_length) throw RunTimeError(ErrorNumber::BadRecordLength);
  ReadRun(open, number, into);
}

void Channels::Put(Channel channel, int number, std::span<const std::byte> record) {
  Open& open = Random(channel);
  if (record.size() != open.record_length) throw RunTimeError(ErrorNumber::BadRecordLength);
  const std::uint64_t position = Position(open, number);
  std::vector<std::byte> before(record.size());
  before.resize(position < open.file->Length() ? open.file->ReadAt(position, before) : 0);
  open.written = true;
  try {
    open.file->WriteAt(position, record);
  } catch (const RunTimeError&) {
    try {
      if (!before.empty()) open.file->WriteAt(position, before);
    } catch (const RunTimeError&) {
      // The first failure is the one to tell.
    }
    throw;
  }
}

void Channels::PutRun(Channel channel, int first, std::span<const std::byte> records) {
  Open& open = Random(channel);
  if (records.size() % open.record_length != 0) throw RunTimeError(ErrorNumber::BadRecordLength);
  open.written = true;
  open.file->WriteAt(Position(open, first), records);
}

SideFileReader& Channels::Reader(Channel channel) {
  Open& open = Slot(channel);
  if (!open.reader) throw RunTimeError(ErrorNumber::BadFileName);
  return *open.reader;
}

SideFileWriter& Channels::Writer(Channel channel) {
  Open& open = Slot(channel);
  if (!open.writer) throw RunTimeError(ErrorNumber::BadFileName);
  return *open.writer;
}

void Channels::Close(Channel channel) {
  Open open = std::exchange(Slot(channel), {});
  if (open.writer) return WriteOut(open);
  if (!open.file) return;
  if (open.written) open.file->Sync();
  open.file->Close();
}

void Channels::WriteOut(const Open& open) {
  const std::string& content = open.writer->Content();
  if (open.keeping == Keeping::Lasting) return ReplaceWhole(open.path, content);
  const auto file = files_.Open(open.path, OpenMode::Truncate);
  file->WriteAt(0, BytesOf(content));
  file->Close();
}

std::string Channels::ReadWhole(const std::string& path) {
  const auto file = files_.Open(path, OpenMode::Read);
  std::string content = TextOf(*file);
  file->Close();
  return content;
}

void Channels::ReplaceWhole(const std::string& path, const std::string& content) {
  const std::string work_file = path + ".new";
  try {
    const auto file = files_.Open(work_file, OpenMode::Truncate);
    file->WriteAt(0, BytesOf(content));
    file->Sync();
    file->Close();
    files_.Replace(work_file, path);
  } catch (const RunTimeError&) {
    DeleteQuietly(work_file);
    throw;
  }
}

void Channels::DeleteQuietly(const std::string& path) {
  try {
    files_.Delete(path);
  } catch (const RunTimeError&) {
    // It may never have been made, and what failed before is the thing to tell.
  }
}

void Channels::CloseAll() {
  for (int number = 1; number <= static_cast<int>(slots_.size()); ++number) {
    Close(static_cast<Channel>(number));
  }
}

void Channels::AbandonAll() { slots_ = {}; }

}  // namespace marlowbeck

#pragma once

#include <functional>
#include <span>
#include <string>

#include "data/channels.h"

namespace marlowbeck {

// Rewriting of the file of records that is open on a channel, in one step: a failure, or a power
// cut, leaves the old file or the new one. All channels are closed by it.

/// Changes a record where it has to be. Answers whether it did.
using Change = std::function<bool(std::span<std::byte> record)>;

/// Lets every record be changed. Bytes behind the last whole record stay as they are, and so does a
/// file in which nothing is changed.
void ChangeRecords(Channels& channels, Channel channel, const Change& change);

/// Whether a record is to go.
using Doomed = std::function<bool(Bytes record, int number)>;

/// Copies all records but the doomed ones to a work file, in their order and numbered from 1: no
/// file has holes or marks. Bytes behind the last whole record are no record. The copy is on the
/// disk when this returns; one that could not be finished is deleted.
///
/// KEPT: a work file that is there already is written over as it is, so that records of it beyond
/// the new ones end up in the file whose place it takes; a repair would empty it first.
void CopyRecordsWithout(Channels& channels, Channel channel, const Doomed& doomed,
                        const std::string& work_file);

/// Leaves the doomed records out: a copy without them, `TEMP.RES` beside the file, takes its place.
/// One that is finished but cannot take it is left behind.
void RemoveRecords(Channels& channels, Channel channel, const Doomed& doomed);

}  // namespace marlowbeck

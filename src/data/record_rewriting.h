#pragma once

#include <functional>
#include <span>

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

/// Leaves the doomed records out: no file has holes or marks. The others are copied in their order
/// to `TEMP.RES` beside the file, which takes its place. Bytes behind the last whole record go. A
/// copy that was finished but could not take the file's place is left behind.
///
/// KEPT: a `TEMP.RES` that is there already is written over as it is, so that records of it beyond
/// the new ones end up in the file; a repair would empty it first.
void RemoveRecords(Channels& channels, Channel channel, const Doomed& doomed);

}  // namespace marlowbeck

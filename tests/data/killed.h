#pragma once

namespace marlowbeck {

/// Thrown where a fault plan kills: stands for the end of the process.
struct Killed {};

}  // namespace marlowbeck

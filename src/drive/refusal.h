#pragma once

#include <stdexcept>

namespace marlowbeck {

/// A command that cannot be carried out. Nothing has changed; the words, of code page 1252, say
/// what stands in its way.
class Refusal : public std::runtime_error {
 public:
  using std::runtime_error::runtime_error;
};

}  // namespace marlowbeck

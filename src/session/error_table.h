#pragma once

#include <string_view>

namespace marlowbeck {

/// The words of the error box for a run-time error number, spelling as it has always been; an
/// unknown number has words of its own.
[[nodiscard]] std::string_view ErrorText(int number);

}  // namespace marlowbeck

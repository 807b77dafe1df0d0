#include "fuzz/targets.h"

extern "C" int LLVMFuzzerTestOneInput(const unsigned char* data, std::size_t size) {
  marlowbeck::fuzz::KnockOut(std::as_bytes(std::span(data, size)));
  return 0;
}

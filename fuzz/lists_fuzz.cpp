#include "fuzz/targets.h"

extern "C" int LLVMFuzzerTestOneInput(const unsigned char* data, std::size_t size) {
  marlowbeck::fuzz::Lists(std::as_bytes(std::span(data, size)));
  return 0;
}

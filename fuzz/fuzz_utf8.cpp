// Decodes arbitrary bytes and checks that encoding gives the same bytes back.
#include <string_view>

#include "fuzz/FuzzSupport.h"
#include "robotconfig/host/CString.h"

extern "C" int LLVMFuzzerTestOneInput(const uint8_t *data, size_t size) {
  const std::string_view bytes(reinterpret_cast<const char *>(data), size);
  fuzzCheck(CString::fromUtf8(bytes).toUtf8() == bytes, "UTF-8 round trip keeps every byte");
  return 0;
}

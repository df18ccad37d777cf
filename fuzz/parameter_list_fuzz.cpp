// Binds arbitrary parameter lists, and checks that escaping any text and binding it back
// gives the text unchanged.
#include "runtime/parameters.h"

#include <cstddef>
#include <cstdint>
#include <cstdlib>
#include <string>

using namespace morvex::runtime;

extern "C" int LLVMFuzzerTestOneInput(const std::uint8_t *data, std::size_t size) {
  const std::string text(reinterpret_cast<const char *>(data), size);
  const std::string list = text.c_str(); // a parameter list ends at its first zero

  VariableList bound;
  const std::int32_t count = bindParameters(list.c_str(), bound);
  if (count != bound.size()) {
    std::abort();
  }

  // One item made of the escaped text binds back to the text itself.
  const std::string escaped = escapeText(list.c_str());
  VariableList single;
  if (!list.empty()) {
    if (bindParameters(escaped.c_str(), single) != 1 ||
        single.find("p1")->value.stringValue != list) {
      std::abort();
    }
  }
  std::string unescaped = escaped;
  unescapeText(unescaped);
  if (unescaped != list) {
    std::abort();
  }
  return 0;
}

// The export list: the library's dynamic symbol table holds the entry points and nothing
// else. (The ordinals morvex.def gives them are checked on the built Windows DLL.)
#include "tests/host/export_table.h"

#include <gtest/gtest.h>

#include <cstdio>
#include <memory>
#include <set>
#include <string>

namespace morvex::tests {
namespace {

// The names the shared library defines in its dynamic symbol table.
std::set<std::string> definedDynamicSymbols(const std::string &library) {
  const std::string command =
      std::string(MORVEX_NM) + " -D --defined-only --format=posix '" + library + "'";
  std::unique_ptr<FILE, int (*)(FILE *)> pipe(popen(command.c_str(), "r"), pclose);
  std::set<std::string> names;
  char line[512];
  while (pipe && std::fgets(line, sizeof line, pipe.get()) != nullptr) {
    const std::string text(line);
    names.insert(text.substr(0, text.find(' ')));
  }
  return names;
}

TEST(Exports, TheLibraryExportsExactlyTheEntryPoints) {
  std::set<std::string> expected;
  for (const Export &e : kExports) {
    expected.emplace(e.name);
  }
  EXPECT_EQ(definedDynamicSymbols(MORVEX_LIBRARY_PATH), expected) << MORVEX_LIBRARY_PATH;
}

} // namespace
} // namespace morvex::tests

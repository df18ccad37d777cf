// The export list: the library's dynamic symbol table holds the entry points and nothing
// else, and the module-definition file gives each its ordinal.
#include "tests/host/export_table.h"

#include <gtest/gtest.h>

#include <cstdio>
#include <fstream>
#include <map>
#include <memory>
#include <regex>
#include <set>
#include <string>

namespace morvex::tests {
namespace {

std::set<std::string> expectedNames() {
  std::set<std::string> names;
  for (const Export &e : kExports) {
    names.emplace(e.name);
  }
  return names;
}

// The names the shared library defines in its dynamic symbol table.
std::set<std::string> definedDynamicSymbols(const std::string &library) {
  const std::string command =
      std::string(MORVEX_NM) + " -D --defined-only --format=posix '" + library + "'";
  std::unique_ptr<FILE, int (*)(FILE *)> pipe(popen(command.c_str(), "r"), pclose);
  std::set<std::string> names;
  if (!pipe) {
    return names;
  }
  char line[512];
  while (std::fgets(line, sizeof line, pipe.get()) != nullptr) {
    const std::string text(line);
    names.insert(text.substr(0, text.find(' ')));
  }
  return names;
}

TEST(Exports, TheLibraryExportsExactlyTheEntryPoints) {
  const std::set<std::string> names = definedDynamicSymbols(MORVEX_LIBRARY_PATH);
  ASSERT_FALSE(names.empty()) << "could not read " << MORVEX_LIBRARY_PATH;
  EXPECT_EQ(names, expectedNames());
}

TEST(Exports, TheModuleDefinitionGivesEachEntryPointItsOrdinal) {
  std::ifstream definition(std::string(MORVEX_SOURCE_DIR) + "/host/morvex.def");
  ASSERT_TRUE(definition);
  const std::regex entry(R"(^\s+([A-Za-z]\w*)\s+@(\d+)\s*$)");
  std::map<std::string, int> ordinals;
  std::string line;
  while (std::getline(definition, line)) {
    std::smatch match;
    if (std::regex_match(line, match, entry)) {
      EXPECT_TRUE(ordinals.emplace(match[1], std::stoi(match[2])).second) << match[1];
    }
  }
  std::map<std::string, int> expected;
  for (const Export &e : kExports) {
    expected.emplace(e.name, e.ordinal);
  }
  EXPECT_EQ(ordinals, expected);
}

} // namespace
} // namespace morvex::tests

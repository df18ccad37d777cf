// What `objdump -p` prints about a PE file, read back: its format, its export table and
// the DLLs it imports.
#ifndef MORVEX_TESTS_WINDOWS_OBJDUMP_REPORT_H
#define MORVEX_TESTS_WINDOWS_OBJDUMP_REPORT_H

#include <istream>
#include <map>
#include <set>
#include <string>
#include <vector>

namespace morvex::tests {

struct ObjdumpReport {
  std::string format;                       // "pei-i386" for a 32-bit PE file
  std::string exportedModule;               // the module name in the export directory
  std::map<int, std::string> exportNames;   // ordinal -> exported name
  std::set<int> exportedOrdinals;           // every ordinal with an address
  std::vector<std::string> importedModules; // in the order of the import directory
};

ObjdumpReport readObjdumpReport(std::istream &text);

} // namespace morvex::tests

#endif

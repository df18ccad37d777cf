// The shipping 32-bit DLL as objdump reads it: what it exports, under which ordinals, and
// what it needs from other DLLs.
#include "tests/host/export_table.h"
#include "tests/windows/objdump_report.h"
#include "tests/windows/test_files.h"

#include <gtest/gtest.h>

#include <algorithm>
#include <cctype>
#include <fstream>

namespace morvex::tests {
namespace {

class ShippingDll : public ::testing::Test {
protected:
  static void SetUpTestSuite() {
    std::ifstream text(fileFromEnvironment("MORVEX_SHIPPING_OBJDUMP"));
    if (text) {
      report = new ObjdumpReport(readObjdumpReport(text));
    }
  }
  static void TearDownTestSuite() {
    delete report;
    report = nullptr;
  }
  void SetUp() override { ASSERT_NE(report, nullptr) << "no objdump text of the shipping DLL"; }

  static ObjdumpReport *report;
};
ObjdumpReport *ShippingDll::report = nullptr;

TEST_F(ShippingDll, IsA32BitWindowsDllNamedMorvex) {
  EXPECT_EQ(report->format, "pei-i386");
  EXPECT_EQ(report->exportedModule, "morvex.dll");
}

TEST_F(ShippingDll, ExportsEveryEntryPointUndecoratedUnderItsOrdinal) {
  for (const Export &entry : kExports) {
    const auto found = report->exportNames.find(entry.ordinal);
    ASSERT_NE(found, report->exportNames.end()) << "nothing named at ordinal " << entry.ordinal;
    EXPECT_EQ(found->second, entry.name) << "at ordinal " << entry.ordinal;
  }
}

TEST_F(ShippingDll, ExportsNothingElse) {
  std::set<int> ordinals;
  for (const Export &entry : kExports) {
    ordinals.insert(entry.ordinal);
  }
  EXPECT_EQ(report->exportNames.size(), kExports.size());
  EXPECT_EQ(report->exportedOrdinals, ordinals);
}

TEST_F(ShippingDll, ImportsOnlyWindowsSystemDlls) {
  // The C and C++ runtimes are linked in; msvcrt.dll is the C library every Windows has.
  const std::set<std::string> system = {"kernel32.dll", "user32.dll", "msvcrt.dll"};
  std::set<std::string> imported;
  for (std::string module : report->importedModules) {
    std::transform(module.begin(), module.end(), module.begin(),
                   [](unsigned char c) { return static_cast<char>(std::tolower(c)); });
    EXPECT_TRUE(system.count(module)) << module << " is not a Windows system DLL";
    imported.insert(module);
  }
  EXPECT_TRUE(imported.count("user32.dll")); // the dialogs and menus
  EXPECT_TRUE(imported.count("kernel32.dll"));
}

} // namespace
} // namespace morvex::tests

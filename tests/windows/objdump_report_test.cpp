// Reading objdump's text: the checks of the shipping DLL stand on it.
#include "tests/windows/objdump_report.h"

#include <gtest/gtest.h>

#include <sstream>

namespace morvex::tests {
namespace {

// Cut down from `i686-w64-mingw32-objdump -p` of a DLL.
constexpr const char *kSample = R"(
sample.dll:     file format pei-i386

Characteristics 0x2106
	DLL

The Import Tables (interpreted .idata section contents)
 vma:            Hint    Time      Forward  DLL       First
                 Table   Stamp     Chain    Name      Thunk
 0003f000	0003f050 00000000 00000000 0003f9e4 0003f1d4

	DLL Name: KERNEL32.dll
	vma:  Hint/Ord Member-Name Bound-To
	3f358	   21  AddVectoredExceptionHandler

	DLL Name: libstdc++-6.dll
	vma:  Hint/Ord Member-Name Bound-To
	3f906	  650  _ZNSt8ios_base4InitC1Ev

The Export Tables (interpreted .edata section contents)

Name 				0003e098 sample.dll
Ordinal Base 			2

Export Address Table -- Ordinal Base 2
	[   0] +base[   2] 14b0 Export RVA
	[   5] +base[   7] 14c0 Export RVA
	[ 110] +base[ 112] 1530 Export RVA

[Ordinal/Name Pointer] Table
	[ 110] EditDebugItem
	[   0] GetInfos@4

The .rsrc Resource Directory section:
000  Type Table: Char: 0, Time: 00000000, Ver: 0/0, Num Names: 0, IDs: 6
040    Name Table: Char: 0, Time: 00000000, Ver: 0/0, Num Names: 0, IDs: 2
)";

TEST(ObjdumpReport, ReadsFormatExportsAndImports) {
  std::istringstream text(kSample);
  const ObjdumpReport report = readObjdumpReport(text);
  EXPECT_EQ(report.format, "pei-i386");
  EXPECT_EQ(report.exportedModule, "sample.dll");
  // Names count from the ordinal base; a decorated name stays decorated.
  EXPECT_EQ(report.exportNames,
            (std::map<int, std::string>{{2, "GetInfos@4"}, {112, "EditDebugItem"}}));
  // An address without a name is still an export.
  EXPECT_EQ(report.exportedOrdinals, (std::set<int>{2, 7, 112}));
  EXPECT_EQ(report.importedModules, (std::vector<std::string>{"KERNEL32.dll", "libstdc++-6.dll"}));
}

TEST(ObjdumpReport, AFileWithoutTablesGivesEmptyOnes) {
  std::istringstream text("x.exe:     file format pei-x86-64\n");
  const ObjdumpReport report = readObjdumpReport(text);
  EXPECT_EQ(report.format, "pei-x86-64");
  EXPECT_TRUE(report.exportNames.empty());
  EXPECT_TRUE(report.exportedOrdinals.empty());
  EXPECT_TRUE(report.importedModules.empty());
}

} // namespace
} // namespace morvex::tests

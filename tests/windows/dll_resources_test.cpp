// The resources built into the DLLs, read through Windows' own resource and version
// services: the shipping 32-bit DLL opened as a data file, and the 64-bit one.
#include "tests/windows/test_files.h"

#include <windows.h>

#include <gtest/gtest.h>

#include <cstdio>
#include <cstring>
#include <ostream>
#include <string>
#include <vector>

namespace morvex::tests {
namespace {

struct DllFile {
  const char *label;
  const char *variable; // the environment variable naming it
};

void PrintTo(const DllFile &file, std::ostream *out) {
  *out << file.label;
}

class DllResources : public ::testing::TestWithParam<DllFile> {
protected:
  void SetUp() override {
    path = fileFromEnvironment(GetParam().variable);
    ASSERT_FALSE(path.empty());
    module = LoadLibraryExA(path.c_str(), nullptr, LOAD_LIBRARY_AS_DATAFILE);
    ASSERT_NE(module, nullptr) << path << ": error " << GetLastError();
  }
  void TearDown() override {
    if (module != nullptr) {
      FreeLibrary(module);
    }
  }

  // The bytes of a resource; none when it is missing.
  std::vector<unsigned char> resource(LPCSTR type, int id) const {
    HRSRC found = FindResourceA(module, MAKEINTRESOURCEA(id), type);
    if (found == nullptr) {
      return {};
    }
    const auto *bytes =
        static_cast<const unsigned char *>(LockResource(LoadResource(module, found)));
    return std::vector<unsigned char>(bytes, bytes + SizeofResource(module, found));
  }

  // A value of the version resource's string table, in its first translation.
  std::string versionString(const std::vector<char> &info, const char *name) const {
    WORD *translation = nullptr;
    UINT length = 0;
    if (!VerQueryValueA(info.data(), "\\VarFileInfo\\Translation",
                        reinterpret_cast<void **>(&translation), &length) ||
        length < 2 * sizeof(WORD)) {
      return "<no translation>";
    }
    char key[64];
    std::snprintf(key, sizeof key, "\\StringFileInfo\\%04x%04x\\%s", translation[0], translation[1],
                  name);
    char *value = nullptr;
    if (!VerQueryValueA(info.data(), key, reinterpret_cast<void **>(&value), &length)) {
      return "<missing>";
    }
    return value;
  }

  std::string path;
  HMODULE module = nullptr;
};

TEST_P(DllResources, VersionIs1060AndReads106) {
  DWORD unused = 0;
  const DWORD size = GetFileVersionInfoSizeA(path.c_str(), &unused);
  ASSERT_GT(size, 0u) << "no version resource";
  std::vector<char> info(size);
  ASSERT_TRUE(GetFileVersionInfoA(path.c_str(), 0, size, info.data()));

  VS_FIXEDFILEINFO *fixed = nullptr;
  UINT length = 0;
  ASSERT_TRUE(VerQueryValueA(info.data(), "\\", reinterpret_cast<void **>(&fixed), &length));
  ASSERT_GE(length, sizeof(VS_FIXEDFILEINFO));
  EXPECT_EQ(fixed->dwSignature, 0xFEEF04BDu);
  EXPECT_EQ(fixed->dwFileVersionMS, 0x0001'0000u); // 1.0
  EXPECT_EQ(fixed->dwFileVersionLS, 0x0006'0000u); // .6.0
  EXPECT_EQ(versionString(info, "FileVersion"), "1.06");
  EXPECT_EQ(versionString(info, "FileDescription"), "Morvex Object");
  EXPECT_EQ(versionString(info, "SpecialBuild"), "00000001");
}

TEST_P(DllResources, DataResource200HoldsFourBytesOf0x00F7F7EB) {
  EXPECT_EQ(resource(RT_RCDATA, 200), (std::vector<unsigned char>{0xEB, 0xF7, 0xF7, 0x00}));
}

TEST_P(DllResources, TheTwoBitmapsAre32By32In16Colours) {
  for (const int id : {400, 401}) {
    const std::vector<unsigned char> bytes = resource(RT_BITMAP, id);
    ASSERT_GE(bytes.size(), sizeof(BITMAPINFOHEADER)) << "bitmap " << id;
    BITMAPINFOHEADER header;
    std::memcpy(&header, bytes.data(), sizeof header);
    EXPECT_EQ(header.biWidth, 32) << "bitmap " << id;
    EXPECT_EQ(header.biHeight, 32) << "bitmap " << id;
    EXPECT_EQ(header.biBitCount, 4) << "bitmap " << id;
    EXPECT_EQ(header.biCompression, static_cast<DWORD>(BI_RGB)) << "bitmap " << id;
    // The header, 16 palette entries and 32 rows of 16 bytes.
    EXPECT_GE(bytes.size(), header.biSize + 16 * sizeof(RGBQUAD) + 32 * 16) << "bitmap " << id;
  }
}

TEST_P(DllResources, ObjectNameAndDescriptionAreStringResources) {
  char text[256] = {};
  EXPECT_GT(LoadStringA(module, 128, text, sizeof text), 0);
  EXPECT_STREQ(text, "Morvex Object");
  EXPECT_GT(LoadStringA(module, 131, text, sizeof text), 0);
  EXPECT_STREQ(text, "Create your own objects within Zeltra.");
}

INSTANTIATE_TEST_SUITE_P(Dlls, DllResources,
                         ::testing::Values(DllFile{"Shipping32Bit", "MORVEX_SHIPPING_DLL"},
                                           DllFile{"Built64Bit", "MORVEX_DLL"}),
                         [](const auto &info) { return std::string(info.param.label); });

} // namespace
} // namespace morvex::tests

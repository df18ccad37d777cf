// The library as a host drives it after loading it: the information it gives, the routine
// tables, a run-time object's life, the compatibility test at the boundary, and the
// edit-time entry points. (The emulator's menus and sheets drive the other entry points.)
#include "host/contract.h"
#include "tests/host/loaded_library.h"

#include <windows.h>

#include <gtest/gtest.h>

#include <cstring>
#include <memory>
#include <string>
#include <vector>

namespace morvex::tests {
namespace {

using host::HostWord;

constexpr std::uint32_t kGoodHostWord = 0x0200'0000u | 228u;
constexpr std::uint32_t kOldHostWord = 0x0100'0000u | 228u;

std::uint32_t MORVEX_CALL goodHost() {
  return kGoodHostWord;
}
std::uint32_t MORVEX_CALL oldHost() {
  return kOldHostWord;
}

// What the host's EditorRequest service was last asked.
struct EditorRequestCall {
  int calls = 0;
  host::EditStructure *edit = nullptr;
  HostWord request = 0;
  void *propertyList = nullptr;
  HostWord a = 0;
  HostWord b = 0;
};
EditorRequestCall lastRequest;

HostWord MORVEX_CALL recordRequest(host::EditStructure *edit, HostWord request, void *list,
                                   HostWord a, HostWord b) {
  lastRequest = {lastRequest.calls + 1, edit, request, list, a, b};
  return 0;
}

class LoadedExtension : public ::testing::Test {
protected:
  static void SetUpTestSuite() { library = new LoadedLibrary(MORVEX_LIBRARY_PATH); }
  static void TearDownTestSuite() {
    delete library;
    library = nullptr;
  }
  void SetUp() override {
    ASSERT_TRUE(library->loaded()) << library->error();
    context.HostVersion = &goodHost;
    context.EditorRequest = &recordRequest;
  }

  template <class Function>
  Function entry(const char *name) {
    const auto function = library->entry<Function>(name);
    EXPECT_NE(function, nullptr) << name;
    return function;
  }

  static LoadedLibrary *library;
  host::EditorContext context{};
};
LoadedLibrary *LoadedExtension::library = nullptr;

TEST_F(LoadedExtension, InformationCodesAndHelpFile) {
  const auto getInfos = entry<host::GetInfosFn>("GetInfos");
  EXPECT_EQ(getInfos(0), 0x300);
  EXPECT_EQ(getInfos(2), 0x100);
  EXPECT_EQ(getInfos(6), 2);
  EXPECT_EQ(getInfos(7), 219);
  for (const HostWord other : {1, 3, 5, 8, -1}) {
    EXPECT_EQ(getInfos(other), 0) << other;
  }
  EXPECT_STREQ(entry<host::GetHelpFileNameFn>("GetHelpFileName")(), "Help\\Morvex.html");
}

TEST_F(LoadedExtension, ObjectInformationFillsTheFiveBuffers) {
  // Each buffer exactly as large as the host's, so the sanitizer sees any overrun.
  auto name = std::make_unique<char[]>(255);
  auto author = std::make_unique<char[]>(255);
  auto copyright = std::make_unique<char[]>(255);
  auto comment = std::make_unique<char[]>(1024);
  auto web = std::make_unique<char[]>(255);
  entry<host::GetObjInfosFn>("GetObjInfos")(&context, nullptr, name.get(), author.get(),
                                            copyright.get(), comment.get(), web.get());
  EXPECT_STREQ(name.get(), "Morvex Object");
  EXPECT_STREQ(comment.get(), "Create your own objects within Zeltra.");
  EXPECT_GT(std::strlen(author.get()), 0u);
  EXPECT_GT(std::strlen(copyright.get()), 0u);
  EXPECT_GT(std::strlen(web.get()), 0u);
}

TEST_F(LoadedExtension, RunObjectInformationRecord) {
  const auto getRunObjectInfos = entry<host::GetRunObjectInfosFn>("GetRunObjectInfos");
  host::RunObjectInfos infos;
  std::memset(&infos, 0xAB, sizeof infos);
  EXPECT_EQ(getRunObjectInfos(nullptr, &infos), 1);

  EXPECT_EQ(infos.conditionCount, 4);
  EXPECT_EQ(infos.actionCount, 28);
  EXPECT_EQ(infos.expressionCount, 25);
  EXPECT_EQ(infos.editStructureSize, 68);
  EXPECT_EQ(infos.options, 0u);
  EXPECT_EQ(infos.priority, 100);
  EXPECT_EQ(infos.reserved25, 0xAB); // not written
  EXPECT_EQ(infos.reserved26, 0);
  EXPECT_EQ(std::string(infos.identifier, 4), "3QNZ");
  EXPECT_EQ(infos.editStructureVersion, 2);

  // Each table: its routines, then a null entry.
  const auto checkTable = [](const auto *table, int count) {
    for (int code = 0; code < count; ++code) {
      EXPECT_NE(table[code], nullptr) << count << " " << code;
    }
    EXPECT_EQ(table[count], nullptr) << count;
  };
  checkTable(infos.conditions, 4);
  checkTable(infos.actions, 28);
  checkTable(infos.expressions, 25);

  EXPECT_EQ(getRunObjectInfos(nullptr, nullptr), 0);
}

// An edit structure as a game file stores it: 2 functions, 1 member, verification on.
std::vector<unsigned char> storedEditStructure() {
  std::vector<unsigned char> bytes(host::editStructureSize(2, 1), 0);
  auto *edit = reinterpret_cast<host::EditStructure *>(bytes.data());
  edit->size = static_cast<std::uint32_t>(bytes.size());
  edit->version = 2;
  edit->width = edit->height = 32;
  edit->verifyFunctionNames = 1;
  edit->functionCount = 2;
  edit->memberCount = 1;
  std::strcpy(reinterpret_cast<char *>(bytes.data()) + 40, "alpha");
  std::strcpy(reinterpret_cast<char *>(bytes.data()) + 66, "beta");
  std::strcpy(reinterpret_cast<char *>(bytes.data()) + 92, "hp");
  return bytes;
}

TEST_F(LoadedExtension, RunObjectLivesInTheHostsBlock) {
  const HostWord size =
      entry<host::GetRunObjectDataSizeFn>("GetRunObjectDataSize")(nullptr, nullptr);
  ASSERT_GE(size, static_cast<HostWord>(sizeof(host::ObjectHeader)));
  ASSERT_LE(size, 0xFFFF);

  // The host's block: exactly the size asked for, its header filled by the host.
  auto runHeader = std::make_unique<host::RunHeader>();
  const auto words =
      (static_cast<std::size_t>(size) + sizeof(std::max_align_t) - 1) / sizeof(std::max_align_t);
  auto block = std::make_unique<std::max_align_t[]>(words);
  auto *header = new (block.get()) host::ObjectHeader{};
  header->runHeader = runHeader.get();
  std::vector<unsigned char> edit = storedEditStructure();

  ASSERT_EQ(entry<host::CreateRunObjectFn>("CreateRunObject")(
                header, reinterpret_cast<host::EditStructure *>(edit.data()), 0),
            0);
  EXPECT_EQ(header->runHeader, runHeader.get()); // the host's header is kept

  EXPECT_EQ(entry<host::RunObjectQueryFn>("HandleRunObject")(header), 1);
  EXPECT_EQ(entry<host::RunObjectQueryFn>("DisplayRunObject")(header), 0);
  EXPECT_EQ(entry<host::RunObjectQueryFn>("PauseRunObject")(header), 0);
  EXPECT_EQ(entry<host::RunObjectQueryFn>("ContinueRunObject")(header), 0);
  const std::uint16_t *tree = entry<host::GetDebugTreeFn>("GetDebugTree")(header);
  ASSERT_NE(tree, nullptr);
  EXPECT_EQ(tree[0], 0xFFFF);

  EXPECT_EQ(entry<host::DestroyRunObjectFn>("DestroyRunObject")(header, 0), 0);
  EXPECT_NE(entry<host::CreateRunObjectFn>("CreateRunObject")(nullptr, nullptr, 0), 0);
}

// The exported menus are new menus the host destroys; a failing host gets none, and no
// display string (the texts themselves are checked by the emulator's menus test).
TEST_F(LoadedExtension, MenusAndDisplayStringsAnswerTheCompatibilityTest) {
  host::EditorContext old{};
  old.HostVersion = &oldHost;
  for (const char *name : {"GetConditionMenu", "GetActionMenu", "GetExpressionMenu"}) {
    const auto getMenu = entry<host::GetMenuFn>(name);
    auto menu = static_cast<HMENU>(getMenu(&context, 0, 0));
    EXPECT_GT(GetMenuItemCount(menu), 0) << name;
    EXPECT_TRUE(DestroyMenu(menu)) << name;
    EXPECT_EQ(getMenu(&old, 0, 0), nullptr) << name;
    EXPECT_EQ(getMenu(nullptr, 0, 0), nullptr) << name;
  }
  for (const char *name : {"GetConditionString", "GetActionString", "GetExpressionString"}) {
    char text[256] = "kept";
    entry<host::GetStringFn>(name)(&old, 0, text, sizeof text);
    EXPECT_STREQ(text, "kept") << name;
  }
}

TEST_F(LoadedExtension, PropertiesAreAnEmptyListHandedThroughEditorRequest) {
  const auto getProperties = entry<host::GetPropertiesFn>("GetProperties");
  std::vector<unsigned char> edit = storedEditStructure();
  auto *stored = reinterpret_cast<host::EditStructure *>(edit.data());
  lastRequest = {};
  EXPECT_EQ(getProperties(&context, stored, 0), 1);
  EXPECT_EQ(lastRequest.calls, 1);
  EXPECT_EQ(lastRequest.edit, stored);
  EXPECT_EQ(lastRequest.request, 1);
  ASSERT_NE(lastRequest.propertyList, nullptr);
  EXPECT_EQ(*static_cast<HostWord *>(lastRequest.propertyList), 0); // the end marker first
  EXPECT_EQ(lastRequest.a, 1);
  EXPECT_EQ(lastRequest.b, 1);

  host::EditorContext withoutService{};
  EXPECT_EQ(getProperties(&withoutService, stored, 0), 0);
  EXPECT_EQ(getProperties(nullptr, stored, 0), 0);
  EXPECT_EQ(lastRequest.calls, 1);
}

TEST_F(LoadedExtension, EditTimeObjectEntryPoints) {
  // A new object's block, as large as the host hands the setup dialog.
  std::vector<unsigned char> bytes(host::kMaxEditStructureSize, 0);
  auto *edit = reinterpret_cast<host::EditStructure *>(bytes.data());
  edit->size = 68;
  edit->version = 2;
  edit->width = 7;
  edit->functionCount = 3;

  // Nobody answers the setup dialog here: it is closed with OK as it opened.
  EXPECT_EQ(entry<host::CreateObjectFn>("CreateObject")(&context, 0, edit), 0);
  EXPECT_EQ(edit->width, 32);
  EXPECT_EQ(edit->height, 32);
  EXPECT_EQ(edit->functionCount, 0);
  EXPECT_EQ(entry<host::EditObjectFn>("EditObject")(&context, 0, 0, edit), 1);
  EXPECT_EQ(entry<host::CreateObjectFn>("CreateObject")(&context, 0, nullptr), -1);
  EXPECT_EQ(entry<host::EditObjectFn>("EditObject")(&context, 0, 0, nullptr), 0);

  host::Rect rect{10, 20, 0, 0};
  entry<host::GetObjectRectFn>("GetObjectRect")(&context, &rect, 0, edit);
  EXPECT_EQ(rect.right, 42);
  EXPECT_EQ(rect.bottom, 52);

  const auto update = entry<host::UpdateEditStructureFn>("UpdateEditStructure");
  EXPECT_EQ(update(&context, edit), nullptr); // already version 2
  std::vector<unsigned char> old = storedEditStructure();
  reinterpret_cast<host::EditStructure *>(old.data())->version = 1;
  auto *converted = static_cast<host::EditStructure *>(
      update(&context, reinterpret_cast<host::EditStructure *>(old.data())));
  ASSERT_NE(converted, nullptr);
  EXPECT_EQ(converted->version, 2u);
  EXPECT_EQ(converted->size, host::editStructureSize(2, 1));
  EXPECT_STREQ(converted->names + 26 * 2, "hp");
  GlobalFree(converted); // the host's now, from the global heap
}

} // namespace
} // namespace morvex::tests

// The extension as the host sees it: a library loaded by path, its entry points found by
// name, its run-time information record and routine tables, and the catalog of its
// conditions, actions and expressions read through its event-information entry points.
#ifndef MORVEX_EMULATOR_EXTENSION_H
#define MORVEX_EMULATOR_EXTENSION_H

#include "emulator/catalog.h"
#include "emulator/library.h"
#include "host/contract.h"

#include <memory>
#include <stdexcept>
#include <string>

namespace morvex::emulator {

// Why the extension could not be loaded or read.
class LoadError : public std::runtime_error {
public:
  using std::runtime_error::runtime_error;
};

// The entry points the emulator calls. Valid while the Extension that found them lives.
struct EntryPoints {
  host::GetRunObjectInfosFn getRunObjectInfos = nullptr;
  host::GetRunObjectDataSizeFn getRunObjectDataSize = nullptr;
  host::CreateRunObjectFn createRunObject = nullptr;
  host::DestroyRunObjectFn destroyRunObject = nullptr;
  host::GetMenuFn getMenu[3] = {};                 // by RoutineKind
  host::GetCodeFromMenuFn getCodeFromMenu[3] = {}; // by RoutineKind
  host::GetInfosRecordFn getInfos[3] = {};         // by RoutineKind
  host::GetStringFn getString[3] = {};             // by RoutineKind
  host::GetTitleFn getConditionTitle = nullptr;
  host::GetTitleFn getActionTitle = nullptr;
  host::GetExpressionTitleFn getExpressionTitle = nullptr;
  host::GetExpressionParamFn getExpressionParam = nullptr;
};

// The host's version word: a build and a version that the extension's compatibility
// test accepts.
inline constexpr std::uint32_t kHostVersion = (0x0200u << 16) | 300u;

class Extension {
public:
  // Loads the library at `path`, finds its entry points and reads its tables. Throws
  // LoadError.
  static std::unique_ptr<Extension> load(const std::string &path);

  const Catalog &catalog() const { return catalog_; }
  const EntryPoints &entries() const { return entries_; }
  const host::RunObjectInfos &runInfos() const { return runInfos_; }
  // The context passed to every edit-time entry point; lives as long as this Extension.
  host::EditorContext *editorContext() { return &context_; }

private:
  Extension() = default;
  void findEntryPoints();
  void readRunInfos();
  void readCatalog();
  RoutineInfo readRoutine(RoutineKind kind, int code);

  std::unique_ptr<Library> library_;
  EntryPoints entries_;
  host::RunObjectInfos runInfos_{};
  host::EditorContext context_{};
  Catalog catalog_;
};

// The extension's file: `option` when given, else the MORVEX_LIBRARY environment
// variable, else the library beside this program or in the build tree's host folder.
std::string locateExtension(const std::string &option);

} // namespace morvex::emulator

#endif

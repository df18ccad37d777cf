// Loading the extension and reading what it says about itself.
#include "emulator/extension.h"

#include <cstdlib>
#include <cstring>
#include <fstream>

namespace morvex::emulator {

namespace {

constexpr std::size_t kTextSize = 1024;     // buffers for display strings and prompts
constexpr std::uint16_t kMaxParameters = 9; // "%0" to "%8": more means a broken record

std::uint32_t MORVEX_CALL hostVersion() {
  return kHostVersion;
}

host::HostWord MORVEX_CALL editorRequest(host::EditStructure *, host::HostWord, void *,
                                         host::HostWord, host::HostWord) {
  return 0;
}

template <class Function>
void findEntry(const Library &library, const char *name, Function &slot) {
  void *address = library.find(name);
  if (address == nullptr) {
    throw LoadError(std::string("the extension does not export ") + name);
  }
  slot = reinterpret_cast<Function>(address);
}

// Field `index` of an event-information record; read bytewise, the record being a run
// of 16-bit fields with no alignment promised.
std::uint16_t field(const std::uint16_t *record, std::size_t index) {
  std::uint16_t value = 0;
  std::memcpy(&value, reinterpret_cast<const unsigned char *>(record) + 2 * index, sizeof value);
  return value;
}

std::string textOf(const char *buffer) {
  return std::string(buffer, strnlen(buffer, kTextSize));
}

bool fileExists(const std::string &path) {
  return std::ifstream(path).good();
}

} // namespace

std::unique_ptr<Extension> Extension::load(const std::string &path) {
  std::unique_ptr<Extension> extension(new Extension());
  std::string error;
  extension->library_ = Library::open(path, error);
  if (!extension->library_) {
    throw LoadError("cannot load the extension " + path + ": " + error);
  }
  extension->context_.HostVersion = hostVersion;
  extension->context_.EditorRequest = editorRequest;
  extension->findEntryPoints();
  extension->readRunInfos();
  extension->readCatalog();
  return extension;
}

void Extension::findEntryPoints() {
  const Library &library = *library_;
  findEntry(library, "GetRunObjectInfos", entries_.getRunObjectInfos);
  findEntry(library, "GetRunObjectDataSize", entries_.getRunObjectDataSize);
  findEntry(library, "CreateRunObject", entries_.createRunObject);
  findEntry(library, "DestroyRunObject", entries_.destroyRunObject);
  findEntry(library, "GetConditionMenu", entries_.getMenu[0]);
  findEntry(library, "GetActionMenu", entries_.getMenu[1]);
  findEntry(library, "GetExpressionMenu", entries_.getMenu[2]);
  findEntry(library, "GetConditionCodeFromMenu", entries_.getCodeFromMenu[0]);
  findEntry(library, "GetActionCodeFromMenu", entries_.getCodeFromMenu[1]);
  findEntry(library, "GetExpressionCodeFromMenu", entries_.getCodeFromMenu[2]);
  findEntry(library, "GetConditionInfos", entries_.getInfos[0]);
  findEntry(library, "GetActionInfos", entries_.getInfos[1]);
  findEntry(library, "GetExpressionInfos", entries_.getInfos[2]);
  findEntry(library, "GetConditionString", entries_.getString[0]);
  findEntry(library, "GetActionString", entries_.getString[1]);
  findEntry(library, "GetExpressionString", entries_.getString[2]);
  findEntry(library, "GetConditionTitle", entries_.getConditionTitle);
  findEntry(library, "GetActionTitle", entries_.getActionTitle);
  findEntry(library, "GetExpressionTitle", entries_.getExpressionTitle);
  findEntry(library, "GetExpressionParam", entries_.getExpressionParam);
}

void Extension::readRunInfos() {
  entries_.getRunObjectInfos(nullptr, &runInfos_);
  if (runInfos_.conditions == nullptr || runInfos_.actions == nullptr ||
      runInfos_.expressions == nullptr) {
    throw LoadError("the extension's run-time information names no routine tables");
  }
  // Each table must hold as many routines as the record says.
  for (std::uint16_t code = 0; code < runInfos_.conditionCount; ++code) {
    if (runInfos_.conditions[code] == nullptr) {
      throw LoadError("condition " + std::to_string(code) + " has no routine");
    }
  }
  for (std::uint16_t code = 0; code < runInfos_.actionCount; ++code) {
    if (runInfos_.actions[code] == nullptr) {
      throw LoadError("action " + std::to_string(code) + " has no routine");
    }
  }
  for (std::uint16_t code = 0; code < runInfos_.expressionCount; ++code) {
    if (runInfos_.expressions[code] == nullptr) {
      throw LoadError("expression " + std::to_string(code) + " has no routine");
    }
  }
}

void Extension::readCatalog() {
  for (int code = 0; code < runInfos_.conditionCount; ++code) {
    catalog_.conditions.push_back(readRoutine(RoutineKind::Condition, code));
  }
  for (int code = 0; code < runInfos_.actionCount; ++code) {
    catalog_.actions.push_back(readRoutine(RoutineKind::Action, code));
  }
  for (int code = 0; code < runInfos_.expressionCount; ++code) {
    catalog_.expressions.push_back(readRoutine(RoutineKind::Expression, code));
  }
}

RoutineInfo Extension::readRoutine(RoutineKind kind, int code) {
  const auto index = static_cast<std::size_t>(kind);
  const auto code16 = static_cast<std::uint16_t>(code);
  const std::string what = std::string(kindName(kind)) + " " + std::to_string(code);
  const std::uint16_t *record = entries_.getInfos[index](&context_, code16);
  if (record == nullptr) {
    throw LoadError("the extension gives no record for " + what);
  }
  RoutineInfo info;
  info.kind = kind;
  info.code = code;
  if (field(record, 0) != code16) {
    throw LoadError("the record of " + what + " carries code " + std::to_string(field(record, 0)));
  }
  info.flags = field(record, 1);
  const std::uint16_t count = field(record, 2);
  if (count > kMaxParameters) {
    throw LoadError("the record of " + what + " has " + std::to_string(count) + " parameters");
  }
  char buffer[kTextSize] = {};
  entries_.getString[index](&context_, code16, buffer, static_cast<std::uint16_t>(kTextSize));
  info.display = textOf(buffer);
  if (info.display.empty()) {
    throw LoadError("the extension gives no display string for " + what);
  }
  for (std::uint16_t i = 0; i < count; ++i) {
    info.parameterTypes.push_back(field(record, 3u + i));
    std::memset(buffer, 0, sizeof buffer);
    if (kind == RoutineKind::Expression) {
      entries_.getExpressionParam(&context_, code16, i, buffer,
                                  static_cast<std::uint16_t>(kTextSize));
    } else {
      const host::GetTitleFn title =
          kind == RoutineKind::Condition ? entries_.getConditionTitle : entries_.getActionTitle;
      title(&context_, code16, i, buffer, static_cast<std::uint16_t>(kTextSize));
    }
    info.prompts.push_back(textOf(buffer));
  }
  return info;
}

std::string locateExtension(const std::string &option) {
  if (!option.empty()) {
    return option;
  }
  if (const char *variable = std::getenv("MORVEX_LIBRARY"); variable != nullptr && *variable) {
    return variable;
  }
#if defined(_WIN32)
  const char *names[] = {"morvex.dll", "..\\host\\morvex.dll"};
#else
  const char *names[] = {"libmorvex.so", "../host/libmorvex.so"};
#endif
  const std::string folder = programFolder();
  for (const char *name : names) {
    if (fileExists(folder + name)) {
      return folder + name;
    }
  }
  return folder + names[0];
}

} // namespace morvex::emulator

// Loading display strings, prompts and menu-item texts into the host's buffers.
#include "editor/event_texts.h"

#include "editor/host_compatibility.h"
#include "editor/module.h"

#include <windows.h>

#include <algorithm>
#include <climits>

namespace morvex::editor {
namespace {

// A buffer size as the Windows services take it; a buffer larger than they can describe
// is used only in part.
int serviceSize(std::size_t size) {
  return static_cast<int>(std::min<std::size_t>(size, INT_MAX));
}

bool hasRoom(const char *buffer, std::size_t size) {
  return buffer != nullptr && size != 0;
}

void writeEmpty(char *buffer, std::size_t size) {
  if (hasRoom(buffer, size)) {
    buffer[0] = '\0';
  }
}

// The text of the item with `command` in the kind's menu resource; empty when it has none.
void loadMenuText(EventKind kind, unsigned command, char *buffer, std::size_t size) {
  if (!hasRoom(buffer, size)) {
    return;
  }
  buffer[0] = '\0';
  HMENU menu = LoadMenuA(moduleHandle(), MAKEINTRESOURCEA(eventTable(kind).menuResource));
  if (menu == nullptr) {
    return;
  }
  // A text longer than the buffer may fill all of it without the zero (Wine's user32
  // does): the zero goes after what was copied, within the buffer.
  const int copied = GetMenuStringA(menu, command, buffer, serviceSize(size), MF_BYCOMMAND);
  buffer[std::min(std::max(copied, 0), serviceSize(size) - 1)] = '\0';
  DestroyMenu(menu);
}

} // namespace

void loadResourceString(unsigned id, char *buffer, std::size_t size) {
  if (!hasRoom(buffer, size)) {
    return;
  }
  buffer[0] = '\0';
  if (LoadStringA(moduleHandle(), id, buffer, serviceSize(size)) == 0) {
    buffer[0] = '\0';
  }
}

void loadDisplayString(const host::EditorContext *context, EventKind kind, int code, char *buffer,
                       std::size_t size) {
  if (!isCompatibleHost(context)) {
    return;
  }
  if (const auto record = findRecord(kind, code)) {
    loadResourceString(record->displayString(), buffer, size);
  } else {
    writeEmpty(buffer, size);
  }
}

void loadParameterTitle(EventKind kind, int code, std::size_t parameter, char *buffer,
                        std::size_t size) {
  const auto record = findRecord(kind, code);
  if (!record) {
    writeEmpty(buffer, size);
  } else if (parameter < record->parameterCount() && record->promptString(parameter) != 0) {
    loadResourceString(record->promptString(parameter), buffer, size);
  } else {
    loadMenuText(kind, record->menuCommand(), buffer, size);
  }
}

void loadExpressionTitle(int code, char *buffer, std::size_t size) {
  if (const auto record = findRecord(EventKind::expression, code)) {
    loadMenuText(EventKind::expression, record->menuCommand(), buffer, size);
  } else {
    writeEmpty(buffer, size);
  }
}

void loadExpressionParam(int code, std::size_t parameter, char *buffer, std::size_t size) {
  const auto record = findRecord(EventKind::expression, code);
  if (record && parameter < record->parameterCount() && record->promptString(parameter) != 0) {
    loadResourceString(record->promptString(parameter), buffer, size);
  } else {
    writeEmpty(buffer, size);
  }
}

} // namespace morvex::editor

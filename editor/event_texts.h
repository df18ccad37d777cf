// The texts the host's event editor shows: display strings, parameter titles and prompts,
// and resource strings in general, written into buffers the host owns.
//
// Every function writes at most size - 1 characters and a terminating zero into `buffer`,
// and nothing at all when `buffer` is null or `size` is 0.
#ifndef MORVEX_EDITOR_EVENT_TEXTS_H
#define MORVEX_EDITOR_EVENT_TEXTS_H

#include "editor/event_infos.h"
#include "host/contract.h"

#include <cstddef>

namespace morvex::editor {

// String resource `id`; the empty string when the module has none.
void loadResourceString(unsigned id, char *buffer, std::size_t size);

// The display template of `code`, when the host passes the compatibility test; otherwise
// the buffer is left alone. The empty string for a code the table does not hold.
void loadDisplayString(const host::EditorContext *context, EventKind kind, int code, char *buffer,
                       std::size_t size);

// The title of parameter `parameter` of a condition or action: its prompt string, or the
// text of the record's menu item when the parameter has no prompt or does not exist.
void loadParameterTitle(EventKind kind, int code, std::size_t parameter, char *buffer,
                        std::size_t size);

// The text of the expression's menu item; empty when the menu does not offer it.
void loadExpressionTitle(int code, char *buffer, std::size_t size);

// The prompt string of an expression's parameter; empty when its prompt field is 0.
void loadExpressionParam(int code, std::size_t parameter, char *buffer, std::size_t size);

} // namespace morvex::editor

#endif

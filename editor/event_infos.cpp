// Walking the event-information tables, and the compile-time proof that every table is
// well formed.
#include "editor/event_infos.h"

namespace morvex::editor {
namespace {

// The number of fields of the record at `position`, or 0 when no whole record starts there.
constexpr std::size_t recordLength(std::span<const std::uint16_t> fields, std::size_t position) {
  if (position >= fields.size() || fields.size() - position < kHeadFields) {
    return 0;
  }
  const std::size_t length = kHeadFields + 2 * std::size_t{fields[position + kCountField]};
  return fields.size() - position < length ? 0 : length;
}

constexpr bool isPrompt(std::uint16_t id) {
  return id >= IDS_PROMPT_INSTANCE_NAME && id <= IDS_PROMPT_OBJECT;
}

// Every record in code order, numbered from the bases, with known types and prompts, and
// nothing after the last one.
constexpr bool isWellFormed(EventKind kind) {
  const EventTable table = eventTable(kind);
  std::size_t position = 0;
  for (std::uint16_t code = 0; code < table.recordCount; ++code) {
    const std::size_t length = recordLength(table.fields, position);
    if (length == 0) {
      return false;
    }
    const EventRecord record(table.fields.subspan(position, length));
    if (record.code() != code || record.menuCommand() != table.menuBase + 10 * code ||
        record.displayString() != table.stringBase + 10 * code) {
      return false;
    }
    for (std::size_t i = 0; i < record.parameterCount(); ++i) {
      const std::uint16_t type = record.parameterType(i);
      const std::uint16_t prompt = record.promptString(i);
      if (kind == EventKind::expression) {
        if ((type != kIntegerArgument && type != kStringArgument) || prompt != 0) {
          return false;
        }
      } else if ((type != kStringParam && type != kNumberParam && type != kObjectParam) ||
                 !isPrompt(prompt)) {
        return false;
      }
    }
    const bool goodFlags =
        kind == EventKind::expression ? record.flags() <= kFloatResult : record.flags() == 0;
    if (!goodFlags) {
      return false;
    }
    position += length;
  }
  return position == table.fields.size();
}

static_assert(eventTable(EventKind::condition).recordCount == 4);
static_assert(eventTable(EventKind::action).recordCount == 28);
static_assert(eventTable(EventKind::expression).recordCount == 25);
static_assert(isWellFormed(EventKind::condition));
static_assert(isWellFormed(EventKind::action));
static_assert(isWellFormed(EventKind::expression));

} // namespace

std::optional<EventRecord> findRecord(EventKind kind, int code) {
  const EventTable table = eventTable(kind);
  if (code < 0 || code >= table.recordCount) {
    return std::nullopt;
  }
  std::size_t position = 0;
  for (int current = 0;; ++current) {
    const std::size_t length = recordLength(table.fields, position);
    if (length == 0) {
      return std::nullopt;
    }
    if (current == code) {
      return EventRecord(table.fields.subspan(position, length));
    }
    position += length;
  }
}

int findCode(EventKind kind, unsigned command) {
  const EventTable table = eventTable(kind);
  std::size_t position = 0;
  for (int walked = 0; walked < table.recordCount; ++walked) {
    const std::size_t length = recordLength(table.fields, position);
    if (length == 0) {
      break;
    }
    const EventRecord record(table.fields.subspan(position, length));
    if (record.menuCommand() == command) {
      return record.code();
    }
    position += length;
  }
  return -1;
}

} // namespace morvex::editor

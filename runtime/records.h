// Named records kept by the runtime: instances and variables, each carrying its own links
// within the NameList that owns it (see name_list.h).
#ifndef MORVEX_RUNTIME_RECORDS_H
#define MORVEX_RUNTIME_RECORDS_H

#include <cstdint>
#include <string>
#include <vector>

namespace morvex::runtime {

// Lower-cases A to Z and leaves every other byte alone; a missing text gives "".
std::string lowerCased(const char *text);

// Whether two texts are equal when A to Z are taken as a to z.
bool equalIgnoringCase(const char *a, const char *b);

// Three independent views of one datum; writing one leaves the others as they are.
struct Value {
  std::int32_t intValue = 0;
  float floatValue = 0.0f;
  std::string stringValue;
};

// A named instance: one Value per declared member name of its object.
struct InstanceRecord {
  InstanceRecord() = default; // an end marker: name "", no values
  // A lower-cased copy of `name`; `memberCount` values of 0, 0.0 and "" (none when negative).
  InstanceRecord(const char *name, std::int32_t memberCount);

  // Takes the other's values; keeps this record's name, links and busy flag.
  void assign(const InstanceRecord &other);
  std::int32_t valueCount() const { return static_cast<std::int32_t>(values.size()); }

  std::string name;
  std::vector<Value> values;
  std::uint8_t instanceBusy = 0;
  InstanceRecord *next = nullptr;
  InstanceRecord *prev = nullptr;
};

// A named global or local variable.
struct VariableRecord {
  VariableRecord() = default;                // an end marker: name "", 0, 0.0, ""
  explicit VariableRecord(const char *name); // a missing name counts as ""

  // Takes the other's value; keeps this record's name and links.
  void assign(const VariableRecord &other);

  std::string name;
  Value value;
  VariableRecord *next = nullptr;
  VariableRecord *prev = nullptr;
};

} // namespace morvex::runtime

#endif

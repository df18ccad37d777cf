// Construction and assignment of instance and variable records.
#include "runtime/records.h"

#include <algorithm>

namespace morvex::runtime {

std::string lowerCased(const char *text) {
  std::string result = text ? text : "";
  for (char &c : result) {
    if (c >= 'A' && c <= 'Z') {
      c = static_cast<char>(c - 'A' + 'a');
    }
  }
  return result;
}

bool equalIgnoringCase(const char *a, const char *b) {
  const auto lower = [](char c) {
    return c >= 'A' && c <= 'Z' ? static_cast<char>(c - 'A' + 'a') : c;
  };
  for (; *a != '\0' || *b != '\0'; ++a, ++b) {
    if (lower(*a) != lower(*b)) {
      return false;
    }
  }
  return true;
}

InstanceRecord::InstanceRecord(const char *instanceName, std::int32_t memberCount)
    : name(lowerCased(instanceName)), values(static_cast<std::size_t>(std::max(memberCount, 0))) {
}

void InstanceRecord::assign(const InstanceRecord &other) {
  if (this != &other) {
    values = other.values;
  }
}

VariableRecord::VariableRecord(const char *variableName) : name(lowerCased(variableName)) {
}

void VariableRecord::assign(const VariableRecord &other) {
  if (this != &other) {
    value = other.value;
  }
}

} // namespace morvex::runtime

// Reading the text of `objdump -p`.
#include "tests/windows/objdump_report.h"

#include <sstream>

namespace morvex::tests {
namespace {

bool startsWith(const std::string &line, const std::string &prefix) {
  return line.compare(0, prefix.size(), prefix) == 0;
}

std::string trimmed(const std::string &text) {
  const auto first = text.find_first_not_of(" \t\r");
  if (first == std::string::npos) {
    return {};
  }
  return text.substr(first, text.find_last_not_of(" \t\r") - first + 1);
}

// The number after the last occurrence of `key` in `line`, e.g. "+base[  26]" gives 26.
int numberAfter(const std::string &line, const std::string &key) {
  const auto at = line.rfind(key);
  return at == std::string::npos ? -1 : std::stoi(line.substr(at + key.size()));
}

} // namespace

ObjdumpReport readObjdumpReport(std::istream &text) {
  enum class Section { other, addresses, names } section = Section::other;
  ObjdumpReport report;
  int ordinalBase = 0;
  std::string line;
  while (std::getline(text, line)) {
    const std::string content = trimmed(line);
    if (content.empty()) {
      section = Section::other;
    } else if (const auto format = content.find("file format "); format != std::string::npos) {
      report.format = content.substr(format + 12);
    } else if (startsWith(line, "Name ")) {
      std::istringstream fields(content);
      std::string label, address;
      fields >> label >> address >> report.exportedModule;
    } else if (startsWith(content, "Export Address Table -- Ordinal Base")) {
      ordinalBase = numberAfter(content, "Ordinal Base");
      section = Section::addresses;
    } else if (startsWith(content, "[Ordinal/Name Pointer] Table")) {
      section = Section::names;
    } else if (startsWith(content, "DLL Name:")) {
      report.importedModules.push_back(trimmed(content.substr(9)));
    } else if (section == Section::addresses && startsWith(content, "[")) {
      report.exportedOrdinals.insert(numberAfter(content, "+base["));
    } else if (section == Section::names && startsWith(content, "[")) {
      const auto close = content.find(']');
      const int index = std::stoi(content.substr(1, close - 1));
      report.exportNames[ordinalBase + index] = trimmed(content.substr(close + 1));
    }
  }
  return report;
}

} // namespace morvex::tests

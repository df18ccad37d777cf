// Cutting display templates into parts and filling them in.
#include "emulator/display_template.h"

namespace morvex::emulator {

namespace {

constexpr std::string_view kObjectPrefix = "%o: ";

// The hole that starts at display[i], if one does: its parameter number or kObject.
bool holeAt(std::string_view display, std::size_t i, int &parameter) {
  if (display[i] != '%' || i + 1 >= display.size()) {
    return false;
  }
  const char next = display[i + 1];
  if (next == 'o') {
    parameter = TemplatePart::kObject;
    return true;
  }
  if (next >= '0' && next <= '9') {
    parameter = next - '0';
    return true;
  }
  return false;
}

} // namespace

std::vector<TemplatePart> splitTemplate(std::string_view display) {
  std::vector<TemplatePart> parts;
  std::string literal;
  for (std::size_t i = 0; i < display.size(); ++i) {
    int parameter = 0;
    if (holeAt(display, i, parameter)) {
      if (!literal.empty()) {
        parts.push_back({false, literal, 0});
        literal.clear();
      }
      parts.push_back({true, "", parameter});
      ++i;
    } else {
      literal += display[i];
    }
  }
  if (!literal.empty()) {
    parts.push_back({false, literal, 0});
  }
  return parts;
}

std::string_view lineForm(std::string_view display) {
  if (display.substr(0, kObjectPrefix.size()) == kObjectPrefix) {
    return display.substr(kObjectPrefix.size());
  }
  return display;
}

std::string eventName(std::string_view display) {
  std::string name;
  for (const TemplatePart &part : splitTemplate(lineForm(display))) {
    if (!part.isHole) {
      name += part.text;
    }
  }
  while (!name.empty() && name.back() == ' ') {
    name.pop_back();
  }
  return name;
}

std::string fillTemplate(std::string_view display, std::string_view object,
                         const std::vector<std::string> &parameters) {
  std::string filled;
  for (std::size_t i = 0; i < display.size(); ++i) {
    int parameter = 0;
    if (holeAt(display, i, parameter)) {
      if (parameter == TemplatePart::kObject) {
        filled += object;
      } else if (static_cast<std::size_t>(parameter) < parameters.size()) {
        filled += parameters[static_cast<std::size_t>(parameter)];
      } else {
        filled += display.substr(i, 2);
      }
      ++i;
    } else {
      filled += display[i];
    }
  }
  return filled;
}

} // namespace morvex::emulator

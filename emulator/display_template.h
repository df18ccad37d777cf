// A display template cut into its fixed texts and its holes: "%o" for the object and
// "%0" to "%9" for the parameters.
#ifndef MORVEX_EMULATOR_DISPLAY_TEMPLATE_H
#define MORVEX_EMULATOR_DISPLAY_TEMPLATE_H

#include <string>
#include <string_view>
#include <vector>

namespace morvex::emulator {

struct TemplatePart {
  static constexpr int kObject = -1; // `parameter` of the "%o" hole

  bool isHole = false;
  std::string text;  // a fixed text
  int parameter = 0; // a hole: the parameter's number, or kObject
};

std::vector<TemplatePart> splitTemplate(std::string_view display);

// The template as a sheet line writes it after "NAME: ": conditions drop their leading
// "%o: ", which the line's own prefix stands for.
std::string_view lineForm(std::string_view display);

// The name of a condition as an event: its line form without holes ("On Function").
std::string eventName(std::string_view display);

// The template with each hole filled by the given texts (the object's name for "%o").
std::string fillTemplate(std::string_view display, std::string_view object,
                         const std::vector<std::string> &parameters);

} // namespace morvex::emulator

#endif

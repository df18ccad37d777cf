// Walking the pop-up menus the extension hands out, with the system's menu services
// (user32 on Windows, the winapi stand-ins elsewhere).
#include "emulator/menus.h"

#include <windows.h>

#include <set>
#include <string>

namespace morvex::emulator {

namespace {

constexpr int kMenuTextSize = 80;

const char *parameterTypeName(RoutineKind kind, std::uint16_t type) {
  if (kind == RoutineKind::Expression) {
    return type == kStringArgument ? "text" : "integer";
  }
  switch (type) {
  case kStringParam:
    return "text";
  case kNumberParam:
    return "number";
  case kObjectParam:
    return "object";
  default:
    break;
  }
  return "unknown";
}

const char *resultTypeName(std::uint16_t flags) {
  switch (flags) {
  case kStringResult:
    return "text";
  case kFloatResult:
    return "float";
  default:
    break;
  }
  return "integer";
}

void indent(std::ostream &out, int level) {
  for (int i = 0; i < level; ++i) {
    out << "  ";
  }
}

class MenuPrinter {
public:
  MenuPrinter(Extension &extension, std::ostream &out) : extension_(extension), out_(out) {}

  void printMenu(RoutineKind kind, const char *title) {
    out_ << title << '\n';
    const auto index = static_cast<std::size_t>(kind);
    const auto menu =
        static_cast<HMENU>(extension_.entries().getMenu[index](extension_.editorContext(), 0, 0));
    if (menu == nullptr) {
      indent(out_, 1);
      out_ << "(the extension gives no menu)\n";
      return;
    }
    printItems(kind, menu, 1);
    DestroyMenu(menu); // the host owns the menus it is given
  }

  void printUnoffered() {
    out_ << "Not offered by any menu\n";
    for (const RoutineKind kind :
         {RoutineKind::Condition, RoutineKind::Action, RoutineKind::Expression}) {
      for (const RoutineInfo &info : extension_.catalog().of(kind)) {
        if (offered_.count({kind, info.code}) == 0) {
          indent(out_, 1);
          out_ << kindName(kind) << ' ';
          printRoutine(info, 1);
          ++listed_;
        }
      }
    }
  }

  int listed() const { return listed_; }

private:
  void printItems(RoutineKind kind, HMENU menu, int level) {
    const int count = GetMenuItemCount(menu);
    for (int position = 0; position < count; ++position) {
      char text[kMenuTextSize] = {};
      GetMenuStringA(menu, static_cast<UINT>(position), text, kMenuTextSize, MF_BYPOSITION);
      if (const HMENU sub = GetSubMenu(menu, position); sub != nullptr) {
        indent(out_, level);
        out_ << text << " >\n";
        printItems(kind, sub, level + 1);
        continue;
      }
      const UINT command = GetMenuItemID(menu, position);
      indent(out_, level);
      if (command == 0) {
        out_ << "----\n";
        continue;
      }
      out_ << text << '\n';
      printCommand(kind, command, level + 1);
    }
  }

  void printCommand(RoutineKind kind, UINT command, int level) {
    const auto index = static_cast<std::size_t>(kind);
    const host::HostWord code = extension_.entries().getCodeFromMenu[index](
        extension_.editorContext(), static_cast<std::uint16_t>(command));
    const std::vector<RoutineInfo> &routines = extension_.catalog().of(kind);
    indent(out_, level);
    if (code < 0 || static_cast<std::size_t>(code) >= routines.size()) {
      out_ << "command " << command << " selects no " << kindName(kind) << '\n';
      return;
    }
    printRoutine(routines[static_cast<std::size_t>(code)], level);
    if (offered_.insert({kind, static_cast<int>(code)}).second) {
      ++listed_;
    }
  }

  // "CODE: TEMPLATE", then one line per parameter with its type and prompt.
  void printRoutine(const RoutineInfo &info, int level) {
    out_ << info.code << ": " << info.display;
    if (info.kind == RoutineKind::Expression) {
      out_ << " -> " << resultTypeName(info.flags);
    }
    out_ << '\n';
    for (std::size_t i = 0; i < info.parameterTypes.size(); ++i) {
      indent(out_, level + 1);
      out_ << '%' << i << ' ' << parameterTypeName(info.kind, info.parameterTypes[i]);
      if (!info.prompts[i].empty()) {
        out_ << ": " << info.prompts[i];
      }
      out_ << '\n';
    }
  }

  Extension &extension_;
  std::ostream &out_;
  std::set<std::pair<RoutineKind, int>> offered_;
  int listed_ = 0;
};

} // namespace

int printMenus(Extension &extension, std::ostream &out) {
  MenuPrinter printer(extension, out);
  printer.printMenu(RoutineKind::Condition, "Conditions");
  printer.printMenu(RoutineKind::Action, "Actions");
  printer.printMenu(RoutineKind::Expression, "Expressions");
  printer.printUnoffered();
  const Catalog &catalog = extension.catalog();
  out << printer.listed() << " routines: " << catalog.conditions.size() << " conditions, "
      << catalog.actions.size() << " actions, " << catalog.expressions.size() << " expressions\n";
  return printer.listed();
}

} // namespace morvex::emulator

#!/usr/bin/env python3
"""Turns the module's resource script into C++ for Linux, where no resource compiler links
resources into a shared library: the string table, the menu templates and the dialog
templates become constant data in a ResourceTable (winapi/resources.h), which the module
handle points at. Bitmaps, data and the version resource are for the host on Windows only
and are checked for syntax and otherwise left out.

Only the subset of the script language that morvex.rc uses is understood; anything else
stops the build with the line it found it on.

    rc2cpp.py morvex.rc -o morvex_rc.cpp [-I dir]... [--model model.json]

--model also writes the parsed resources as JSON, in the form tests/editor/rc_check.py
compares with the output of the Windows resource compiler.
"""
import argparse
import json
import re
import sys
from pathlib import Path

# Window and control styles the control statements imply (values of the Windows API).
WS_CHILD, WS_VISIBLE, WS_CAPTION = 0x40000000, 0x10000000, 0x00C00000
WS_POPUP, WS_BORDER, WS_SYSMENU = 0x80000000, 0x00800000, 0x00080000
WS_GROUP, WS_TABSTOP = 0x00020000, 0x00010000
DS_SETFONT = 0x40
MF_GRAYED, MF_DISABLED, MF_CHECKED, MF_POPUP = 0x01, 0x02, 0x08, 0x10
MF_MENUBARBREAK, MF_MENUBREAK, MF_SEPARATOR, MF_HELP = 0x20, 0x40, 0x800, 0x4000

# statement: (window class, takes a text, default style)
CONTROLS = {
    "LTEXT": ("STATIC", True, 0x0 | WS_GROUP),
    "CTEXT": ("STATIC", True, 0x1 | WS_GROUP),
    "RTEXT": ("STATIC", True, 0x2 | WS_GROUP),
    "PUSHBUTTON": ("BUTTON", True, 0x0 | WS_TABSTOP),
    "DEFPUSHBUTTON": ("BUTTON", True, 0x1 | WS_TABSTOP),
    "CHECKBOX": ("BUTTON", True, 0x2 | WS_TABSTOP),
    "AUTOCHECKBOX": ("BUTTON", True, 0x3 | WS_TABSTOP),
    "GROUPBOX": ("BUTTON", True, 0x7),
    "LISTBOX": ("LISTBOX", False, 0x1 | WS_BORDER),  # LBS_NOTIFY
    "EDITTEXT": ("EDIT", False, WS_BORDER | WS_TABSTOP),  # ES_LEFT
}
MENU_OPTIONS = {
    "GRAYED": MF_GRAYED,
    "INACTIVE": MF_DISABLED,
    "CHECKED": MF_CHECKED,
    "MENUBREAK": MF_MENUBREAK,
    "MENUBARBREAK": MF_MENUBARBREAK,
    "HELP": MF_HELP,
}
MEMORY_OPTIONS = {"DISCARDABLE", "MOVEABLE", "FIXED", "PURE", "IMPURE", "PRELOAD", "LOADONCALL"}


class ScriptError(Exception):
    pass


# ---------------------------------------------------------------------------------------
# Tokens
# ---------------------------------------------------------------------------------------
TOKEN = re.compile(
    r"""(?P<space>[ \t\r\n]+)
      | (?P<comment>//[^\n]*|/\*.*?\*/)
      | (?P<directive>\#[^\n]*)
      | (?P<string>"(?:[^"\\\n]|\\.|"")*")
      | (?P<number>(?:0[xX][0-9a-fA-F]+|[0-9]+)[uUlL]*)
      | (?P<name>[A-Za-z_][A-Za-z0-9_]*)
      | (?P<punct>[,|&+\-*~(){}])""",
    re.VERBOSE | re.DOTALL | re.MULTILINE,
)
ESCAPES = {"n": "\n", "t": "\t", "\\": "\\", '"': '"', "r": "\r", "a": "\a", "0": "\0"}


def unquote(literal, line):
    body, text, i = literal[1:-1], [], 0
    while i < len(body):
        c = body[i]
        if c == '"':  # "" stands for one quote
            text.append('"')
            i += 2
        elif c == "\\":
            if body[i + 1] not in ESCAPES:
                raise ScriptError(f"line {line}: unknown escape \\{body[i + 1]}")
            text.append(ESCAPES[body[i + 1]])
            i += 2
        else:
            text.append(c)
            i += 1
    return "".join(text)


def tokenize(source):
    """(kind, value, line) triples; directives come out whole."""
    tokens, position, line = [], 0, 1
    while position < len(source):
        match = TOKEN.match(source, position)
        if match is None:
            raise ScriptError(f"line {line}: cannot read {source[position:position + 20]!r}")
        kind, text = match.lastgroup, match.group()
        if kind == "string":
            tokens.append(("string", unquote(text, line), line))
        elif kind == "number":
            tokens.append(("number", int(text.rstrip("uUlL"), 0), line))
        elif kind in ("name", "punct", "directive"):
            tokens.append((kind, text.strip() if kind == "directive" else text, line))
        line += text.count("\n")
        position = match.end()
    return tokens


# ---------------------------------------------------------------------------------------
# Symbols: the #define lines of the included headers and of the script
# ---------------------------------------------------------------------------------------
DEFINE = re.compile(r"^\s*#\s*define\s+([A-Za-z_]\w*)(?!\()\s+(.+?)\s*(?://.*|/\*.*)?$")


class Symbols:
    def __init__(self, include_dirs):
        self.include_dirs = [Path(d) for d in include_dirs]
        self.values = {}

    def directive(self, text, line, here):
        include = re.match(r'#\s*include\s*[<"]([^>"]+)[>"]', text)
        if include:
            self.read_header(self.find(include.group(1), line, here))
        elif DEFINE.match(text):
            name, value = DEFINE.match(text).groups()
            self.values[name] = value
        elif not re.match(r"#\s*(ifndef|ifdef|endif|pragma|undef)\b", text):
            raise ScriptError(f"line {line}: unsupported directive {text}")

    def find(self, name, line, here):
        for directory in [here] + self.include_dirs:
            if (directory / name).is_file():
                return directory / name
        raise ScriptError(f"line {line}: cannot find {name}")

    def read_header(self, path):
        for text in path.read_text(encoding="latin-1").splitlines():
            match = DEFINE.match(text)
            if match:
                self.values[match.group(1)] = match.group(2)

    def value(self, name, line, seen=()):
        if name not in self.values or name in seen:
            raise ScriptError(f"line {line}: {name} is not a number")
        parser = Parser(tokenize(self.values[name]), self, seen + (name,))
        result = parser.expression()
        if not parser.at_end():
            raise ScriptError(f"line {line}: {name} is not a number")
        return result


# ---------------------------------------------------------------------------------------
# The script
# ---------------------------------------------------------------------------------------
class Parser:
    def __init__(self, tokens, symbols, seen=()):
        self.tokens, self.symbols, self.seen, self.position = tokens, symbols, seen, 0

    # Token access
    def at_end(self):
        return self.position >= len(self.tokens)

    def peek(self, offset=0):
        index = self.position + offset
        return self.tokens[index] if index < len(self.tokens) else ("end", None, self.line())

    def line(self):
        return self.tokens[min(self.position, len(self.tokens) - 1)][2] if self.tokens else 0

    def take(self):
        token = self.peek()
        if token[0] == "end":
            raise ScriptError(f"line {token[2]}: unexpected end of script")
        self.position += 1
        return token

    def fail(self, what):
        kind, value, line = self.peek()
        raise ScriptError(f"line {line}: expected {what}, found {value!r}")

    def is_word(self, *words):
        kind, value, _ = self.peek()
        return kind == "name" and value.upper() in words

    def word(self, *words):
        if not self.is_word(*words):
            self.fail(" or ".join(words))
        return self.take()[1].upper()

    def comma(self, required=True):
        if self.peek()[:2] == ("punct", ","):
            self.take()
            return True
        if required:
            self.fail("','")
        return False

    def string(self):
        if self.peek()[0] != "string":
            self.fail("a quoted text")
        return self.take()[1]

    def begin(self):
        if self.peek()[:2] == ("punct", "{"):
            self.take()
        else:
            self.word("BEGIN")

    def is_end(self):
        return self.peek()[:2] == ("punct", "}") or self.is_word("END")

    def end(self):
        if self.peek()[:2] == ("punct", "}"):
            self.take()
        else:
            self.word("END")

    # Numeric expressions: | & + - * ~ NOT, parentheses, numbers and #defined names.
    def expression(self):
        value = self.term()
        while self.peek()[0] == "punct" and self.peek()[1] in "|&+-":
            operator = self.take()[1]
            if self.is_word("NOT"):  # "| NOT x" clears the bits of x
                self.take()
                value &= ~self.term()
                continue
            right = self.term()
            value = {"|": value | right, "&": value & right, "+": value + right, "-": value - right}[operator]
        return value & 0xFFFFFFFF

    def term(self):
        value = self.unary()
        while self.peek()[:2] == ("punct", "*"):
            self.take()
            value *= self.unary()
        return value

    def unary(self):
        kind, value, line = self.peek()
        if kind == "punct" and value in "-~":
            self.take()
            operand = self.unary()
            return -operand if value == "-" else ~operand
        if kind == "name" and value.upper() == "NOT":
            self.take()
            return ~self.unary()
        if kind == "punct" and value == "(":
            self.take()
            result = self.expression()
            if self.take()[1] != ")":
                raise ScriptError(f"line {line}: expected ')'")
            return result
        if kind == "number":
            return self.take()[1]
        if kind == "name":
            self.take()
            return self.symbols.value(value, line, self.seen)
        self.fail("a number")

    # Statements
    def script(self, here):
        resources = {"strings": {}, "menus": {}, "dialogs": {}}
        while not self.at_end():
            kind, value, line = self.peek()
            if kind == "directive":
                self.take()
                self.symbols.directive(value, line, here)
            elif self.is_word("LANGUAGE"):
                self.take()
                self.expression()
                self.comma()
                self.expression()
            elif self.is_word("STRINGTABLE"):
                self.take()
                self.string_table(resources["strings"])
            else:
                self.resource(resources, here)
        return resources

    def memory_options(self):
        while self.is_word(*MEMORY_OPTIONS):
            self.take()

    def string_table(self, strings):
        self.memory_options()
        self.begin()
        while not self.is_end():
            line = self.peek()[2]
            number = self.expression()
            self.comma(required=False)
            if number in strings:
                raise ScriptError(f"line {line}: string {number} is defined twice")
            strings[number] = self.string()
        self.end()

    def resource(self, resources, here):
        line = self.peek()[2]
        number = self.expression()
        kind = self.word("MENU", "DIALOG", "DIALOGEX", "BITMAP", "RCDATA", "VERSIONINFO")
        if kind == "MENU":
            self.memory_options()
            self.add(resources["menus"], number, self.menu_items(), line)
        elif kind in ("DIALOG", "DIALOGEX"):
            self.add(resources["dialogs"], number, self.dialog(kind == "DIALOGEX"), line)
        elif kind == "BITMAP":
            self.memory_options()
            name = self.string()
            self.symbols.find(name, line, here)  # must exist for the Windows build
        else:
            self.skip_block()

    @staticmethod
    def add(table, number, resource, line):
        if number in table:
            raise ScriptError(f"line {line}: resource {number} is defined twice")
        table[number] = resource

    def skip_block(self):
        """Skips to the end of the next BEGIN ... END block, nested blocks included."""
        while not (self.peek()[:2] == ("punct", "{") or self.is_word("BEGIN")):
            self.take()
        depth = 0
        while True:
            if self.peek()[:2] == ("punct", "{") or self.is_word("BEGIN"):
                depth += 1
            elif self.is_end():
                depth -= 1
            self.take()
            if depth == 0:
                return

    def menu_items(self):
        items = []
        self.begin()
        while not self.is_end():
            if self.word("MENUITEM", "POPUP") == "POPUP":
                text = self.string()
                flags = MF_POPUP | self.menu_options()
                items.append({"flags": flags, "id": 0, "text": text, "items": self.menu_items()})
            elif self.is_word("SEPARATOR"):
                self.take()
                items.append({"flags": MF_SEPARATOR, "id": 0, "text": "", "items": []})
            else:
                text = self.string()
                self.comma()
                number = self.expression()
                items.append({"flags": self.menu_options(), "id": number, "text": text, "items": []})
        self.end()
        return items

    def menu_options(self):
        flags = 0
        while self.comma(required=False) or self.is_word(*MENU_OPTIONS):
            flags |= MENU_OPTIONS[self.word(*MENU_OPTIONS)]
        return flags

    def numbers(self, count):
        values = [self.expression()]
        for _ in range(count - 1):
            self.comma()
            values.append(self.expression())
        return values

    def dialog(self, extended):
        x, y, cx, cy = self.numbers(4)
        if extended and self.comma(required=False):
            self.expression()  # help id
        dialog = {"style": None, "x": x, "y": y, "cx": cx, "cy": cy, "caption": "",
                  "font": None, "size": 0, "items": []}
        while not (self.peek()[:2] == ("punct", "{") or self.is_word("BEGIN")):
            statement = self.word("STYLE", "EXSTYLE", "CAPTION", "FONT")
            if statement == "STYLE":
                dialog["style"] = self.expression()
            elif statement == "EXSTYLE":
                self.expression()
            elif statement == "CAPTION":
                dialog["caption"] = self.string()
            else:
                dialog["size"] = self.expression()
                self.comma()
                dialog["font"] = self.string()
                while self.comma(required=False):  # weight, italic, charset
                    self.expression()
        style = WS_POPUP | WS_BORDER | WS_SYSMENU if dialog["style"] is None else dialog["style"]
        if dialog["caption"]:
            style |= WS_CAPTION
        if dialog["font"] is not None:
            style |= DS_SETFONT
        dialog["style"] = style
        self.begin()
        while not self.is_end():
            dialog["items"].append(self.control())
        self.end()
        return dialog

    def control(self):
        line = self.peek()[2]
        statement = self.word(*CONTROLS, "CONTROL")
        if statement == "CONTROL":
            text = self.string()
            self.comma()
            number = self.expression()
            self.comma()
            window_class = self.string().upper()
            self.comma()
            style = self.expression()
            self.comma()
            x, y, cx, cy = self.numbers(4)
            if self.comma(required=False):
                self.expression()  # extended style
        else:
            window_class, has_text, style = CONTROLS[statement]
            text = ""
            if has_text:
                text = self.string()
                self.comma()
            number = self.expression()
            self.comma()
            x, y, cx, cy = self.numbers(4)
            if self.comma(required=False):
                style = self.style(style)
                if self.comma(required=False):
                    self.expression()  # extended style
        if number & 0xFFFF != number and number != 0xFFFFFFFF:
            raise ScriptError(f"line {line}: control id {number} does not fit 16 bits")
        return {"class": window_class, "text": text, "id": number & 0xFFFF,
                "style": (style | WS_CHILD | WS_VISIBLE) & 0xFFFFFFFF,
                "x": x, "y": y, "cx": cx, "cy": cy}

    def style(self, default):
        """A control's style: its default bits with those of the script added ("NOT x"
        removes x)."""
        value = default
        while True:
            if self.is_word("NOT"):
                self.take()
                value &= ~self.term()
            else:
                value |= self.term()
            if self.peek()[:2] != ("punct", "|"):
                return value
            self.take()


# ---------------------------------------------------------------------------------------
# C++
# ---------------------------------------------------------------------------------------
def cpp_string(text):
    out = []
    for byte in text.encode("latin-1"):
        char = chr(byte)
        if char in '"\\':
            out.append("\\" + char)
        elif 32 <= byte < 127 and char != "?":  # "?" could start a trigraph
            out.append(char)
        else:
            out.append(f"\\{byte:03o}")
    return '"' + "".join(out) + '"'


def emit(resources, source_name):
    lines = [
        f"// The resources of {source_name} as C++ data. Generated by editor/rc2cpp.py at build",
        "// time; edit the resource script instead.",
        '#include "editor/embedded_resources.h"',
        '#include "winapi/resources.h"',
        "",
        "#include <iterator>",
        "",
        "namespace morvex::editor {",
        "namespace {",
        "",
        "using winapi::DialogItemTemplate;",
        "using winapi::DialogTemplate;",
        "using winapi::MenuItemTemplate;",
        "using winapi::MenuTemplate;",
        "using winapi::StringResource;",
        "",
        "constexpr StringResource kStrings[] = {",
    ]
    lines += [f"    {{{number}, {cpp_string(text)}}}," for number, text in sorted(resources["strings"].items())]
    lines.append("};")

    def menu_array(name, items):
        """Emits the arrays of `items` and their pop-ups, children first."""
        rows = []
        for index, item in enumerate(items):
            if item["items"]:
                child = f"{name}_{index}"
                menu_array(child, item["items"])
                rows.append(f"    {{0x{item['flags']:x}, 0, {cpp_string(item['text'])}, {child}, std::size({child})}},")
            else:
                rows.append(f"    {{0x{item['flags']:x}, {item['id']}, {cpp_string(item['text'])}, nullptr, 0}},")
        lines.append("")
        lines.append(f"constexpr MenuItemTemplate {name}[] = {{")
        lines.extend(rows)
        lines.append("};")

    for number, items in sorted(resources["menus"].items()):
        menu_array(f"kMenu{number}", items)
    lines += ["", "constexpr MenuTemplate kMenus[] = {"]
    lines += [f"    {{{number}, kMenu{number}, std::size(kMenu{number})}}," for number in sorted(resources["menus"])]
    lines.append("};")

    for number, dialog in sorted(resources["dialogs"].items()):
        lines += ["", f"constexpr DialogItemTemplate kDialog{number}Items[] = {{"]
        for item in dialog["items"]:
            number_text = "-1" if item["id"] == 0xFFFF else str(item["id"])
            lines.append(
                f"    {{{cpp_string(item['class'])}, {cpp_string(item['text'])}, {number_text}, "
                f"0x{item['style']:08x}, {item['x']}, {item['y']}, {item['cx']}, {item['cy']}}},")
        lines.append("};")
    lines += ["", "constexpr DialogTemplate kDialogs[] = {"]
    for number, dialog in sorted(resources["dialogs"].items()):
        font = "nullptr" if dialog["font"] is None else cpp_string(dialog["font"])
        lines.append(
            f"    {{{number}, 0x{dialog['style']:08x}, {dialog['x']}, {dialog['y']}, {dialog['cx']}, "
            f"{dialog['cy']}, {cpp_string(dialog['caption'])}, {font}, {dialog['size']}, "
            f"kDialog{number}Items, std::size(kDialog{number}Items)}},")
    lines += [
        "};",
        "",
        "HINSTANCE__ resourceModule{{kStrings, std::size(kStrings), kMenus, std::size(kMenus), kDialogs,",
        "                            std::size(kDialogs)}};",
        "",
        "} // namespace",
        "",
        "HINSTANCE embeddedResources() { return &resourceModule; }",
        "",
        "} // namespace morvex::editor",
        "",
    ]
    return "\n".join(lines)


def parse(path, include_dirs):
    source = Path(path).read_text(encoding="latin-1")
    symbols = Symbols(include_dirs)
    return Parser(tokenize(source), symbols).script(Path(path).resolve().parent)


def main():
    arguments = argparse.ArgumentParser(description=__doc__.splitlines()[0])
    arguments.add_argument("script")
    arguments.add_argument("-o", "--output", required=True)
    arguments.add_argument("-I", "--include", action="append", default=[])
    arguments.add_argument("--model")
    options = arguments.parse_args()
    try:
        resources = parse(options.script, options.include)
    except ScriptError as error:
        sys.exit(f"{options.script}: {error}")
    Path(options.output).write_text(emit(resources, Path(options.script).name), encoding="latin-1")
    if options.model:
        model = {kind: {str(k): v for k, v in table.items()} for kind, table in resources.items()}
        Path(options.model).write_text(json.dumps(model, indent=1, sort_keys=True))


if __name__ == "__main__":
    main()

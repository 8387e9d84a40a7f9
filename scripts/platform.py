"""Names each declaration that no static assertion names, and fails where there is one.

Takes headers of the platform layer, "--" and the tests that pin what they declare.
"""

import re
import sys


def text_of(path):
    with open(path, encoding="utf-8") as file:
        text = file.read()
    text = re.sub(r"//[^\n]*|/\*.*?\*/", " ", text, flags=re.DOTALL)
    return re.sub(r"^[ \t]*#[^\n]*", "", text, flags=re.MULTILINE)


def declared_names(path):
    text = re.sub(r'extern "C" \{', "", text_of(path))
    names = []

    def take_braces(match):
        kind, name, items = match.group("kind", "name", "items")
        names.extend([name] if name else [])
        if kind == "enum":
            names.extend(re.findall(r"(?:^|,)\s*(\w+)", items))
        return ";" if name or kind == "enum" else kind

    text = re.sub(
        r"\b(?P<kind>enum|struct)\s*(?P<name>\w*)[^;{()]*\{(?P<items>[^{}]*)\}", take_braces, text)
    text = re.sub(r"\{[^{}]*\}", ";", text)  # bodies of functions
    for statement in text.split(";"):
        function = re.search(r"(\w+)\s*\(", statement)
        if function:
            names.append(function.group(1))
        elif re.match(r"[\s}]*(typedef|extern)\b", statement):
            names.append(re.search(r"(\w+)\s*(\[\w*\]\s*)*$", statement).group(1))
    return dict.fromkeys(names)


def main(arguments):
    middle = arguments.index("--")
    pinned = set()
    for path in arguments[middle + 1:]:
        for statement in text_of(path).split(";"):
            if "static_assert" in statement:
                pinned.update(re.findall(r"\w+", statement))
    failed = False
    for path in arguments[:middle]:
        names = declared_names(path)
        for name in names:
            if name not in pinned:
                print(f"{path}: no static assertion names {name}")
                failed = True
    return 1 if failed else 0


sys.exit(main(sys.argv[1:]))

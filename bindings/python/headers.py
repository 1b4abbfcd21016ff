"""What the .sip files have from tables of the installed headers: the widget's properties, the
comforts and their flags. They are written down in the headers only."""

import os
import re


def read(folders, name):
    for folder in folders:
        path = os.path.join(folder, name)
        if os.path.exists(path):
            with open(path, encoding="utf-8") as file:
                return file.read()
    raise FileNotFoundError(f"{name} is in none of {', '.join(folders)}")


TYPES = {
    "TEXT": ("QString", "const QString&"),
    "FLAG": ("bool", "bool"),
    "NUMBER": ("int", "int"),
}


def properties(folders):
    """Name and kind of each property in ZANDOR_WIDGET_PROPERTIES."""
    text = read(folders, "Zandor/qt/properties.h")
    found = re.findall(r"^    (?:FIELD|PROPERTY)_(TEXT|FLAG|NUMBER)\((\w+)\)", text, re.MULTILINE)
    if not found:
        raise ValueError("Zandor/qt/properties.h has no table ZANDOR_WIDGET_PROPERTIES")
    return [(name, kind) for kind, name in found]


def property_lines(folders):
    lines = []
    for name, kind in properties(folders):
        result, argument = TYPES[kind]
        lines.append(f"    {result} {name}() const;")
        lines.append(f"    void set{name}({argument} value) /ReleaseGIL/;")
    return "\n".join(lines)


def flag_lines(folders):
    """The comforts, each with what the header says of it."""
    text = read(folders, "Zandor/comforts/Flags.h")
    names = re.findall(r"^    bool (\w+) = false;", text, re.MULTILINE)
    if not names:
        raise ValueError("Zandor/comforts/Flags.h has no flags")
    return "\n".join(f"    bool {name};" for name in names)


MARKS = {"@PROPERTIES@": property_lines, "@FLAGS@": flag_lines}


def fill(templates, folders, target):
    """Writes each template into a folder, without ".in" and with the tables in their places."""
    for template in templates:
        with open(template, encoding="utf-8") as file:
            text = file.read()
        for mark, lines in MARKS.items():
            if mark in text:
                text = text.replace(mark, lines(folders))
        name = os.path.basename(template).removesuffix(".in")
        with open(os.path.join(target, name), "w", encoding="utf-8") as file:
            file.write(text)

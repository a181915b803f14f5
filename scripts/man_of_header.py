# SPDX-License-Identifier: Apache-2.0
"""Makes the manual page of a public header from its comments."""
import importlib.machinery
import importlib.util
import pathlib
import re

import mdoc

ROOT = pathlib.Path(__file__).resolve().parent.parent
LOADER = importlib.machinery.SourceFileLoader("contracts", str(ROOT / "tests/check_contracts"))
contracts = importlib.util.module_from_spec(importlib.util.spec_from_loader(LOADER.name, LOADER))
LOADER.exec_module(contracts)

FILE_COMMENT = re.compile(r"/\*\s*\n? ?\*? ?(\w+\.h) - (.*?)\*/", re.DOTALL)
MACRO = re.compile(r"(/\*\*(?:[^*]|\*(?!/))*\*/)\n#define (\w+)(?:\(([^)]*)\))?")
TAG = re.compile(r"^@(param|return|lock|twin)\s+", re.MULTILINE)
ENTRY = re.compile(r"^(?:- | {0,2}\d+\. )")


def plain(comment):
    """The text of a comment without its stars."""
    text = re.sub(r"^/\*+|\*+/$", "", comment.strip())
    return "\n".join(re.sub(r"^ ?\* ?", "", row.rstrip()) for row in text.strip().splitlines())


def blocks(text):
    """The pieces between empty lines; entries of one list make one piece, whatever is between."""
    pieces = []
    for piece in re.split(r"\n[ \t]*\n", text):
        if pieces and ENTRY.match(piece) and ENTRY.match(pieces[-1]):
            pieces[-1] += "\n" + piece
        elif piece.strip():
            pieces.append(piece)
    return pieces


def list_entries(block):
    entries = []
    for row in block.splitlines():
        if ENTRY.match(row):
            entries.append(ENTRY.sub("", row))
        else:
            entries[-1] += " " + row.strip()
    return entries


def is_code(block):
    return all(row.startswith("    ") for row in block.splitlines() if row.strip())


def body(text, first=False):
    """Paragraphs, lists and code of a comment. Whoever has just begun a section says so."""
    for block in blocks(text):
        if ENTRY.match(block):
            kind = "bullet" if block.startswith("- ") else "enum"
            yield from mdoc.items([list(mdoc.paragraph(entry)) for entry in list_entries(block)], kind)
        elif is_code(block):
            yield from mdoc.display("\n".join(row[4:] for row in block.splitlines()))
        else:
            if not first:
                yield ".Pp"
            yield from mdoc.paragraph(block)
        first = False


class Function:
    """A function, or a macro that is used like one, with the parts of its contract."""

    def __init__(self, comment, name, result, arguments):
        self.name, self.result, self.arguments = name, result, arguments
        pieces = TAG.split(plain(comment))
        self.text = pieces[0]
        self.tags = list(zip(pieces[1::2], pieces[2::2]))
        self.twin = next((text.strip() for tag, text in self.tags if tag == "twin"), None)

    def synopsis(self):
        if self.result:
            yield f".Ft {mdoc.quoted(self.result)}"
        yield " ".join([f".Fn {self.name}", *map(mdoc.quoted, self.arguments)])

    def description(self):
        yield f".Ss {self.name}"
        if self.twin:
            yield from mdoc.paragraph(f"Does what {self.twin}() does, without the mutex: the caller holds it.")
            return
        yield from body(self.text, first=True)
        yield from mdoc.tagged(self.parts())

    def parts(self):
        for tag, text in self.tags:
            first, _, rest = text.strip().partition(" ")
            if tag == "param":
                yield first, list(mdoc.paragraph(rest))
            else:
                yield {"return": "Returns", "lock": "Lock"}[tag], list(mdoc.paragraph(text))


class Type:
    """A type or a variable, as it is declared."""

    def __init__(self, comment, declaration):
        self.comment, self.declaration = comment, declaration

    def description(self):
        yield ".Pp"
        yield from body(plain(self.comment), first=True)
        yield from mdoc.display(re.sub(r"\b(ZLV_API|CX_EXTENSION) ", "", self.declaration))


class Constant:
    def __init__(self, comment, name):
        self.comment, self.name = comment, name


class Header:
    """All that one header declares."""

    def __init__(self, path):
        source = path.read_text(encoding="utf-8")
        self.stem = path.stem
        _, about = FILE_COMMENT.search(source).groups()
        pieces = blocks(plain("/*" + about + "*/"))
        summary, _, rest = " ".join(pieces[0].split()).partition(". ")
        self.summary = summary.rstrip(".")
        self.about = "\n\n".join([rest, *pieces[1:]] if rest else pieces[1:])
        self.functions, self.types, self.constants = [], [], []
        for comment, declaration, _ in contracts.items(source):
            self.add(comment, declaration)
        for comment, name, arguments in MACRO.findall(source):
            self.add_macro(comment, name, arguments)

    def add(self, comment, declaration):
        function = contracts.function_of(contracts.strip_comments(declaration))
        if comment is None:
            return
        if function is None:
            self.types.append(Type(comment, declaration))
            return
        name, result, _ = function
        flat = " ".join(contracts.strip_comments(declaration).split()).split("{")[0]
        inside = re.search(rf"\b{name} ?\((.*)\)", re.sub(r"CX_PRINTF\([^)]*\)", "", flat)).group(1)
        self.functions.append(Function(comment, name, result, contracts.split_arguments(inside)))

    def add_macro(self, comment, name, arguments):
        if arguments:
            self.functions.append(Function(comment, name, "", contracts.split_arguments(arguments)))
        else:
            self.constants.append(Constant(comment, name))

    def names(self):
        return [function.name for function in self.functions]

    def page(self, date, references):
        yield from mdoc.head(self.stem, 3, date, [self.stem, *self.names()], self.summary)
        yield ".Sh LIBRARY"
        yield "zelvo (libzelvo, \\-lzelvo)"
        yield ".Sh SYNOPSIS"
        yield ".In zelvo.h"
        for function in self.functions:
            yield from function.synopsis()
        yield ".Sh DESCRIPTION"
        yield from body(self.about or self.summary[0].upper() + self.summary[1:] + ".", first=True)
        for function in self.functions:
            yield from function.description()
        if self.types:
            yield ".Sh TYPES"
            yield "As the header declares them."
            for entry in self.types:
                yield from entry.description()
        if self.constants:
            yield ".Sh CONSTANTS"
            yield from mdoc.tagged([(entry.name, list(mdoc.paragraph(plain(entry.comment))))
                                    for entry in self.constants])
        yield from mdoc.see_also(references)

# SPDX-License-Identifier: Apache-2.0
"""What the three generators of container families share: from a family and the operations of its
kind, the C header with its contracts and the thin C functions over the C++ template."""

import argparse
import pathlib
import string
import subprocess
import textwrap
from dataclasses import dataclass, field

ROOT = pathlib.Path(__file__).resolve().parent.parent
WIDTH = 100

# The forms in which an operation is exported.
TWINS = "twins"  # Zlv..., which takes the API mutex, and zlvIntl..., whose caller holds it
PUBLIC = "public"  # Zlv... only, which takes the API mutex
UNLOCKED = "unlocked"  # Zlv... only, which takes no lock
INTERNAL = "internal"  # zlvIntl... only


@dataclass
class Family:
    """One container type. Texts and code may use $Type for its name and the words of its kind."""

    name: str
    about: str
    element: str  # the type that is stored and handed out
    given: str  # the type that callers pass in
    take_in: str  # C++ expressions over `element`, in the manner of the traits of the template
    hand_out: str
    let_go: str
    copied: str  # contract: what storing an element means
    handed: str  # contract: what the caller owes for an element handed out
    same: str = ""  # C++ expression over `a` and `b`; maps compare keys instead
    equal: str = ""  # contract: when two elements are equal
    compared: str = ""  # contract: what a sort's comparison is given pointers to
    deferred: bool = False  # letting go runs class functions, so memory waits for the mutex
    include: str = ""  # header of the element's type
    uses: list = field(default_factory=list)  # headers of the traits' functions


@dataclass
class Operation:
    """One function. NAME is what follows Zlv or zlvIntl, CALL the C++ expression that does it."""

    name: str
    result: str
    parameters: list  # (C declaration, contract)
    text: str
    returns: str
    call: str
    forms: str = TWINS

    def arguments(self):
        return ", ".join(split_declarator(declaration)[1] for declaration, _ in self.parameters)


def split_declarator(declaration):
    """('char *', 'key') of 'char *key'; a pointer to function is cut around its name."""
    if "(*" in declaration:
        return declaration, declaration.split("(*")[1].split(")")[0]
    name = declaration.replace("*", " ").split()[-1]
    return declaration[: -len(name)], name


@dataclass
class Kind:
    """What one generator knows: its families, their operations and the shape of the records."""

    generator: str  # file name of the generator
    word: str  # list, group or map
    impl: str  # the C++ template
    promises: str  # opening comment of each header
    header_fields: list  # (declaration, contract)
    node_fields: list
    operations: list
    families: list


def fill(text, kind, family):
    """Puts the words of FAMILY and of its KIND into TEXT."""
    words = dict(vars(family), Type=family.name, word=kind.word)
    return string.Template(text).substitute(words)


def wrap(prefix, text, hanging=""):
    return textwrap.wrap(text, WIDTH, initial_indent=prefix, break_on_hyphens=False,
                         subsequent_indent=" * " + hanging)


def contract(operation):
    """The comment above a declaration."""
    locks = {TWINS: "takes the API mutex", PUBLIC: "takes the API mutex", UNLOCKED: "none",
             INTERNAL: "the caller holds the API mutex"}
    names = [split_declarator(declaration)[1] for declaration, _ in operation.parameters]
    pad = max(map(len, names), default=0)
    lines = ["/**", *wrap(" * ", operation.text), " *"]
    for name, (_, text) in zip(names, operation.parameters):
        lead = f"@param {name.ljust(pad)}  "
        lines += wrap(" * " + lead, text, " " * len(lead))
    if operation.returns:
        lines += wrap(" * ", "@return " + operation.returns, " " * 8)
    return lines + [f" * @lock {locks[operation.forms]}", " */"]


def prototype(operation, prefix):
    parameters = ", ".join(declaration for declaration, _ in operation.parameters) or "void"
    gap = "" if operation.result.endswith("*") else " "
    return f"{operation.result}{gap}{prefix}{operation.name}({parameters})"


def declarations(operation):
    """Lines of the header for one operation in each of its forms."""
    prefix = "zlvIntl" if operation.forms == INTERNAL else "Zlv"
    lines = [*contract(operation), f"ZLV_API {prototype(operation, prefix)};"]
    if operation.forms == TWINS:
        lines += [f"/** @twin Zlv{operation.name} */",
                  f"ZLV_API {prototype(operation, 'zlvIntl')};"]
    return lines + [""]


def locked(operation, call):
    """The body of a call under the API mutex; without the mutex it gives its nothing value."""
    if operation.result == "void":
        return ["ApiLock lock;", "if (lock)", f"{call};"]
    if operation.result == "ZlvBool":
        return ["ApiLock lock;", f"return lock && {call};"]
    return ["ApiLock lock;", f"return lock ? {call} : nullptr;"]


def definitions(operation):
    """Lines of the source for one operation in each of its forms."""
    plain = f"{operation.call};" if operation.result == "void" else f"return {operation.call};"
    twin = f"zlvIntl{operation.name}({operation.arguments()})"
    bodies = {
        TWINS: [("zlvIntl", [plain]), ("Zlv", locked(operation, twin))],
        PUBLIC: [("Zlv", locked(operation, operation.call))],
        UNLOCKED: [("Zlv", [plain])],
        INTERNAL: [("zlvIntl", [plain])],
    }
    lines = []
    for prefix, body in bodies[operation.forms]:
        lines += [prototype(operation, prefix), "{", *body, "}", ""]
    return lines


def record(name, comment, fields):
    return [*wrap("/** ", comment + " */"), f"struct {name} {{",
            *(f"{declaration}; /**< {text} */" for declaration, text in fields), "};", ""]


def header(kind, family, operations):
    guard = "ZLV" + "".join("_" + c if c.isupper() else c for c in family.name).upper() + "_H"
    node = family.name + "Node"
    includes = [f'#include "{name}"' for name in ["ZlvTypes.h", family.include] if name]
    paragraphs = [f"Zlv{family.name}.h - {family.about}", *kind.promises.split("\n"),
                  *([DEFERRED] if family.deferred else [])]
    comment = []
    for paragraph in paragraphs:
        comment += [" *", *wrap(" * ", fill(paragraph, kind, family))]
    lines = [
        "/* SPDX-License-Identifier: Apache-2.0 */",
        f"/* Made by scripts/{kind.generator}; do not edit. */",
        "/*", *comment[1:], " */",
        f"#ifndef {guard}", f"#define {guard}", "", *includes, "", "CX_BEGIN_DECLS", "",
        *wrap("/** ", f"A place in a {kind.word} that holds one element. */"),
        f"typedef struct {node} {node};",
        f"/** A walk over a {kind.word}: the node it stands on, or null. */",
        f"typedef {node} *{family.name}Iterator;", "",
        *record(family.name, f"Header of a {kind.word}.", kind.header_fields),
        *record(node, f"Node of a {kind.word}.", kind.node_fields)]
    lines = [fill(line, kind, family) for line in lines]
    for operation in operations:
        lines += declarations(operation)
    return "\n".join([*lines, "CX_END_DECLS", "", "#endif", ""])


DEFERRED = (
    "Removing may run class functions, which may remove nodes in turn. So a removed node keeps its "
    "neighbours and stays readable, and its memory is freed only when the API mutex is released.")


def source(kind, family, operations):
    deferred = "true" if family.deferred else "false"
    includes = "\n".join(f'#include "{name}"' for name in sorted(
        [f"Zlv{kind.impl}.h", "ZlvOwned.h", *family.uses]))
    functions = [("$element", "takeIn($given element)", family.take_in),
                 ("$element", "handOut($element element)", family.hand_out),
                 ("void", "letGo($element element)", family.let_go)]
    if family.same:
        functions.append(("bool", "same($given a, $given b)", family.same))
    traits = "\n".join(
        f"static {result} {name} {{ {'' if result == 'void' else 'return '}{body}; }}"
        for result, name, body in functions)
    lines = fill(f"""// SPDX-License-Identifier: Apache-2.0
// Made by scripts/{kind.generator}; do not edit.
#include "Zlv$Type.h"

{includes}

using zelvo::ApiLock;

namespace {{

/// How elements come in, are handed out and go.
struct Traits {{
using Header = $Type;
using Node = ${{Type}}Node;
using Element = $element;
using Given = $given;
static constexpr bool deferred = {deferred};

{traits}
}};

using Impl = zelvo::{kind.impl}<Traits>;

}} // namespace
""", kind, family).split("\n")
    for operation in operations:
        lines += definitions(operation)
    return "\n".join(lines)


def filled_operations(kind, family):
    def words(text):
        return fill(text, kind, family)

    return [Operation(words(o.name), words(o.result),
                      [(words(declaration), words(text)) for declaration, text in o.parameters],
                      words(o.text), words(o.returns), words(o.call), o.forms)
            for o in kind.operations]


def write_formatted(path, text):
    """Writes TEXT in the house's layout."""
    style = f"--style=file:{ROOT / '.clang-format'}"
    command = ["clang-format-14", style, f"--assume-filename={path.name}"]
    result = subprocess.run(command, input=text, capture_output=True, text=True, check=True)
    path.parent.mkdir(parents=True, exist_ok=True)
    path.write_text(result.stdout)


def generate(kind):
    """Main program of a generator: writes the header and the source of each family."""
    parser = argparse.ArgumentParser(description=f"Writes the families of {kind.word}s.")
    parser.add_argument("--into", type=pathlib.Path, default=ROOT,
                        help="folder that gets include/ and src/util/ (default: this tree)")
    into = parser.parse_args().into
    for family in kind.families:
        operations = filled_operations(kind, family)
        write_formatted(into / f"include/Zlv{family.name}.h", header(kind, family, operations))
        write_formatted(into / f"src/util/Zlv{family.name}.cpp", source(kind, family, operations))

# SPDX-License-Identifier: Apache-2.0
"""Writes text in the language of manual pages, a sentence to a line."""
import re
import textwrap

SENTENCE = re.compile(r"(?<=[.!?:;])(?<!e\.g\.)(?<! \.\.\.)\s+(?=[A-Z\"'(*`\\])")
# Names with parentheses, of functions and of manual pages, are set in bold; mdoc would have each on
# a line of its own.
NAME = re.compile(r"\b([A-Za-z_]\w*)\(\)")
MARKUP = re.compile(r"\x01(\w)|\x02")
BOLD, ITALIC, PLAIN = "\x01B", "\x01I", "\x02"


def escape(text):
    """A run of text in which nothing is a command; marks of fonts become such."""
    text = NAME.sub(BOLD + r"\1" + PLAIN + "()", text)
    for plain, command in (("\\", "\\e"), ("-", "\\-"), ("`", "\\(ga"), ("^", "\\(ha"), ("~", "\\(ti")):
        text = text.replace(plain, command)
    text = "".join(c if ord(c) < 128 else f"\\[u{ord(c):04X}]" for c in text)
    return MARKUP.sub(lambda mark: f"\\f{mark.group(1)}" if mark.group(1) else "\\fP", text)


def line(text):
    return "\\&" + text if text.startswith((".", "'")) else text


def paragraph(text):
    """The lines of one paragraph."""
    for sentence in SENTENCE.split(" ".join(text.split())):
        for part in textwrap.wrap(
                escape(sentence), 78, break_long_words=False, break_on_hyphens=False):
            yield line(part)


def display(text):
    """Lines that are shown as they are."""
    yield ".Bd -literal -offset indent"
    for row in text.strip("\n").splitlines():
        yield line(escape(row)) if row.strip() else ""
    yield ".Ed"


def quoted(argument):
    """One argument of a command."""
    return '"' + escape(argument).replace('"', '\\(dq') + '"'


def tagged(entries):
    """A list of pairs: what is described, and the lines that do."""
    yield ".Bl -tag -width Ds"
    for tag, lines in entries:
        yield f".It {quoted(tag)}"
        yield from lines
    yield ".El"


def items(entries, kind):
    """A list of entries, each of some lines; the kind is "bullet" or "enum"."""
    yield f".Bl -{kind}"
    for lines in entries:
        yield ".It"
        yield from lines
    yield ".El"


def head(title, section, date, names, summary):
    yield '.\\" SPDX-License-Identifier: Apache-2.0'
    yield f".Dd {date}"
    yield f".Dt {title.upper()} {section}"
    yield ".Os"
    yield ".Sh NAME"
    for name in names[:-1]:
        yield f".Nm {escape(name)} ,"
    yield f".Nm {escape(names[-1])}"
    yield ".Nd " + escape(summary).replace('"', "\\(dq")


def see_also(references):
    yield ".Sh SEE ALSO"
    ordered = sorted(set(references), key=lambda entry: (entry[1], entry[0].lower()))
    for name, section in ordered[:-1]:
        yield f".Xr {name} {section} ,"
    yield f".Xr {ordered[-1][0]} {ordered[-1][1]}"

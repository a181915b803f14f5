# SPDX-License-Identifier: Apache-2.0
"""Makes a manual page of pages of the documentation."""
import re

import mdoc

LINK = re.compile(r"\[([^\]]+)\]\(([^)]*)\)")
CODE = re.compile(r"`([^`]+)`")
STRONG = re.compile(r"\*\*([^*]+)\*\*")
EMPHASIS = re.compile(r"(?<![\w*])\*([^*\s][^*]*)\*(?![\w*])")
ITEM = re.compile(r"^(?:- |\d+\. )")


class Page:
    """Headings, paragraphs, lists, tables and code of pages, one after another."""

    def __init__(self, paths, manuals, introduction=""):
        self.paths, self.manuals, self.introduction = paths, manuals, introduction
        self.references = set()

    def inline(self, text):
        kept = []

        def keep(match):
            kept.append(match.group(1))
            return f"\x03{len(kept) - 1}\x04"

        text = CODE.sub(keep, text)
        text = LINK.sub(self.link, text)
        text = STRONG.sub(rf"{mdoc.BOLD}\1{mdoc.PLAIN}", text)
        text = EMPHASIS.sub(rf"{mdoc.ITALIC}\1{mdoc.PLAIN}", text)
        return re.sub("\x03(\\d+)\x04", lambda m: kept[int(m.group(1))], text)

    def link(self, match):
        text, target = match.groups()
        manual = self.manuals.get(target.split("#")[0])
        if manual is None:
            return text
        self.references.add(manual)
        name, section = manual
        shown = "" if text.endswith(".md") else text + ", "
        return f"{shown}{mdoc.BOLD}{name}{mdoc.PLAIN}({section})"

    def paragraph(self, text):
        return list(mdoc.paragraph(self.inline(" ".join(text.split()))))

    def items(self, rows):
        entries = []
        for row in rows:
            if ITEM.match(row):
                entries.append(ITEM.sub("", row))
            else:
                entries[-1] += " " + row.strip()
        kind = "bullet" if rows[0].startswith("- ") else "enum"
        return mdoc.items([self.paragraph(entry) for entry in entries], kind)

    def table(self, rows):
        """Each row becomes an entry named by its property, or else by its first cell."""
        cells = [[cell.strip() for cell in re.split(r"(?<!\\)\|", row.strip().strip("|"))] for row in rows]
        heads, lines = cells[0], cells[2:]
        named = heads.index("Property") if "Property" in heads else 0
        return mdoc.tagged((self.inline(line[named]), self.row(heads, line, named)) for line in lines)

    def row(self, heads, cells, named):
        """An effect goes first and needs no head, nor does the only cell beside the name."""
        rest = [(head, cell) for index, (head, cell) in enumerate(zip(heads, cells)) if index != named and cell]
        if heads[-1] == "Effect":
            rest = rest[-1:] + rest[:-1]
        lines = []
        for head, cell in rest:
            has_head = head != "Effect" and len(heads) > 2
            lines += [".br"] if lines else []
            lines += self.paragraph(f"{head}: {cell}." if has_head else sentence(cell))
        return lines

    def body(self):
        for path in self.paths:
            yield from self.page(path.read_text(encoding="utf-8").splitlines(), path is self.paths[0])

    def page(self, rows, is_first):
        fresh, position = True, 0
        if is_first:
            yield ".Sh DESCRIPTION"
            yield from self.paragraph(self.introduction)
            fresh = not self.introduction
        while position < len(rows):
            start = rows[position]
            end = self.end_of(rows, position)
            block = rows[position:end]
            position = end
            if not start.strip():
                continue
            if start.startswith("#"):
                heading = self.heading(start, is_first)
                yield from heading
                fresh = fresh or bool(heading)
                continue
            yield from self.block(start, block, fresh)
            fresh = False

    def heading(self, row, is_first):
        marks, _, text = row.partition(" ")
        if marks == "#" and is_first:
            return []
        level = ".Ss" if len(marks) > 2 else ".Sh"
        text = CODE.sub(r"\1", text)
        return [f"{level} {mdoc.escape(text)}"]

    def block(self, start, block, fresh):
        if start.startswith("```"):
            yield from mdoc.display("\n".join(block[1:-1]))
        elif start.startswith("|"):
            yield from self.table(block)
        elif ITEM.match(start):
            yield from self.items(block)
        else:
            if not fresh:
                yield ".Pp"
            yield from self.paragraph(" ".join(block))

    @staticmethod
    def end_of(rows, position):
        """The row after the block that begins at POSITION."""
        start, end = rows[position], position + 1
        if start.startswith("```"):
            while not rows[end].startswith("```"):
                end += 1
            return end + 1
        if start.startswith("#") or not start.strip():
            return end
        while end < len(rows) and rows[end].strip() and not rows[end].startswith(("```", "#")):
            end += 1
        return end


def sentence(text):
    text = text[0].upper() + text[1:] if text[:1].isalpha() else text
    return text if text.endswith((".", "!", "?")) else text + "."

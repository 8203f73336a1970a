"""What the tests of docs/ share: pages, their blocks and tables, and a list of faults."""

import pathlib
import re
import sys

ROOT = pathlib.Path(__file__).resolve().parents[2]
DOCS = ROOT / "docs"


def read(path):
    """Returns: the text of a file, named from the root of the repository."""
    return (ROOT / path).read_text(encoding="utf-8")


def find_blocks(text):
    """Finds the fenced blocks of a page.

    Returns: for each its language, what the comment in the line above it says ("" without one), and
    its text.
    """
    pattern = re.compile(r"(?:^<!-- ([^\n]*) -->\n)?^```(\w*)\n(.*?)^```$", re.M | re.S)
    return [(match[2], match[1] or "", match[3]) for match in pattern.finditer(text)]


def find_rows(text, *heads):
    """Returns: the rows of all tables whose heads begin with `heads`, each a list of cells."""
    rows = []
    inside = False
    for line in text.split("\n"):
        if not line.startswith("|"):
            inside = False
            continue
        cells = [cell.strip() for cell in re.split(r"(?<!\\)\|", line)[1:-1]]
        if inside:
            rows.append(cells)
        elif tuple(cells[:len(heads)]) == heads:
            inside = None
        elif inside is None:
            inside = True
    return rows


def find_codes(cell):
    """Returns: what stands between backticks in a cell."""
    return re.findall(r"`([^`]*)`", cell)


def compare(what, there, told):
    """Returns: a fault for each name that only one of the two sets has."""
    return ([f"{what}: {name} is not told" for name in sorted(set(there) - set(told))] +
            [f"{what}: {name} is told, but there is no such thing"
             for name in sorted(set(told) - set(there))])


def finish(faults):
    """Prints the faults and ends the test."""
    for fault in faults:
        print(fault)
    sys.exit(1 if faults else 0)

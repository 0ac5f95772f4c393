"""Tables for people, which are Markdown too."""

import sys


def line(cells, widths):
    first, *others = (cell.ljust(width) if i == 0 else cell.rjust(width)
                      for i, (cell, width) in enumerate(zip(cells, widths, strict=True)))
    return "| " + " | ".join([first, *others]) + " |"


def show(title, heads, rows):
    widths = [max(len(row[i]) for row in [heads, *rows]) for i in range(len(heads))]
    print(f"\n{title}\n")
    print(line(heads, widths))
    print("|" + "|".join("-" * (width + 1) + ("-" if i == 0 else ":")
                         for i, width in enumerate(widths)) + "|")
    for row in rows:
        print(line(row, widths))
    sys.stdout.flush()


def judged(value, goal):
    """The goal and whether the value keeps it."""
    if goal is None:
        return ""
    return f"≤ {goal:g} {'met' if value <= goal else 'missed'}"

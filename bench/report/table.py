"""The table of all cases, as text and as Markdown."""

import statistics

from .cases import spread, with_unit

HEADINGS = ("What", "Ours", "Compared with", "Peer", "Ratio", "Quartiles", "Noise of the peer")


def rows(cases):
    for case in cases:
        low, middle, high = case.ratio()
        yield (f"{case.benchmark}, {case.name}", with_unit(statistics.median(case.ours), case.unit),
               case.peer_name, with_unit(statistics.median(case.peer), case.unit),
               f"{middle:.2f}", f"{low:.2f} to {high:.2f}", f"{spread(case.peer):.0%}")


def text(cases):
    """Returns the table with aligned columns, for a terminal."""
    table = [HEADINGS, *rows(cases)]
    widths = [max(map(len, column)) for column in zip(*table)]
    return "\n".join("  ".join(cell.ljust(width) for cell, width in zip(row, widths)).rstrip()
                     for row in table)


def markdown(cases):
    table = [HEADINGS, ("---",) * len(HEADINGS), *rows(cases)]
    return "\n".join("| " + " | ".join(row) + " |" for row in table)

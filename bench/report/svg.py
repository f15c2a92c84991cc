"""Draws charts as SVG. Their colours follow the reader's light or dark colour scheme."""

import html
import math

PANEL_WIDTH, PANEL_HEIGHT = 460, 320
LEFT, RIGHT, TOP, BOTTOM = 74, 16, 64, 46
_SERIES = (("#0b62c4", "#66aaff"), ("#b3470b", "#ff9d5c"))  # for a light and a dark colour scheme
_DASHES = ("", "6 4")


def _colours(number, ground, ink, faint):
    """Returns CSS rules. `number` is 0 for a light colour scheme, and 1 for a dark one."""
    series = "".join(f".stroke{index} {{ stroke: {pair[number]}; }} "
                     f".fill{index} {{ fill: {pair[number]}; }} "
                     for index, pair in enumerate(_SERIES))
    return (f".ground {{ fill: {ground}; }} text {{ fill: {ink}; }} .axis {{ stroke: {ink}; }} "
            f".grid {{ stroke: {faint}; }} {series}")


# Colours come from classes, because some SVG viewers do not support CSS variables.
_STYLE = f"""
text {{ font: 12px sans-serif; }} .title {{ font-weight: bold; font-size: 13px; }}
.line {{ fill: none; stroke-width: 2; }} .bar {{ stroke-width: 1.5; }}
{_colours(0, "#ffffff", "#1b1f24", "#d5d9de")}
@media (prefers-color-scheme: dark) {{ {_colours(1, "#15191f", "#e3e8ee", "#3a424c")} }}
"""


def document(width, height, parts, title):
    return (f'<svg xmlns="http://www.w3.org/2000/svg" width="{width}" height="{height}" '
            f'viewBox="0 0 {width} {height}" role="img" aria-label="{html.escape(title)}">\n'
            f"<title>{html.escape(title)}</title>\n<style>{_STYLE}</style>\n"
            f'<rect class="ground" width="{width}" height="{height}"/>\n' + "\n".join(parts)
            + "\n</svg>\n")


def text(x, y, words, anchor="start", kind="", turn=0):
    turned = f' transform="rotate({turn} {x:.1f} {y:.1f})"' if turn else ""
    named = f' class="{kind}"' if kind else ""
    return (f'<text x="{x:.1f}" y="{y:.1f}" text-anchor="{anchor}"{named}{turned}>'
            f"{html.escape(words)}</text>")


def rule(x1, y1, x2, y2, kind):
    return f'<line x1="{x1:.1f}" y1="{y1:.1f}" x2="{x2:.1f}" y2="{y2:.1f}" class="{kind}"/>'


def error_bar(x, low, high, series):
    """Returns a bar with a cap at each end."""
    kind = f"bar stroke{series}"
    return "".join((rule(x, low, x, high, kind), rule(x - 4, low, x + 4, low, kind),
                    rule(x - 4, high, x + 4, high, kind)))


def dot(x, y, series):
    return f'<circle cx="{x:.1f}" cy="{y:.1f}" r="3.5" class="fill{series}"/>'


def line(points, series):
    path = " ".join(f"{x:.1f},{y:.1f}" for x, y in points)
    dashes = f' stroke-dasharray="{_DASHES[series]}"' if _DASHES[series] else ""
    return f'<polyline points="{path}" class="line stroke{series}"{dashes}/>'


class LogScale:
    """A logarithmic scale. Maps values between `low` and `high` to positions between `start` and
    `end`."""

    def __init__(self, low, high, start, end):
        self._low, self._high = math.log10(low), math.log10(high)
        if self._low == self._high:
            self._low, self._high = self._low - 0.5, self._high + 0.5
        self._start, self._end = start, end

    def __call__(self, value):
        part = (math.log10(value) - self._low) / (self._high - self._low)
        return self._start + part * (self._end - self._start)

    def ticks(self):
        """Returns the powers of ten in the range or, if the range is short, the numbers in the range
        that are 1, 2 or 5 times a power of ten."""
        steps = (1,) if self._high - self._low > 2.2 else (1, 2, 5)
        powers = range(math.floor(self._low), math.ceil(self._high) + 1)
        values = (step * 10.0 ** power for power in powers for step in steps)
        return [value for value in values
                if self._low - 1e-9 <= math.log10(value) <= self._high + 1e-9]

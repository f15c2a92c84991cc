"""Plots of time or memory against the number of models or devices, and of each case's noise."""

from . import svg
from .cases import quartiles, spread, with_unit
from .svg import BOTTOM, LEFT, PANEL_HEIGHT, PANEL_WIDTH, RIGHT, TOP, LogScale

PANELS_IN_A_ROW = 2
NOISE_ROW, NOISE_NAMES, NOISE_WIDTH = 20, 470, 920


def cost(cases, axis):
    """Returns an SVG with a panel for each benchmark that has at least two cases along `axis`, or
    None if no benchmark has two.

    Points are medians, and bars reach from the lower to the upper quartile. Both axes are
    logarithmic.
    """
    benchmarks = {}
    for case in cases:
        if case.axis == axis:
            benchmarks.setdefault(case.benchmark, []).append(case)
    panels = [group for group in benchmarks.values() if len(group) > 1]
    if not panels:
        return None
    parts = []
    for index, group in enumerate(panels):
        x = index % PANELS_IN_A_ROW * PANEL_WIDTH
        y = index // PANELS_IN_A_ROW * PANEL_HEIGHT
        parts += [f'<g transform="translate({x} {y})">', *_panel(group, axis), "</g>"]
    width = min(len(panels), PANELS_IN_A_ROW) * PANEL_WIDTH
    height = -(-len(panels) // PANELS_IN_A_ROW) * PANEL_HEIGHT
    return svg.document(width, height, parts, f"Cost against the number of {axis}")


def _panel(group, axis):
    series = [("Onramp", [(case.size, case.ours) for case in group]),
              (group[0].peer_name, [(case.size, case.peer) for case in group])]
    ends = [end for _, points in series for _, values in points
            for end in (quartiles(values)[0], quartiles(values)[2])]
    sizes = [case.size for case in group]
    x = LogScale(min(sizes), max(sizes), LEFT + 12, PANEL_WIDTH - RIGHT - 12)
    y = LogScale(min(ends) / 1.3, max(ends) * 1.3, PANEL_HEIGHT - BOTTOM, TOP)
    parts = [svg.text(LEFT, 20, group[0].benchmark, kind="title")]
    parts += _axes(x, y, group[0].unit, axis)
    for number, (name, points) in enumerate(series):
        left = LEFT + number * 110
        parts += [svg.line([(left, 40), (left + 26, 40)], number), svg.dot(left + 13, 40, number),
                  svg.text(left + 32, 44, name)]
        quarters = [(x(size), *map(y, quartiles(values))) for size, values in points]
        parts.append(svg.line([(at, middle) for at, _, middle, _ in quarters], number))
        for at, low, middle, high in quarters:
            aside = at + 4 * number - 2  # keeps the bars of the two series apart
            parts += [svg.error_bar(aside, low, high, number), svg.dot(at, middle, number)]
    return parts


def _axes(x, y, unit, axis):
    bottom, right = PANEL_HEIGHT - BOTTOM, PANEL_WIDTH - RIGHT
    parts = []
    for value in y.ticks():
        parts += [svg.rule(LEFT, y(value), right, y(value), "grid"),
                  svg.text(LEFT - 6, y(value) + 4, with_unit(value, unit), anchor="end")]
    for value in x.ticks():
        parts += [svg.rule(x(value), TOP, x(value), bottom, "grid"),
                  svg.text(x(value), bottom + 16, f"{value:,.0f}", anchor="middle")]
    parts += [svg.rule(LEFT, bottom, right, bottom, "axis"),
              svg.rule(LEFT, TOP, LEFT, bottom, "axis")]
    parts.append(svg.text((LEFT + right) / 2, bottom + 36, f"number of {axis}", anchor="middle"))
    name = "time" if unit == "s" else "memory"
    parts.append(svg.text(14, (TOP + bottom) / 2, name, anchor="middle", turn=-90))
    return parts


def noise(cases):
    """Returns an SVG that shows, for each case, the spread() of Onramp's values and of the peer's."""
    spreads = [(f"{case.benchmark}, {case.name}", spread(case.ours), spread(case.peer))
               for case in cases]
    most = max(0.05, *(max(ours, peer) for _, ours, peer in spreads))
    height = 76 + NOISE_ROW * len(spreads) + 34
    bottom = height - 40

    def at(part):
        return NOISE_NAMES + part / most * (NOISE_WIDTH - NOISE_NAMES - 30)

    parts = [svg.text(16, 20, "Noise: how much repeated measurements differ",
                      kind="title")]
    for series, name in enumerate(("Onramp", "peer")):
        parts += [svg.dot(NOISE_NAMES + series * 90, 40, series),
                  svg.text(NOISE_NAMES + series * 90 + 8, 44, name)]
    step = next((step for step in (0.01, 0.02, 0.05, 0.1, 0.2, 0.5) if most / step <= 8), 1)
    for number in range(int(most / step) + 1):
        part = number * step
        parts += [svg.rule(at(part), 56, at(part), bottom, "grid"),
                  svg.text(at(part), bottom + 16, f"{part:.0%}", anchor="middle")]
    for row, (name, ours, peer) in enumerate(spreads):
        y = 72 + row * NOISE_ROW
        parts += [svg.text(NOISE_NAMES - 10, y + 4, name, anchor="end"),
                  svg.dot(at(ours), y - 2, 0), svg.dot(at(peer), y + 2, 1)]
    parts.append(svg.text((NOISE_NAMES + NOISE_WIDTH) / 2, bottom + 34,
                          "interquartile range, as a share of the median", anchor="middle"))
    return svg.document(NOISE_WIDTH, height, parts, "Noise of the benchmarks")

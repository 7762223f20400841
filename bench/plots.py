"""The plots of docs/performance.md, as SVG that follows the reader's light or dark scheme."""

import html
import math

import tables

WIDTH = 760
HEIGHT = 420
FONT = "font-family:system-ui,sans-serif;font-size:14px"
STYLE = """
  .paper { fill: #ffffff } .ink { fill: #1f2328 } .faint { fill: #59636e } .grid { stroke: #d1d9e0 }
  .axis { stroke: #59636e } .line { fill: none; stroke-width: 2.5 }
  .s0 { stroke: #0a66c2 } .s1 { stroke: #b35900 } .s2 { stroke: #1a7f37 } .s3 { stroke: #8250df }
  .f0 { fill: #0a66c2 } .f1 { fill: #b35900 } .f2 { fill: #1a7f37 } .f3 { fill: #8250df }
  @media (prefers-color-scheme: dark) {
    .paper { fill: #0d1117 } .ink { fill: #e6edf3 } .faint { fill: #9198a1 } .grid { stroke: #30363d }
    .axis { stroke: #9198a1 }
    .s0 { stroke: #58a6ff } .s1 { stroke: #f0a04b } .s2 { stroke: #56d364 } .s3 { stroke: #bc8cff }
    .f0 { fill: #58a6ff } .f1 { fill: #f0a04b } .f2 { fill: #56d364 } .f3 { fill: #bc8cff }
  }
"""


def text(x, y, words, kind="ink", anchor="start", extra=""):
    return f'<text x="{x:.1f}" y="{y:.1f}" class="{kind}" text-anchor="{anchor}"{extra}>{html.escape(words)}</text>'


def line(x1, y1, x2, y2, kind):
    return f'<line x1="{x1:.1f}" y1="{y1:.1f}" x2="{x2:.1f}" y2="{y2:.1f}" class="{kind}"/>'


def rectangle(x, y, width, height, kind, extra=""):
    return f'<rect x="{x:.1f}" y="{y:.1f}" width="{width:.1f}" height="{height:.1f}" class="{kind}"{extra}/>'


def document(title, height, parts):
    return "\n".join([
        f'<svg xmlns="http://www.w3.org/2000/svg" viewBox="0 0 {WIDTH} {height}" width="{WIDTH}" height="{height}"'
        f' style="{FONT}" role="img">',
        f"<title>{html.escape(title)}</title>",
        f"<style>{STYLE}</style>",
        rectangle(0, 0, WIDTH, height, "paper"),
        text(24, 32, title, extra=' style="font-size:17px;font-weight:600"'),
        *parts,
        "</svg>",
    ]) + "\n"


def ticks(largest, about):
    """Round steps from 0 to at least @p largest."""
    raw = largest / about
    power = 10 ** math.floor(math.log10(raw))
    step = next(factor * power for factor in (1, 2, 5, 10) if factor * power >= raw)
    return [step * i for i in range(math.ceil(largest / step - 1e-9) + 1)]


def growth(run):
    """Time against the length of the list that grows."""
    series = [
        ("short video descriptors: compose", "growth/compose_video"),
        ("priority list: compose", "growth/compose_priority"),
        ("short audio descriptors: compose", "growth/compose_audio"),
        ("short video descriptors: decode", "growth/decode_video"),
    ]
    lines = [(label, run.series(family)) for label, family in series]
    left, right, top, bottom = 78, WIDTH - 24, 110, HEIGHT - 58
    x_ticks = ticks(max(length for _, points in lines for length, _ in points), 8)
    y_ticks = ticks(max(time for _, points in lines for _, time in points) / 1000, 6)

    def x(length):
        return left + (right - left) * length / x_ticks[-1]

    def y(time):
        return bottom - (bottom - top) * time / y_ticks[-1]

    parts = []
    for tick in y_ticks:
        parts += [line(left, y(tick), right, y(tick), "grid"),
                  text(left - 10, y(tick) + 5, f"{tick:g}", "faint", "end")]
    for tick in x_ticks:
        parts += [line(x(tick), bottom, x(tick), bottom + 5, "axis"),
                  text(x(tick), bottom + 22, f"{tick:g}", "faint", "middle")]
    parts.append(line(left, bottom, right, bottom, "axis"))
    parts.append(text((left + right) / 2, HEIGHT - 14, "length of the list, entries", "ink", "middle"))
    middle = (top + bottom) / 2
    parts.append(text(24, middle, "processor time, µs", "ink", "middle", f' transform="rotate(-90 24 {middle:.1f})"'))
    for index, (label, points) in enumerate(lines):
        path = " ".join(f"{x(length):.1f},{y(time / 1000):.1f}" for length, time in points)
        parts.append(f'<polyline points="{path}" class="line s{index}"/>')
        parts += [f'<circle cx="{x(length):.1f}" cy="{y(time / 1000):.1f}" r="3.5" class="f{index}"/>'
                  for length, time in points]
        column, row = index % 2, index // 2
        parts += [rectangle(left + column * 330, 52 + row * 24, 18, 5, f"f{index}"),
                  text(left + column * 330 + 26, 60 + row * 24, label)]
    return document("Cost against list length", HEIGHT, parts)


def road(run, sink):
    """Where the time of one composition goes: its stages, with the share of their heap calls."""
    rows = []
    for stage, label, of_sink in tables.STAGES:
        name = tables.stage_name(stage, of_sink, sink)
        rows.append((label, run.time(name) / 1000, run.heap_floor(run.counter(name, "allocations")) / 1000))
    whole = run.time(f"compose/with_store/{sink}") / 1000
    left, right, top, step, thick = 200, WIDTH - 96, 96, 36, 22
    bottom = top + step * len(rows)
    scale = ticks(max(time for _, time, _ in rows), 6)

    def x(time):
        return left + (right - left) * time / scale[-1]

    parts = [rectangle(left, 54, 14, 14, "f1"), text(left + 22, 66, "its heap calls (floor)"),
             rectangle(left + 210, 54, 14, 14, "f0"), text(left + 232, 66, "everything else")]
    for tick in scale:
        parts += [line(x(tick), top - 8, x(tick), bottom, "grid"),
                  text(x(tick), bottom + 20, f"{tick:g}", "faint", "middle")]
    for index, (label, time, heap) in enumerate(rows):
        y = top + index * step
        heap = min(heap, time)
        parts += [text(left - 12, y + 16, label, "ink", "end"), rectangle(left, y, x(heap) - left, thick, "f1"),
                  rectangle(x(heap), y, x(time) - x(heap), thick, "f0"),
                  text(x(time) + 8, y + 16, f"{time:.2f} ({time / whole:.0%})".replace("%", " %"), "faint")]
    parts += [line(left, top - 8, left, bottom, "axis"),
              text((left + right) / 2, bottom + 46,
                   f"processor time, µs; in brackets: share of compose_edid's {whole:.1f} µs", "ink", "middle")]
    return document(f"Where a composition's time goes ({sink}, configuration store)", bottom + 64, parts)

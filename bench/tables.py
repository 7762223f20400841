"""The tables of docs/performance.md."""

import subprocess

import callgrind_profile
import results
import targets
from page import number, table

STAGES = [
    ("read_platform_values", "Read platform values", False),
    ("decode", "Decode the sink", True),
    ("select_video_modes", "Select video modes", True),
    ("select_4k_modes", "Select 4Kx2K modes", True),
    ("select_audio_formats", "Select audio formats", True),
    ("populate", "Populate the new record", True),
    ("encode", "Encode it", True),
]


def microseconds(nanoseconds):
    return f"{nanoseconds / 1000:.2f}"


def stage_name(stage, of_sink, sink):
    if stage == "decode":
        return f"codec/decode_and_destroy/{sink}"
    return f"stage/{stage}/{sink}" if of_sink else f"stage/{stage}"


def target_table(all_targets):
    def amount(value, unit):
        return f"{number(value)} {unit}".strip()

    rows = [
        ("met" if target.met() else "**missed**", target.what, target.at, amount(target.limit, target.unit),
         amount(target.measured, target.unit))
        for target in all_targets
    ]
    return table(["", "Target", "Worst at", "At most", "Measured"], rows, left=3)


def sink_table(run):
    def row(sink):
        decode = f"codec/decode_and_destroy/{sink}"
        values, store = f"compose/with_values/{sink}", f"compose/with_store/{sink}"
        return (sink, *(f"{microseconds(run.time(name))} ({run.counter(name, 'allocations')})"
                        for name in (decode, values, store)),
                number(run.time(values) / run.time(decode)), number(run.time(store) / run.time(values)),
                microseconds(run.time(f"codec/report/{sink}")))

    heads = ["Sample sink", "Decode and destroy, µs", "`compose_edid_internal`, µs", "`compose_edid`, µs",
             "Internal / decode", "Whole / internal", "Long report, µs"]
    return table(heads, map(row, run.of("codec/decode_and_destroy")))


def stage_table(run, sink):
    def row(stage, label, of_sink):
        name = stage_name(stage, of_sink, sink)
        allocations = run.counter(name, "allocations")
        return (label, microseconds(run.time(name)), str(allocations), microseconds(run.heap_floor(allocations)))

    return table(["Stage", "Time, µs", "Allocations", "of which heap calls, µs"], [row(*stage) for stage in STAGES])


def floor_table(run, sink):
    def row(label, name):
        allocations = run.counter(name, "allocations")
        floor = run.heap_floor(allocations)
        return (label, str(allocations // 2), str(run.counter(name, "bytes")), microseconds(floor),
                microseconds(run.time(name)), number(run.time(name) / floor))

    rows = [row("Decode and destroy", f"codec/decode_and_destroy/{sink}"),
            row("`compose_edid_internal`", f"compose/with_values/{sink}"),
            row("`compose_edid`, store", f"compose/with_store/{sink}")]
    return table(["", "List entries", "Heap bytes", "Floor, µs", "Measured, µs", "Times the floor"], rows)


def observer_table(run):
    """A composition through each of the two entries, without an observer and with one that counts."""
    def row(sink):
        alone, nobody, observed = (f"compose/{family}/{sink}" for family in ("with_values", "not_observed", "observed"))
        return (sink, microseconds(run.time(alone)), microseconds(run.time(nobody)),
                f"{run.time(nobody) / run.time(alone) - 1:+.1%}".replace("%", " %"), microseconds(run.time(observed)),
                str(run.counter(observed, "decisions")))

    heads = ["Sample sink", "`compose_edid_internal`, µs", "Null observer, µs", "Difference", "Observed, µs", "Decisions"]
    return table(heads, map(row, run.of("compose/observed")))


def growth_table(run):
    def row(family, what):
        points = run.series(family)
        first, last = points[0], points[-1]
        return (what, f"{first[0]}", microseconds(first[1]), f"{last[0]}", microseconds(last[1]),
                number(results.exponent(points)))

    heads = ["", "Shortest", "µs", "Longest", "µs", "Exponent"]
    return table(heads, [row(*item) for item in targets.GROWING.items()])


def profile_table(program):
    names = ["decode", "compose_with_values", "compose_with_store"]
    columns = [callgrind_profile.shares(program, name) for name in names]
    rows = [(group, *(f"{share[group]:.1%}".replace("%", " %") for share, _ in columns)) for group in columns[0][0]]
    rows.append(("All, instructions", *(number(total) for _, total in columns)))
    heads = ["tv_4k", "Decode and destroy", "`compose_edid_internal`", "`compose_edid`, store"]
    return table(heads, rows)


def size_table(library):
    """What the stripped library file consists of."""
    kinds = {
        "Code": (".text", ".init", ".fini", ".plt", ".plt.got"),
        "Texts and tables": (".rodata", ".data.rel.ro", ".data"),
        "Unwind tables": (".eh_frame", ".eh_frame_hdr"),
        "Names and dynamic linking": (".dynsym", ".dynstr", ".gnu.hash", ".gnu.version", ".gnu.version_r", ".rela.dyn",
                                      ".rela.plt", ".dynamic", ".got"),
    }
    text = subprocess.run(["size", "-A", "-d", library], capture_output=True, text=True, check=True).stdout
    sizes = {row.split()[0]: int(row.split()[1]) for row in text.splitlines() if row.startswith(".")}
    rows = [(kind, sum(sizes.get(section, 0) for section in sections)) for kind, sections in kinds.items()]
    whole = library.stat().st_size
    rows.append(("Headers, and the padding of segments to whole pages", whole - sum(size for _, size in rows)))
    rows.append(("All", whole))
    return table(["", "Bytes"], [(kind, number(size)) for kind, size in rows])

"""What costs must stay within. Ratios, so that they hold on any machine; sizes as they are."""

import dataclasses

import results

GROWING = {
    "growth/decode_video": "decoding, by short video descriptors",
    "growth/decode_audio": "decoding, by short audio descriptors",
    "growth/compose_video": "composing, by short video descriptors",
    "growth/compose_audio": "composing, by short audio descriptors",
    "growth/compose_priority": "composing, by the priority list",
}


@dataclasses.dataclass
class Target:
    what: str
    limit: float
    measured: float
    unit: str
    at: str
    """Where the worst was measured."""

    def met(self):
        return self.measured <= self.limit


def worst(values):
    """The largest value of a dictionary, with its key."""
    key = max(values, key=values.get)
    return values[key], key


def full_sinks(run):
    """The sample sinks that have an extension."""
    return run.of("codec/decode_extension")


def entries_without_two_calls(run):
    return {
        sink: abs(run.counter(name, kind) - 2 * run.counter(name, "entries"))
        for sink in run.of("codec/decode_and_destroy")
        for name in [f"codec/decode_and_destroy/{sink}"]
        for kind in ("allocations", "frees")
    }


def decode_time(run, sink):
    return run.time(f"codec/decode_and_destroy/{sink}")


def growth_targets(run):
    for family, what in GROWING.items():
        points = run.series(family)
        yield Target(f"Growth of {what}: exponent", 2, results.exponent(points), "", f"up to {points[-1][0]}")


def store_targets(run):
    times = {f"{kind}, {size >> 10} KiB": run.time(f"store/{kind}/{size}")
             for kind in ("found", "not_found") for size in run.of(f"store/{kind}")}
    yield Target("A look-up in the configuration store", 250, *_swap(worst(times), "ns"))
    sizes = run.of("store/found")
    ratio = run.time(f"store/found/{sizes[-1]}") / run.time(f"store/found/{sizes[0]}")
    yield Target("The same in the largest file, against the smallest", 2, ratio, "x", f"{sizes[-1] >> 10} KiB")


def _swap(pair, unit):
    value, at = pair
    return value, unit, at


def targets(run, library_size):
    """All targets, for a run and the size of the stripped library in bytes."""
    pair = run.time("heap/malloc_pair")
    yield Target("Decoding and destroying a sink of 256 bytes, in pairs of malloc and free", 60,
                 *_swap(worst({sink: decode_time(run, sink) / pair for sink in full_sinks(run)}), "pairs"))
    yield Target("Heap calls of that other than one malloc and one free for an entry and for its payload", 0,
                 *_swap(worst(entries_without_two_calls(run)), "calls"))
    yield Target("`compose_edid_internal` against decoding and destroying its sink (256 bytes)", 4,
                 *_swap(worst({sink: run.time(f"compose/with_values/{sink}") / decode_time(run, sink)
                               for sink in full_sinks(run)}), "x"))
    yield Target("`compose_edid` with the configuration store against `compose_edid_internal` (256 bytes)", 2.5,
                 *_swap(worst({sink: run.time(f"compose/with_store/{sink}") / run.time(f"compose/with_values/{sink}")
                               for sink in full_sinks(run)}), "x"))
    yield from store_targets(run)
    yield from growth_targets(run)
    yield Target("Stack of a composition", 8192,
                 *_swap(worst({f"{family}, {sink}": run.counter(f"compose/{family}/{sink}", "stack")
                               for family in ("with_values", "with_store")
                               for sink in run.of(f"compose/{family}")}), "bytes"))
    yield Target("Stripped library file", 102400, library_size, "bytes", "")

"""Compares what edid-decode reads in EDIDs with what this library's decoder reads: sample sinks, composed EDIDs, probes."""

import argparse
import sys

import edid_decode
import edid_text
import facts
import probes


def differences(name, ours, theirs):
    return [
        f"{name}: {fact}:\n  this decoder: {ours[fact]}\n  edid-decode:  {theirs[fact]}"
        for fact in ours
        if ours[fact] != theirs[fact]
    ]


def compare(edids, reader):
    """What is not equal, as texts, and the facts that had a value at least once."""
    problems = []
    seen = set()
    for name, edid in edids:
        try:
            ours = facts.by_library(reader, edid)
        except facts.Refused as refusal:
            problems.append(f"{name}: this decoder refuses it: {refusal}")
            continue
        problems += differences(name, ours, facts.by_edid_decode(edid))
        seen |= {fact for fact, value in ours.items() if value}
    # A fact that no EDID has would be equal whatever the readers do.
    problems += [f"nothing to compare: {fact}" for fact in facts.NAMES if fact not in seen]
    return problems, seen


def main():
    parser = argparse.ArgumentParser(description=__doc__)
    parser.add_argument("--reader", required=True, help="the program decoded_facts")
    parser.add_argument("--sinks", required=True)
    parser.add_argument("--goldens", required=True)
    arguments = parser.parse_args()
    edid_decode.skip_if_absent()

    sinks = edid_text.names_and_bytes(arguments.sinks, ".txt")
    base_block = next(edid for _, edid in sinks if len(edid) == 256)[:128]
    edids = sinks + edid_text.names_and_bytes(arguments.goldens, ".hex") + probes.all_probes(base_block)

    problems, seen = compare(edids, arguments.reader)
    print("\n".join(problems) or f"{len(edids)} EDIDs, {len(seen)} kinds of facts, all equal")
    sys.exit(1 if problems else 0)


if __name__ == "__main__":
    main()

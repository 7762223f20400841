"""Where the instructions of a workload go, by callgrind."""

import pathlib
import re
import subprocess
import sys
import tempfile

sys.path.insert(0, str(pathlib.Path(__file__).resolve().parent.parent / "tests" / "cost"))
import check_costs  # noqa: E402  (beside the path that it needs)

# The first that matches what callgrind_annotate calls a function: "file:function".
GROUPS = [
    ("Heap (C library)", r"malloc/(malloc|arena)\.c|morecore|bench/heap_meter"),
    ("Text (C library)", r"stdio-common|/libio/|stdlib/strto|/debug/|/locale/|string/.*(str|mem)"),
    ("Configuration store", r"host/config_store|functional_hash|_Hash_bytes|string_view"),
    ("Lists", r"src/linked_list/"),
    ("Decoders, encoders, report", r"src/edid_decode_encode/|src/bytes\.h|src/text_field\.h|src/utility/printers"),
    ("Reading the platform", r"src/edid_composer/platform/|src/utility/(configuration|platform_values)"),
    ("Selecting modes and formats", r"src/edid_composer/selection/"),
    ("Values of the new EDID", r"src/edid_composer/new_edid/"),
    ("Explaining", r"src/edid_composer/(explain|journal)"),
    ("Names and conversions", r"src/utility/"),
]
REST = "Other"


def annotate(program, workload):
    """(instructions, "file:function") of each function of the measured run, without those it calls."""
    with tempfile.TemporaryDirectory() as folder:
        file = pathlib.Path(folder) / "profile"
        check_costs.profile(program, workload, file)
        command = ["callgrind_annotate", "--auto=no", "--threshold=100", str(file)]
        text = subprocess.run(command, capture_output=True, text=True, check=True).stdout
    for line in text.splitlines():
        row = re.match(r"\s*([\d,]+) \(\s*[\d.]+%\)\s+(\S.*)", line)
        if row and ":" in row.group(2):
            yield int(row.group(1).replace(",", "")), row.group(2)


def shares(program, workload):
    """Shares of the groups in all instructions, in the order of GROUPS, and the number of instructions."""
    sums = {name: 0 for name, _ in GROUPS} | {REST: 0}
    for instructions, function in annotate(program, workload):
        sums[next((name for name, pattern in GROUPS if re.search(pattern, function)), REST)] += instructions
    total = sum(sums.values())
    return {name: count / total for name, count in sums.items()}, total

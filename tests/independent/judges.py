"""Counts what decoders find in EDIDs that are composed for a folder of sinks, without and with HDMI 2."""

import argparse
import collections
import pathlib
import re
import subprocess
import sys
import tempfile

# With HDMI 2, and explained: the source may not select the range where the sink doesn't let it; a block that is passed on
# has the sink's own mistakes.
EXPLAINED = re.compile("Set Selectable (RGB|YCbCr) Quantization to avoid interop issues"
                       "|^Vendor-Specific Video Data Block")


def composed(program, sink, platform):
    done = subprocess.run([program, "compose", *platform, "--sink", sink, "-o", "-"], capture_output=True, check=False)
    return done.stdout if done.returncode == 0 else None


def findings(judge, file):
    """Severity and message of each, without the numbers in which EDIDs differ."""
    done = subprocess.run([*judge, file], capture_output=True, check=False)
    found, severity = set(), None
    for line in done.stdout.decode("utf-8", "replace").splitlines():
        if line in ("Warnings:", "Failures:"):
            severity = line[:-2].lower()
        elif severity and line.startswith("  "):
            found.add((severity, re.sub(r"\d+(\.\d+)?", "N", line.strip())))
        elif line.startswith("EDID conformity"):
            severity = None
    return found or ({("failure", "no output")} if not done.stdout else found)


def main():
    parser = argparse.ArgumentParser(description=__doc__)
    parser.add_argument("--program", required=True)
    parser.add_argument("--judge", action="append", required=True, help="a decoder's command; the EDID's file follows")
    parser.add_argument("sinks", type=pathlib.Path)
    arguments = parser.parse_args()
    unexplained = 0
    with tempfile.TemporaryDirectory() as folder:
        platform = pathlib.Path(folder, "hdmi2.toml")
        platform.write_bytes(subprocess.run([arguments.program, "platform", "--hdmi2"], capture_output=True,
                                            check=True).stdout)
        edid = pathlib.Path(folder, "edid.bin")
        sinks = sorted(path for path in arguments.sinks.iterdir() if path.suffix in (".bin", ".txt", ".hex"))
        for judge in arguments.judge:
            counts = {False: collections.Counter(), True: collections.Counter()}
            for sink in sinks:
                for has_hdmi2, options in ((False, []), (True, ["--platform", platform])):
                    content = composed(arguments.program, sink, options)
                    if content is None:
                        counts[has_hdmi2][("refused", "by the library")] += 1
                        continue
                    edid.write_bytes(content)
                    counts[has_hdmi2].update(findings(judge.split(), edid))
            print(f"{judge.split()[0].rpartition('/')[2]}, {len(sinks)} sinks: without and with HDMI 2")
            for finding in sorted(counts[False] | counts[True]):
                before, after = counts[False][finding], counts[True][finding]
                is_new = finding[0] == "failure" and after > before and not EXPLAINED.search(finding[1])
                unexplained += is_new
                print(f"{'*' if is_new else ' '} {finding[0]:8} {before:4} {after:4}  {finding[1]}")
    print(f"{unexplained} kinds of failure are more frequent with HDMI 2 and have no explanation")
    sys.exit(1 if unexplained else 0)


if __name__ == "__main__":
    main()

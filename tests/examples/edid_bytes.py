"""EDIDs as the tests of the examples need them: from commented hex text, and with another physical address."""

import pathlib

HDMI_OUI = bytes.fromhex("030C00")


def from_hex_text(text):
    """The bytes of a hex text; what stands after a '#' is a comment."""
    return bytes.fromhex(" ".join(line.partition("#")[0] for line in text.splitlines()))


def samples(folder):
    """The sample sinks by name."""
    return {path.stem: from_hex_text(path.read_text()) for path in sorted(pathlib.Path(folder).glob("*.txt"))}


def with_checksums(edid):
    """The same EDID, each block's bytes adding up to 0."""
    blocks = [edid[start : start + 128] for start in range(0, len(edid), 128)]
    return b"".join(block[:-1] + bytes([-sum(block[:-1]) % 256]) for block in blocks)


def has_right_checksums(edid):
    return with_checksums(edid) == edid


def with_address(edid, address):
    """A sink that has another physical address, a.b.c.d, in its HDMI vendor-specific data block."""
    a, b, c, d = (int(level) for level in address.split("."))
    position = edid.index(HDMI_OUI, 128) + len(HDMI_OUI)
    changed = edid[:position] + bytes([a << 4 | b, c << 4 | d]) + edid[position + 2 :]
    return with_checksums(changed)

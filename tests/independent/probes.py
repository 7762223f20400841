"""EDIDs that hold what no sample sink has: every audio format, every 3D structure, latencies at their limits."""

VICS = (16, 4, 19, 32, 5, 20, 31, 3, 2, 18, 17, 33, 34, 1, 60, 61, 62, 63)
AUDIO, VIDEO, VENDOR, EXTENDED = 1, 2, 3, 7


def _block(tag, payload):
    return bytes([tag << 5 | len(payload), *payload])


def _hdmi(*payload):
    return _block(VENDOR, (0x03, 0x0C, 0x00, *payload))


def _edid(base_block, *blocks):
    """A base block with an extension that holds the data blocks."""
    collection = b"".join(blocks)
    extension = bytes([2, 3, 4 + len(collection), 0xF0]) + collection
    extension += bytes(127 - len(extension))
    return base_block + extension + bytes([-sum(extension) % 256])


def _audio_formats(codes, detail):
    return _block(AUDIO, [byte for code in codes for byte in (code << 3 | code % 8, 0x7F >> code % 3, detail)])


def _forum(*payload):
    return _block(VENDOR, (0xD8, 0x5D, 0xC4, *payload))


def _extended(*payload):
    return _block(EXTENDED, payload)


def _hdmi2_probes(base_block):
    modes = _block(VIDEO, (16, 97, 102, 127, 0x80 | 4, 64, 65))
    return [
        (
            "every block of HDMI 2",
            _edid(
                base_block,
                modes,
                _forum(1, 120, 0xC8, 0x6F, 2, 0x30, 120),
                _extended(0x00, 0xFF),
                _extended(0x05, 0xFF, 0xFF),
                _extended(0x06, 0x0F, 1, 115, 90, 18),
                _extended(0x0E, 96, 193, 219),
                _extended(0x0F, 0x46),
                _extended(0x07, 5, 1, 0, 2, 0, 0),
                _extended(0x01, 0x8B, 0x84, 0x90, 0x01),
                _extended(0x01, 0x46, 0xD0, 0x00, 0x2A, 0x18, 0x03, 0x51, 0x59, 0x99, 0xAA),
                _block(VENDOR, (0x1A, 0x00, 0x00, 1, 1, 48, 144, 0xE6)),
            ),
        ),
        (
            "blocks of HDMI 2 with little in them",
            _edid(
                base_block,
                modes,
                _forum(1, 0, 0, 0),
                _extended(0x00, 0x00),
                _extended(0x05, 0x00, 0x00),
                _extended(0x06, 0x01, 0x00),
                _extended(0x0F),
                _extended(0x01, 0x46, 0xD0, 0x00, 0x40, 0, 0, 0, 0, 0, 0, 0),
            ),
        ),
        *(
            (f"HDMI Forum block, bit {bit}", _edid(base_block, modes, _forum(1, 69, *(1 << bit).to_bytes(3, "big"))))
            for bit in (1, 8, 9, 10, 11, 12, 13, 19, 22, 23)
        ),
        (
            "variable refresh rate of more than 8 bits",
            _edid(base_block, modes, _forum(1, 118, 0x80, 0x20, 0, 0xE8, 0x07), _extended(0x00, 0x24)),
        ),
        *(
            (f"colorimetry, bit {bit}", _edid(base_block, _extended(0x05, *(1 << bit).to_bytes(2, "big"))))
            for bit in range(16)
        ),
        ("video capability, other scans", _edid(base_block, _extended(0x00, 0x58), _extended(0x06, 0x0A, 1, 96))),
    ]


def all_probes(base_block):
    """Pairs of name and EDID, made with the base block of a sample that has one extension."""
    video = _block(VIDEO, VICS)
    native = _block(VIDEO, [0x80 | VICS[0], VICS[1], 0x80 | VICS[2]])
    extended = [byte for code in (1, 2, 3) for byte in (0x7A, 0x16, code << 3)]
    half_horizontal, half_any = (0x78, 0x10), (0x88, 0x00)
    return [
        ("audio formats 1 to 10", _edid(base_block, video, _audio_formats(range(1, 11), 5))),
        ("audio formats 11 to 15", _edid(base_block, video, _audio_formats(range(11, 15), 3), _block(AUDIO, extended))),
        ("native modes", _edid(base_block, native, _hdmi(0x12, 0x34))),
        ("every structure for all modes", _edid(base_block, video, _hdmi(0x12, 0x34, 0, 0, 0x20, 0xA0, 2, 0x81, 0x7F))),
        (
            "structures with a mask of modes",
            _edid(base_block, video, _hdmi(0xF0, 0, 0xF9, 45, 0x20, 0xC0, 0x44, 4, 1, 0, 0x41, 0x80, 0x05)),
        ),
        (
            "every structure for one mode",
            _edid(
                base_block,
                video,
                _hdmi(0x10, 0, 0, 60, 0x25, 0x80, 11, 0, 0x11, 0x22, 0x33, 0x44, 0x55, 0x66, *half_horizontal, *half_any),
            ),
        ),
        ("latencies at their limits", _edid(base_block, video, _hdmi(0x10, 0, 0, 60, 0xCA, 255, 251, 2, 0))),
        ("progressive latencies only", _edid(base_block, video, _hdmi(0x10, 0, 0, 60, 0x80, 26, 0))),
        *_hdmi2_probes(base_block),
    ]

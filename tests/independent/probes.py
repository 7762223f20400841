"""EDIDs that hold what no sample sink has: every audio format, every 3D structure, latencies at their limits."""

VICS = (16, 4, 19, 32, 5, 20, 31, 3, 2, 18, 17, 33, 34, 1, 60, 61, 62, 63)
AUDIO, VIDEO, VENDOR = 1, 2, 3


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
    ]

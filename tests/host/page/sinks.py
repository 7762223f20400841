"""Sinks made for a test: a base block of a sample, and an extension with what the test asks for."""

VIDEO, AUDIO, VENDOR = 2, 1, 3


def with_checksum(block):
    return block[:127] + bytes([-sum(block[:127]) % 256])


def block(tag, payload):
    return bytes([tag << 5 | len(payload)]) + bytes(payload)


def text_descriptor(tag, text):
    """13 bytes of text, which may be any bytes."""
    return bytes([0, 0, 0, tag, 0]) + text.ljust(13, b" ")[:13]


def hdmi(vics_4k=(), has_3d=False):
    payload = [0x03, 0x0C, 0x00, 0x10, 0x00, 0x00, 0x3C]
    if vics_4k or has_3d:
        payload += [0x20, 0x80 if has_3d else 0x00, len(vics_4k) << 5, *vics_4k]
    return payload


def timing(width, lines):
    """A detailed timing of 60 Hz that has no VIC."""
    h_blank, v_blank = 160, 40
    clock = (width + h_blank) * (lines + v_blank) * 60 // 10000
    return bytes([clock & 255, clock >> 8, width & 255, h_blank, width >> 8 << 4, lines & 255, v_blank, lines >> 8 << 4,
                  48, 32, 0x33, 0, 0, 0, 0, 0, 0, 0x1E])


def sink(vics=(), audio=(), vics_4k=(), has_3d=False, name=b"Test sink\n", other_texts=(), timings=()):
    """256 bytes. @p audio: three bytes each."""
    base = bytearray(bytes.fromhex("00ffffffffffff00 6b54 0100 01000000 0118 0103"))
    base += bytes.fromhex("80 a05a 78 0a ee91a3544c99260f5054 000000")
    base += bytes.fromhex("0101") * 8
    descriptors = [*timings, text_descriptor(0xFC, name), *(text_descriptor(tag, text) for tag, text in other_texts)]
    descriptors += [bytes([0, 0, 0, 0x10]) + bytes(14)] * (4 - len(descriptors))
    base += b"".join(descriptors) + bytes([1])
    blocks = block(VIDEO, vics) + block(AUDIO, b"".join(bytes(entry) for entry in audio))
    blocks += block(VENDOR, hdmi(vics_4k, has_3d))
    extension = bytes([2, 3, 4 + len(blocks), 0x40]) + blocks
    return with_checksum(bytes(base)) + with_checksum(extension.ljust(127, b"\0"))

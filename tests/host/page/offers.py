"""What an EDID of 256 bytes offers, read from its bytes alone."""


def data_blocks(edid):
    """The extension's data blocks, (tag, payload) each."""
    if edid[126] == 0:  # The base block announces no extension.
        return
    extension = edid[128:]
    position = 4
    while position < extension[2]:
        length = extension[position] & 0x1F
        yield extension[position] >> 5, extension[position + 1 : position + 1 + length]
        position += 1 + length


def video_modes(edid):
    return [byte & 0x7F for tag, payload in data_blocks(edid) if tag == 2 for byte in payload]


def _audio_descriptors(edid):
    payloads = [payload for tag, payload in data_blocks(edid) if tag == 1]
    return [payload[at : at + 3] for payload in payloads for at in range(0, len(payload) - 2, 3)]


def audio_entries(edid):
    """(type, channels) of each short audio descriptor; types from 16 on are those after format 15."""
    entries = []
    for first, _, last in _audio_descriptors(edid):
        code = first >> 3 & 15
        entries.append((15 + (last >> 3) if code == 15 else code, (first & 7) + 1))
    return entries


def audio_types(edid):
    return [kind for kind, _ in audio_entries(edid)]


def modes_4k(edid):
    for tag, payload in data_blocks(edid):
        if tag == 3 and payload[:3] == b"\x03\x0c\x00" and len(payload) > 7 and payload[7] & 0x20:
            flags = payload[7]
            video = 8 + (2 if flags & 0x80 else 0) + (2 if flags & 0xC0 == 0xC0 else 0)
            if len(payload) > video + 1:
                return list(payload[video + 2 : video + 2 + (payload[video + 1] >> 5)])
    return []


def _hdmi_block(edid):
    return next((payload for tag, payload in data_blocks(edid) if tag == 3 and payload[:3] == b"\x03\x0c\x00"), b"")


def has_depth(edid, bits):
    """Deep colour of so many bits per pixel."""
    payload = _hdmi_block(edid)
    return len(payload) > 5 and payload[5] & {30: 0x10, 36: 0x20, 48: 0x40}[bits] != 0


def has_3d(edid):
    payload = _hdmi_block(edid)
    if len(payload) <= 7 or not payload[7] & 0x20:
        return False
    video = 8 + (2 if payload[7] & 0x80 else 0) + (2 if payload[7] & 0xC0 == 0xC0 else 0)
    return len(payload) > video and payload[video] & 0x80 != 0

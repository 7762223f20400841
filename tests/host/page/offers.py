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


def audio_types(edid):
    """Format codes; 16 and above are those behind format 15."""
    payloads = [payload for tag, payload in data_blocks(edid) if tag == 1]
    entries = [payload[at : at + 3] for payload in payloads for at in range(0, len(payload), 3)]
    codes = [(entry[0] >> 3 & 15, entry[2] >> 3) for entry in entries]
    return [15 + extension if code == 15 else code for code, extension in codes]


def modes_4k(edid):
    for tag, payload in data_blocks(edid):
        if tag == 3 and payload[:3] == b"\x03\x0c\x00" and len(payload) > 7 and payload[7] & 0x20:
            flags = payload[7]
            video = 8 + (2 if flags & 0x80 else 0) + (2 if flags & 0xC0 == 0xC0 else 0)
            if len(payload) > video + 1:
                return list(payload[video + 2 : video + 2 + (payload[video + 1] >> 5)])
    return []

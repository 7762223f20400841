"""What two readers of an EDID can be compared by: a dictionary of plain values for each, made the same way."""

import json
import re
import subprocess

import edid_decode
import hdmi2_facts

NAMES = (
    "VICs",
    "native VICs",
    "3D structures",
    "audio formats",
    "physical address",
    "HDMI flags",
    "TMDS clock",
    "content types",
    "latencies",
    "3D present",
    "HDMI VICs",
    "xvYCC",
    *hdmi2_facts.NAMES,
)
STRUCTURES = {
    # Mask bit, and how edid-decode calls the structure: for many modes at once, and for a single one.
    0x01: ("Frame-packing", "frame packing"),
    0x02: ("Side-by-side (half, horizontal)", "side-by-side, horizontal"),
    0x04: ("Top-and-bottom", "top-and-bottom"),
    0x08: ("Field-alternative", "field alternative"),
    0x10: ("Line-alternative", "line alternative"),
    0x20: ("Side-by-side (full)", "side-by-side (full)"),
    0x40: ("L + depth", "L + depth"),
    0x80: ("L + depth + gfx + gfx-depth", "L + depth + gfx + gfx-depth"),
}
STRUCTURE_OF_NAME = {name: bit for bit, names in STRUCTURES.items() for name in names} | {
    "Side-by-side (half, quincunx)": 0x02,
    "side-by-side, any subsampling": 0x02,
}
AUDIO_TYPE_OF_NAME = {
    "Linear PCM": 1,
    "AC-3": 2,
    "MPEG 1 (Layers 1 & 2)": 3,
    "MPEG 1 Layer 3 (MP3)": 4,
    "MPEG2 (multichannel)": 5,
    "AAC LC": 6,
    "DTS": 7,
    "ATRAC": 8,
    "One Bit Audio": 9,
    "Enhanced AC-3 (DD+)": 10,
    "DTS-HD": 11,
    "MAT (MLP)": 12,
    "DST": 13,
    "WMA Pro": 14,
    "HE AAC (Obsolete)": 16,
    "HE AAC v2 (Obsolete)": 17,
    "MPEG Surround (Obsolete)": 18,
}
# Their third byte is told in words that say less than the byte.
AUDIO_TYPES_WITHOUT_VALUE = (10, 12)
RATES = ("32", "44.1", "48", "88.2", "96", "176.4", "192")
SIZES = ("16", "20", "24")
HDMI_FLAGS = ("Supports_AI", "DC_48bit", "DC_36bit", "DC_30bit", "DC_Y444", "DVI_Dual")
CONTENT_TYPES = ("Graphics", "Photo", "Cinema", "Game")
XVYCC = ("xvYCC601", "xvYCC709")
# Structures for all modes at once mean the first so many.
MODES_WITH_COMMON_STRUCTURES = 16


class Refused(Exception):
    """The decoder does not take the EDID."""


def _names(mask, names):
    return [name for bit, name in enumerate(names) if mask >> bit & 1]


def _structures_of(pairs):
    """VICs with 3D structures: the mask of each, in order."""
    masks = {}
    for vic, mask in pairs:
        masks[vic] = masks.get(vic, 0) | mask
    return sorted((vic, mask) for vic, mask in masks.items() if mask)


# --- What this library's decoder reads ----------------------------------------------------------


def by_library(reader, edid):
    """The reader is the program decoded_facts."""
    result = subprocess.run([reader], input=edid, capture_output=True, check=False, timeout=30)
    text = result.stdout.decode("utf-8", "replace")
    if result.returncode != 0:
        raise Refused(text + result.stderr.decode("utf-8", "replace"))
    # Warnings of the decoder stand in front.
    read = json.loads(text[text.index("{\n") :])
    modes = read["modes"]
    flags = [name for name in HDMI_FLAGS if read[name.lower()]]
    return {
        "VICs": [mode["vic"] for mode in modes],
        "native VICs": [mode["vic"] for mode in modes if mode["native"]],
        "3D structures": _structures_of((mode["vic"], mode["stereo"]) for mode in modes),
        "audio formats": [_library_audio(audio) for audio in read["audio"]],
        "physical address": "{:x}.{:x}.{:x}.{:x}".format(*read["address"]) if read["hdmi"] else None,
        "HDMI flags": flags,
        "TMDS clock": read["tmds_clock"],
        "content types": [name for name, given in zip(CONTENT_TYPES, read["content_types"]) if given],
        "latencies": read["latency_ms"],
        "3D present": bool(read["3d_present"]),
        "HDMI VICs": read["hdmi_vics"],
        "xvYCC": [name for name in XVYCC if read[name.lower()]],
        **hdmi2_facts.by_library(read["hdmi2"]),
    }


def _library_audio(audio):
    type_ = audio["type"]
    details = {1: ("sizes", _names(audio["sizes"], SIZES)), 14: ("profile", audio["profile"])}
    if 2 <= type_ <= 8:
        detail = ("bit rate", audio["bit_rate"])
    elif 9 <= type_ <= 13 and type_ not in AUDIO_TYPES_WITHOUT_VALUE:
        detail = ("value", audio["value"])
    else:
        detail = details.get(type_)
    return (type_, audio["channels"], _names(audio["rates"], RATES), detail)


# --- What edid-decode reads ---------------------------------------------------------------------


def by_edid_decode(edid):
    tree = edid_decode.reading(edid)
    extension = edid_decode.Node("")
    for block in tree.all("Block 1, CTA-861"):
        extension = block
    hdmi = edid_decode.Node("")
    for block in extension.all("Vendor-Specific Data Block (HDMI), OUI 00-0C-03:"):
        hdmi = block
    video = edid_decode.Node("", hdmi.below("Extended HDMI video details:"))
    vics = [_vic(node.line) for node in extension.below("Video Data Block:")]
    clock = hdmi.value("Maximum TMDS clock")
    return {
        "VICs": vics,
        "native VICs": [_vic(node.line) for node in extension.below("Video Data Block:") if "(native)" in node.line],
        "3D structures": _edid_decode_structures(video, vics),
        "audio formats": [_edid_decode_audio(node) for node in extension.below("Audio Data Block:")],
        "physical address": hdmi.value("Source physical address"),
        "HDMI flags": [name for name in HDMI_FLAGS if name in hdmi.lines()],
        "TMDS clock": int(clock.split()[0]) if clock else 0,
        "content types": [node.line for node in hdmi.below("Supported Content Types:")],
        "latencies": _edid_decode_latencies(hdmi),
        "3D present": "3D present" in video.lines(),
        "HDMI VICs": [_vic(node.line) for node in video.below("HDMI VICs:")],
        "xvYCC": [node.line for node in extension.below("Colorimetry Data Block:") if node.line in XVYCC],
        **hdmi2_facts.by_edid_decode(tree),
    }


def _vic(line):
    return int(re.match(r"(?:HDMI )?VIC +(\d+):", line).group(1))


def _edid_decode_audio(node):
    type_ = AUDIO_TYPE_OF_NAME[node.line.rstrip(":")]

    def words(label):
        return list(reversed(node.value(label).split()))

    if type_ == 1:
        detail = ("sizes", words("Supported sample sizes (bits)"))
    elif 2 <= type_ <= 8:
        detail = ("bit rate", int(node.value("Maximum bit rate").split()[0]))
    elif type_ == 14:
        detail = ("profile", int(node.value("Profile")))
    elif 9 <= type_ <= 13 and type_ not in AUDIO_TYPES_WITHOUT_VALUE:
        detail = ("value", int(node.value("Audio Format Code dependent value"), 16))
    else:
        detail = None
    return (type_, int(node.value("Max channels")), words("Supported sample rates (kHz)"), detail)


def _edid_decode_structures(video, vics):
    pairs = []
    for node in video.below("3D VIC indices with specific capabilities:"):
        name = re.search(r" MHz \((.*)\)$", node.line).group(1)
        pairs.append((_vic(node.line), STRUCTURE_OF_NAME[name]))
    common = [line.removeprefix("3D: ") for line in video.lines() if line.startswith("3D: ")]
    meant = [_vic(node.line) for node in video.below("3D VIC indices that support these capabilities:")]
    if "All advertised VICs are 3D-capable" in video.lines():
        meant = vics[:MODES_WITH_COMMON_STRUCTURES]
    pairs += [(vic, STRUCTURE_OF_NAME[name]) for vic in meant for name in common]
    return _structures_of(pairs)


def _edid_decode_latencies(hdmi):
    """Milliseconds as HDMI 1.4 means them: 2 * (byte - 1). 0 when not known, 508 when not supported."""
    latencies = [_latency(hdmi.value(kind + " latency")) for kind in ("Video", "Audio")]
    interlaced = [hdmi.value(f"Interlaced {kind} latency") for kind in ("video", "audio")]
    # Without a pair of their own, interlaced modes have the latencies of the others.
    return latencies + ([_latency(text) for text in interlaced] if any(interlaced) else latencies)


def _latency(text):
    if text is None or text == "Unknown":
        return 0
    if text.endswith("not supported"):
        return 508
    milliseconds = int(text.removesuffix(" ms"))
    # The edid-decode of 2022 reckons 2 * byte + 1 where HDMI 1.4 has 2 * (byte - 1): only its numbers are odd.
    return milliseconds - 3 if milliseconds % 2 else milliseconds

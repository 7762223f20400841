"""The part of facts.py that HDMI 2 adds."""

import re

NAMES = (
    "VICs of all blocks",
    "VICs in 4:2:0 only",
    "VICs of the 4:2:0 map",
    "HDMI Forum",
    "video capability",
    "colorimetry",
    "HDR static metadata",
    "HDR dynamic metadata",
    "HDR10+",
    "Dolby Vision",
    "FreeSync",
)
FORUM_FLAGS = {
    "scdc": "SCDC Present",
    "read_request": "SCDC Read Request Capable",
    "scramble_low": "Supports scrambling for <= 340 Mcsc",
    "uhd_vic": "Supports UHD VIC",
    "dc_48bit_420": "Supports 16-bits/component Deep Color 4:2:0 Pixel Encoding",
    "dc_36bit_420": "Supports 12-bits/component Deep Color 4:2:0 Pixel Encoding",
    "dc_30bit_420": "Supports 10-bits/component Deep Color 4:2:0 Pixel Encoding",
    "allm": "Supports Auto Low-Latency Mode",
}
# The last of the links that are listed.
LINKS = (None, "3 on 3", "6 on 3", "6 on 4", "8 on 4", "10 on 4", "12 on 4")
SCANS = ("No Data", "Always Overscanned", "Always Underscanned", "Supports both over- and underscan")
UNSUPPORTED_SCANS = ("IT video formats not supported", "CE video formats not supported")
# Bit 0 of byte 2 first, then of byte 3, whose first four have had several names.
COLOR_SPACES = ("xvYCC601", "xvYCC709", "sYCC601", "opYCC601", "opRGB", "BT2020cYCC", "BT2020YCC", "BT2020RGB")
GAMUTS = (r".*(MD0|P0)$", r".*(MD1|P1)$", r".*(MD2|P2)$", r".*(MD3|P3)$", "Default$", "sRGB$", "ICtCp$", "ST2113RGB$")
EOTFS = (
    "Traditional gamma - SDR luminance range",
    "Traditional gamma - HDR luminance range",
    "SMPTE ST2084",
    "Hybrid Log-Gamma",
)


def _vic_of_code(code):
    return code if (code - 1) & 0x40 and code & 0x7F else code & 0x7F


def by_library(read):
    """What decoded_facts prints of the record."""
    vics = [_vic_of_code(code) for code in read["svds"]]
    forum = {name: read[name] for name in ("max_tmds_rate", "vrr_min", "vrr_max", *FORUM_FLAGS)}
    forum |= {"version": read["forum_version"], "link": LINKS[read["frl_rate"]]}
    capabilities = ("ycc_quantization", "rgb_quantization", "preferred_scan", "it_scan", "ce_scan")
    return {
        "VICs of all blocks": vics,
        "VICs in 4:2:0 only": [_vic_of_code(code) for code in read["y420_vics"]],
        "VICs of the 4:2:0 map": _marked(vics, read["map"]) if read["y420_map_present"] else None,
        "HDMI Forum": forum if read["forum_present"] else None,
        "video capability": [read[name] for name in capabilities] if read["video_capability_present"] else None,
        "colorimetry": [read["colorimetry"], read["gamut_metadata"]] if read["colorimetry_present"] else None,
        "HDR static metadata": [read["eotfs"], read["metadata_types"], *read["luminance"]]
        if read["hdr_static_present"]
        else None,
        "HDR dynamic metadata": read["hdr_dynamic"][2] if read["hdr_dynamic"] else None,
        "HDR10+": bool(read["hdr10plus"]),
        "Dolby Vision": _dolby_vision_bits(read["dolby_vision"][4]) if read["dolby_vision"] else None,
        "FreeSync": read["freesync"][5:7],
    }


def _marked(vics, bitmap):
    """A map without a byte marks all."""
    return [vic for i, vic in enumerate(vics) if not bitmap or (i // 8 < len(bitmap) and bitmap[i // 8] >> i % 8 & 1)]


def _dolby_vision_bits(byte):
    """The version, and whether the first two of them announce 2160p60."""
    version = byte >> 5
    return [version, byte >> 1 & 1 if version < 2 else None]


def by_edid_decode(tree):
    """A tree with a node for each block of the EDID."""
    blocks = [node for extension in tree.children if "CTA-861" in extension.line for node in extension.children]

    def first(beginning):
        return next((node for node in blocks if node.line.startswith(beginning)), None)

    def vics(nodes):
        return [int(re.match(r"VIC +(\d+):", node.line).group(1)) for node in nodes]

    video = [node for block in blocks if block.line == "Video Data Block:" for node in block.children]
    only_420 = first("YCbCr 4:2:0 Video Data Block")
    marked = first("YCbCr 4:2:0 Capability Map Data Block")
    dynamic = first("HDR Dynamic Metadata Data Block")
    freesync = first("Vendor-Specific Data Block (AMD)")
    return {
        "VICs of all blocks": vics(video),
        "VICs in 4:2:0 only": vics(only_420.children) if only_420 else [],
        "VICs of the 4:2:0 map": vics(video if "All VDB SVDs" in marked.lines() else marked.children) if marked else None,
        "HDMI Forum": _forum(first("Vendor-Specific Data Block (HDMI Forum)")),
        "video capability": _video_capability(first("Video Capability Data Block")),
        "colorimetry": _colorimetry(first("Colorimetry Data Block")),
        "HDR static metadata": _hdr_static(first("HDR Static Metadata Data Block")),
        "HDR dynamic metadata": int(dynamic.children[0].line.split()[-1]) if dynamic else None,
        "HDR10+": first("Vendor-Specific Video Data Block (HDR10+)") is not None,
        "Dolby Vision": _dolby_vision(first("Vendor-Specific Video Data Block (Dolby)")),
        "FreeSync": [_number(freesync, kind + " Refresh Rate") for kind in ("Minimum", "Maximum")] if freesync else [],
    }


def _number(node, label):
    value = node.value(label)
    return int(value.split()[0]) if value else 0


def _mask(lines, names):
    return sum(1 << bit for bit, name in enumerate(names) if name in lines)


def _forum(node):
    if node is None:
        return None
    numbers = {
        "version": "Version",
        "max_tmds_rate": "Maximum TMDS Character Rate",
        "vrr_min": "VRRmin",
        "vrr_max": "VRRmax",
    }
    values = {name: _number(node, label) for name, label in numbers.items()}
    values |= {name: int(line in node.lines()) for name, line in FORUM_FLAGS.items()}
    links = node.value("Max Fixed Rate Link")
    return values | {"link": "{} on {}".format(*re.findall(r"\d+", links)[-2:]) if links else None}


def _video_capability(node):
    if node is None:
        return None
    selectable = [int(node.value(kind + " quantization").startswith("Selectable")) for kind in ("YCbCr", "RGB")]
    scans = [node.value(kind + " scan behavior") for kind in ("PT", "IT", "CE")]
    return selectable + [0 if scan in UNSUPPORTED_SCANS else SCANS.index(scan) for scan in scans]


def _colorimetry(node):
    if node is None:
        return None
    gamuts = sum(1 << bit for bit, name in enumerate(GAMUTS) if any(re.match(name, line) for line in node.lines()))
    return [_mask(node.lines(), COLOR_SPACES), gamuts]


def _hdr_static(node):
    if node is None:
        return None
    functions = [child.line for child in node.below("Electro optical transfer functions:")]
    types = [child.line for child in node.below("Supported static metadata descriptors:")]
    luminances = [int(line.split(": ")[1].split()[0]) for line in node.lines() if " luminance: " in line]
    return [_mask(functions, EOTFS), _mask(types, ("Static metadata type 1",)), *luminances]


def _dolby_vision(node):
    if node is None:
        return None
    version = _number(node, "Version")
    return [version, int("Supports 2160p60" in node.lines()) if version < 2 else None]

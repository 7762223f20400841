"""Sinks by the thousand: mutations of the sample sinks, each with right checksums, the same for the same seed."""

import pathlib
import random

BLOCK = 128
HEADER = 8
# Of the base block: what a decoder requires (header, version) and the number of extensions stay as they are.
KEPT = {*range(HEADER), 18, 19, BLOCK - 2, BLOCK - 1}
# Of the extension: tag, revision, where the timings begin; the data blocks' headers are kept too.
KEPT_OF_EXTENSION = 4


def read_sample(file):
    words = (word for row in file.read_text(encoding="utf-8").splitlines() for word in row.split("#")[0].split())
    return bytes(int(word, 16) for word in words)


def samples(folder):
    return [read_sample(file) for file in sorted(pathlib.Path(folder).glob("*.txt"))]


def data_block_payloads(extension):
    """The offsets of payload bytes of the video, audio and speaker data blocks (CEA-861, section 7.5)."""
    offset = KEPT_OF_EXTENSION
    while offset < extension[2]:
        tag, length = extension[offset] >> 5, extension[offset] & 0x1F
        if tag in (1, 2, 4):
            yield from range(offset + 1, offset + 1 + length)
        offset += 1 + length


def mend_checksum(edid, block):
    end = (block + 1) * BLOCK - 1
    edid[end] = -sum(edid[end - BLOCK + 1 : end]) & 0xFF


def mutated(sample, source):
    """A copy with one to eight changed bytes, in places that leave it a sink."""
    edid = bytearray(sample)
    places = [offset for offset in range(BLOCK) if offset not in KEPT and not 54 <= offset < BLOCK - 2]
    if len(edid) > BLOCK:
        places += [BLOCK + offset for offset in data_block_payloads(edid[BLOCK:])]
    for place in source.sample(places, source.randint(1, 8)):
        edid[place] = source.randrange(1, 256)
    for block in range(len(edid) // BLOCK):
        mend_checksum(edid, block)
    return bytes(edid)


def make(folder, count, sample_folder, seed=1):
    """Writes @p count sinks into a folder."""
    source = random.Random(seed)
    originals = samples(sample_folder)
    folder = pathlib.Path(folder)
    folder.mkdir(parents=True)
    for number in range(count):
        (folder / f"sink_{number:05}.bin").write_bytes(mutated(originals[number % len(originals)], source))

"""EDIDs as commented hexadecimal text: pairs of digits, "#" begins a comment that ends with its line."""

import pathlib


def read(path):
    """The bytes that a file spells."""
    words = []
    for line in pathlib.Path(path).read_text(encoding="utf-8").splitlines():
        words += line.partition("#")[0].split()
    return bytes(int(word, 16) for word in words)


def names_and_bytes(directory, ending):
    """The EDIDs of a directory, in the order of their names. None is an error."""
    files = sorted(pathlib.Path(directory).glob("*" + ending))
    if not files:
        raise FileNotFoundError(f"no *{ending} in {directory}")
    return [(file.name.removesuffix(ending), read(file)) for file in files]

"""The program's command lines, as --help lists them and as documents write them."""

import re
import shlex

PROGRAM = "edid-composer"
SEPARATORS = {"|", "||", "&&", ";", "&", ">", ">>", "<", "2>", "2>&1", ")", "<<"}


class Help:
    """Commands and options, read from the program's own --help."""

    def __init__(self, scratch):
        self._scratch = scratch
        text = self._text()
        listed = re.search(r"^Subcommands:\n((?:  .*\n?)+)", text, re.MULTILINE)
        names = re.findall(r"^  (\w[\w-]*)", listed[1], re.MULTILINE) if listed else []
        if not names:
            raise RuntimeError(f"{PROGRAM} --help lists no commands:\n{text}")
        self.options = {"": options_in(text)}
        self.options.update({name: options_in(self._text(name)) for name in names})

    def _text(self, *command):
        status, text = self._scratch.run([PROGRAM, *command, "--help"])
        if status != 0:
            raise RuntimeError(f"{PROGRAM} {' '.join(command)} --help ended with {status}:\n{text}")
        return text

    @property
    def commands(self):
        return [name for name in self.options if name]

    def problems(self, words):
        """What a command line asks for that the program doesn't have."""
        command = words[0] if words and not words[0].startswith("-") else ""
        if command not in self.options:
            return [f"{PROGRAM} has no command {command}"]
        given = {word.partition("=")[0] for word in words if re.match(r"--?[a-zA-Z0-9]", word)}
        return [f"{PROGRAM} {command} has no option {option}" for option in sorted(given - self.options[command])]


def options_in(text):
    """The options that a help text lists: a line each, names first."""
    options = set()
    for names in re.findall(r"^ +(-[\w-]+(?:, ?-[\w-]+)*)", text, re.MULTILINE):
        options.update(re.split(r", ?", names))
    return options


def invocations(script):
    """The command lines of the program in a shell script, each as the words after the program's name."""
    found = []
    for line in script.replace("\\\n", " ").splitlines():
        lexer = shlex.shlex(line, posix=True, punctuation_chars="|&;<>()")
        lexer.whitespace_split = True
        try:
            words = list(lexer)
        except ValueError:  # A quote that goes on in the next line.
            continue
        current = None
        for word in words:
            if word in SEPARATORS or set(word) <= set("|&;<>()"):
                current = None
            elif current is not None:
                current.append(word)
            elif word in (PROGRAM, "$edid_composer") or word.endswith(f"/{PROGRAM}"):
                current = []
                found.append(current)
    return found

"""Does what "explain --want" tells to do, to the letter: in a platform's text and in a command line."""

import re


class NotUnderstood(Exception):
    pass


def _add_to_list(lines, line, entry):
    """Behind the last entry of the list whose key stands in a line, counted from 1."""
    index = line - 1
    while "]" not in lines[index].partition("#")[0]:
        index += 1
    before, _, behind = lines[index].rpartition("]")
    comma = ", " if before.strip() and not before.rstrip().endswith(("[", ",")) else ""
    lines[index] = f"{before}{comma}{entry}]{behind}"


def _add_to_table(lines, assignment, table):
    lines.insert(lines.index(f"[{table}]") + 1, assignment)


def _take_out(lines, line, text):
    before = lines[line - 1]
    lines[line - 1] = re.sub(rf'(?:"{re.escape(text)}"|\b{re.escape(text)}\s*=.*),?', "", before, count=1)
    if lines[line - 1] == before:
        raise NotUnderstood(f"{text} does not stand in line {line}: {before}")


def _replace(lines, line, old, new):
    before = lines[line - 1]
    position = re.search(rf"\b{re.escape(old)}\b", before[::-1]) or re.search(rf"\b{re.escape(old)}\b", before)
    if position is None:
        raise NotUnderstood(f"{old} does not stand in line {line}: {before}")
    begin = before.rindex(old)
    lines[line - 1] = before[:begin] + new + before[begin + len(old) :]


def _set(lines, line, key, value):
    if not lines[line - 1].startswith(key.rpartition(".")[2]):
        raise NotUnderstood(f"{key} does not stand in line {line}: {lines[line - 1]}")
    lines[line - 1] = f"{key.rpartition('.')[2]} = {value}"


class Instructions:
    """A platform and the other arguments of a composition, changed step by step."""

    def __init__(self, platform, arguments):
        self.lines = platform.splitlines()
        self.arguments = list(arguments)

    def platform(self):
        return "\n".join(self.lines) + "\n"

    def follow(self, steps):
        """Steps as the JSON document has them. Those further down come first: lines keep their numbers."""
        for step in sorted(steps, key=lambda step: step.get("line", 0), reverse=True):
            self._follow(step["text"])

    def _follow(self, text):
        place = r"[\w. ]+:(\d+)"
        for pattern, do in (
            (rf"add (\S+) to \w+ \({place}\)", lambda entry, line: _add_to_list(self.lines, int(line), entry)),
            (rf"set ([\w.]+) = (\S+) \({place}\)", lambda key, value, line: _set(self.lines, int(line), key, value)),
            (rf"add audio\.(\w+ = 0x\w+) \(.*\) behind {place}",
             lambda entry, line: self.lines.insert(int(line), entry)),
            (rf'take "([^"]+)" out of \w+ \({place}\)', lambda entry, line: _take_out(self.lines, int(line), entry)),
            (rf"take audio\.(\w+) out \({place}\)", lambda key, line: _take_out(self.lines, int(line), key)),
            (rf"write (\S+) in place of (\S+) in \w+ \({place}\)",
             lambda new, old, line: _replace(self.lines, int(line), old, new)),
            (r"add (\w+ = \S+) to the table (\S+) of", lambda entry, table: _add_to_table(self.lines, entry, table)),
            (r"give (--\S+) (\w+)", self._give),
            (r"leave (--\S+) away", self.arguments.remove),
        ):
            if found := re.match(pattern, text):
                do(*found.groups())
                return
        raise NotUnderstood(text)

    def _give(self, option, value):
        if option in self.arguments:
            position = self.arguments.index(option)
            del self.arguments[position : position + 2]
        self.arguments += [option, value]

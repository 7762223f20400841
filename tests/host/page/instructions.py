"""Does what "explain --want" says has to be done: in a platform's text and in a command line. Steps are data."""

import re

DOMAIN = "platform.software.drivers.vorex.edid"


class NotUnderstood(Exception):
    pass


def _table(key):
    return f"[{DOMAIN}.audio]" if key.startswith("audio.") else f"[{DOMAIN}]"


def _own_name(key):
    return key.rpartition(".")[2]


def _entry(value):
    """A list's entry as it stands in a line; numbers may be written in other ways."""
    return re.escape(value) if value.startswith('"') else rf"\b{value}\b"


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
            action = getattr(self, "_" + step["action"].replace(" ", "_"), None)
            if action is None:
                raise NotUnderstood(step["action"])
            action(step)

    def _add_to_list(self, step):
        """Behind the last entry of the list whose key stands in a line, counted from 1."""
        if "line" not in step:
            self._add_key(step["key"], f"[{step['value']}]")
            return
        index = step["line"] - 1
        while "]" not in self.lines[index].partition("#")[0]:
            index += 1
        before, _, behind = self.lines[index].rpartition("]")
        comma = ", " if before.strip() and not before.rstrip().endswith(("[", ",")) else ""
        self.lines[index] = f"{before}{comma}{step['value']}]{behind}"

    def _last_entry(self, step, value):
        found = list(re.finditer(_entry(value) + ",?", self.lines[step["line"] - 1].partition("#")[0]))
        if not found:
            raise NotUnderstood(f"{value} does not stand in line {step['line']}: {self.lines[step['line'] - 1]}")
        return found[-1].span()

    def _take_out_of_list(self, step):
        begin, end = self._last_entry(step, step["value"])
        line = self.lines[step["line"] - 1]
        self.lines[step["line"] - 1] = line[:begin] + line[end:]

    def _replace_in_list(self, step):
        begin, end = self._last_entry(step, step["old_value"])
        line = self.lines[step["line"] - 1]
        self.lines[step["line"] - 1] = f"{line[:begin]}{step['value']},{line[end:]}"

    def _set(self, step):
        if "line" in step:
            self._check(step)
            self.lines[step["line"] - 1] = f"{_own_name(step['key'])} = {step['value']}"
        else:
            self._add_key(step["key"], step["value"])

    def _take_out(self, step):
        self._check(step)
        self.lines[step["line"] - 1] = ""

    def _check(self, step):
        line = self.lines[step["line"] - 1]
        if not line.startswith(_own_name(step["key"])):
            raise NotUnderstood(f"{step['key']} does not stand in line {step['line']}: {line}")

    def _add_key(self, key, value):
        if _table(key) not in self.lines:
            self.lines.append(_table(key))
        self.lines.insert(self.lines.index(_table(key)) + 1, f"{_own_name(key)} = {value}")

    def _give_option(self, step):
        if step["key"] in self.arguments:
            position = self.arguments.index(step["key"])
            del self.arguments[position : position + 2]
        self.arguments += [step["key"], step["value"]]

    def _drop_option(self, step):
        self.arguments.remove(step["key"])

"""docs/performance.md: places for figures, between markers, and Markdown tables."""

import re


def table(heads, rows, left=1):
    """A Markdown table whose first columns are texts, the others numbers."""
    yield "| " + " | ".join(heads) + " |"
    yield "| " + " | ".join("---" if i < left else "---:" for i in range(len(heads))) + " |"
    for row in rows:
        yield "| " + " | ".join(row) + " |"


def number(value):
    """Three digits that count, and thousands apart."""
    if value == int(value) or value >= 100:
        return f"{value:,.0f}"
    return f"{value:.2f}" if value < 10 else f"{value:.1f}"


def replace_section(file, name, lines):
    """Puts lines into the place of that name."""
    text = file.read_text(encoding="utf-8")
    pattern = rf"(<!-- figures: {name} -->\n).*?(<!-- end of figures -->)"
    text, count = re.subn(pattern, lambda found: found[1] + "\n".join(lines) + "\n" + found[2], text, flags=re.DOTALL)
    if count != 1:
        raise SystemExit(f'{file} has {count} places for the figures "{name}"')
    file.write_text(text, encoding="utf-8")

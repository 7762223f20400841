"""Makes one HTML file of the page's parts: markup, style, scripts, samples and the core."""

import argparse
import base64
import hashlib
import json
import pathlib
import re

# In this order they are one script; a name is made before what uses it when it begins.
SCRIPTS = ["elements", "core", "state", "link", "editor", "files", "displays", "settings", "platform", "summary", "decisions",
           "bytes", "comparison", "texts", "want", "tabs", "downloads", "page"]
# Nothing may be asked for, or sent; scripts and styles are the file's own, by their hashes.
POLICY = {
    "default-src": "'none'",
    "script-src": "{script} 'wasm-unsafe-eval'",
    "style-src": "{style}",
    "worker-src": "blob:",
    "img-src": "data:",
    "base-uri": "'none'",
    "form-action": "'none'",
    "require-trusted-types-for": "'script'",
    "trusted-types": "worker",
}


def arguments():
    parser = argparse.ArgumentParser(description=__doc__)
    parser.add_argument("--page", type=pathlib.Path, required=True, help="folder of page.html, style.css and the scripts")
    parser.add_argument("--core", type=pathlib.Path, required=True, help="the core's script; the .wasm stands beside it")
    parser.add_argument("--samples", type=pathlib.Path, required=True, help="folder with sinks/ and platforms/")
    parser.add_argument("--output", type=pathlib.Path, required=True)
    return parser.parse_args()


def source_of_hash(text):
    """As a policy names a script or a style."""
    return f"'sha256-{base64.b64encode(hashlib.sha256(text.encode()).digest()).decode()}'"


def policy_of(script, style):
    sources = {"script": source_of_hash(script), "style": source_of_hash(style)}
    return "; ".join(f"{name} {value.format(**sources)}" for name, value in POLICY.items())


def script_of(folder):
    parts = [(folder / "script" / f"{name}.js").read_text() for name in SCRIPTS]
    return '"use strict";\n(() => {\n' + "\n".join(parts) + "})();\n"


def built_in(folder):
    """The samples, as JSON that no markup can end."""
    files = {kind: {path.name: path.read_text() for path in sorted((folder / kind).iterdir())}
             for kind in ("sinks", "platforms")}
    return json.dumps(files).replace("<", "\\u003c")


def unbroken(name, text):
    """What stands in a script element as it is must not end it."""
    if re.search(r"</script|<!--", text, re.IGNORECASE):
        raise SystemExit(f"{name} holds a text that a script element cannot hold")
    return text


def main():
    options = arguments()
    style = (options.page / "style.css").read_text()
    script = unbroken("the page's script", script_of(options.page))
    worker = options.core.read_text() + "\n" + (options.page / "worker.js").read_text()
    parts = {
        "policy": policy_of(script, style),
        "style": style,
        "script": script,
        "worker": unbroken("the worker's script", worker),
        "core": base64.b64encode(options.core.with_suffix(".wasm").read_bytes()).decode(),
        "built_in": built_in(options.samples),
    }
    template = (options.page / "page.html").read_text()
    # One pass: what is put in is not looked at again.
    page = re.sub(r"\{\{(\w+)\}\}", lambda match: parts[match[1]], template)
    options.output.parent.mkdir(parents=True, exist_ok=True)
    options.output.write_text(page)
    print(f"{options.output}: {options.output.stat().st_size:,} bytes")


if __name__ == "__main__":
    main()

// The platform: where its text comes from, and what is found in it.

const platform = (() => {
  const DEFAULT_NAME = "default platform";
  const OWN_NAME = "platform.toml";
  const MOST_FINDINGS = 100;
  const select = byId("platforms");
  let defaultText = "";
  let undone = null;  // What "Undo" brings back.

  const draw = () => {
    editor.text = state.platform ? state.platform.text : defaultText;
    select.value = state.platform ? "" : DEFAULT_NAME;
  };

  const remember = () => {
    undone = state.platform;
    byId("platform-undo").hidden = false;
  };

  const take = next => {
    remember();
    state.platform = next;
    draw();
    changed();
  };

  const open = async file => {
    try {
      const text = new TextDecoder("utf-8", { fatal: true }).decode(await bytesOf(file));
      const problem = editor.refusal(text);
      if (problem) {
        throw new Error(`${file.name} has ${problem}.`);
      }
      take({ name: file.name, text });
    } catch (failure) {
      tell(failure instanceof TypeError ? `${file.name}: is no text in UTF-8` : failure.message);
    }
  };

  const listen = text => {
    defaultText = text;
    select.append(element("option", { value: "" }, "one's own"),
      ...[DEFAULT_NAME, ...Object.keys(builtIn.platforms)].map(name => element("option", { value: name }, name)));
    select.addEventListener("change", () => {
      const name = select.value;
      if (name) {
        take(name === DEFAULT_NAME ? null : { name, text: builtIn.platforms[name] });
      }
    });
    byId("platform-file").addEventListener("change", event => {
      [...event.target.files].forEach(open);
      event.target.value = "";
    });
    byId("platform-undo").addEventListener("click", () => {
      [state.platform, undone] = [undone, state.platform];
      draw();
      changed();
    });
    editor.field.addEventListener("input", () => {
      state.platform = { name: state.platform ? state.platform.name : OWN_NAME, text: editor.text };
      select.value = "";
      editor.split();
      editor.draw();
      changed();
    });
  };

  /** What check-platform finds, at its lines and in a list. */
  const showFindings = (list, inAll) => {
    editor.show(list);
    const number = severity => list.filter(finding => finding.severity === severity).length;
    const parts = ["error", "warning", "note"].filter(number).map(severity => counted(number(severity), severity));
    byId("finding-count").textContent = inAll > list.length ? `${inAll} findings, of which the first are shown.`
      : parts.join(", ") || "No findings.";
    const row = ({ severity, line, key, text }) => element("li", { class: severity }, line ? lineLink(line) : null, " ",
      element("b", {}, severity), " ", key ? [element("code", {}, key), ": "] : null, text);
    fill(byId("findings"), limited(list, MOST_FINDINGS).map(row),
      list.length > MOST_FINDINGS ? element("li", {}, "and more") : null);
  };

  return { draw, listen, open, take, showFindings, get text() { return editor.text; }, ownName: OWN_NAME };
})();

// Displays, settings and platform: what the user gives. Each change ends in changed(), which page.js defines.

const builtIn = JSON.parse(byId("built-in").textContent);
const MOST_FILE_BYTES = 1024 * 1024;  // As the program reads; the core says so too, but a larger file is not even read.

const bytesOf = async file => {
  if (file.size > MOST_FILE_BYTES) {
    throw new Error(`${file.name}: larger than 1 MiB`);
  }
  return new Uint8Array(await file.arrayBuffer());
};

const displays = (() => {
  const list = byId("sinks");
  const problem = byId("sink-problem");

  const complain = texts => {
    problem.hidden = texts.length === 0;
    fill(problem, texts.map(text => element("span", {}, text)));
  };

  const choice = (index, name, remove) => element("div", { class: "sink" },
    element("label", {},
      element("input", { type: "radio", name: "sink", value: index, checked: state.active === index, onchange: () => {
        state.active = index;
        changed();
      } }), element("span", {}, name)),
    remove && element("button", { type: "button", class: "remove", "aria-label": `Remove ${name}`, onclick: remove }, "✕"));

  const removed = index => {
    state.sinks.splice(index, 1);
    state.active = state.active === index ? Math.min(index, state.sinks.length - 1) : state.active - (state.active > index);
    draw();
    list.querySelector("input:checked").focus();
    changed();
  };

  const draw = () => fill(list, list.querySelector("legend"), choice(NO_SINK, "no display", null),
    state.sinks.map((sink, index) => choice(index, sink.name, () => removed(index))));

  /** Adds each that is an EDID, and says what is wrong with the others. */
  const add = async files => {
    const problems = [];
    for (const { name, bytes } of files) {
      try {
        const { text } = await core.ask("read", { name }, await bytes());
        state.sinks.push({ name, text });
        state.active = state.sinks.length - 1;
      } catch (failure) {
        problems.push(failure.message);
      }
    }
    complain(problems);
    draw();
    changed();
  };

  const addFiles = files => add([...files].map(file => ({ name: file.name, bytes: () => bytesOf(file) })));
  const addText = text => add([{ name: "pasted text", bytes: () => new TextEncoder().encode(text.slice(0, MOST_FILE_BYTES + 1)) }]);

  const listen = () => {
    const samples = byId("samples");
    for (const name of Object.keys(builtIn.sinks)) {
      samples.append(element("option", { value: name }, name));
    }
    samples.addEventListener("change", () => {
      const name = samples.value;
      samples.value = "";
      if (name) {
        add([{ name, bytes: () => new TextEncoder().encode(builtIn.sinks[name]) }]);
      }
    });
    byId("sink-files").addEventListener("change", event => {
      addFiles(event.target.files);
      event.target.value = "";
    });
    byId("paste-open").addEventListener("click", () => {
      const paste = byId("paste");
      paste.hidden = !paste.hidden;
      byId("paste-open").setAttribute("aria-expanded", String(!paste.hidden));
      if (!paste.hidden) {
        byId("paste-text").focus();
      }
    });
    byId("paste-read").addEventListener("click", () => {
      addText(byId("paste-text").value);
      byId("paste-text").value = "";
    });
    addEventListener("paste", event => {
      if (event.target instanceof HTMLInputElement || event.target instanceof HTMLTextAreaElement) {
        return;
      }
      const { files } = event.clipboardData;
      const text = event.clipboardData.getData("text");
      if (files.length) {
        addFiles(files);
      } else if (text) {
        addText(text);
      }
    });
    // Anywhere on the page; what ends in .toml is a platform.
    const drop = byId("drop");
    addEventListener("dragover", event => {
      event.preventDefault();
      drop.classList.add("over");
    });
    addEventListener("dragleave", event => drop.classList.toggle("over", event.relatedTarget !== null));
    addEventListener("drop", event => {
      event.preventDefault();
      drop.classList.remove("over");
      const isPlatform = file => file.name.toLowerCase().endsWith(".toml");
      const files = [...event.dataTransfer.files];
      files.filter(isPlatform).forEach(platform.open);
      const edids = files.filter(file => !isPlatform(file));
      const text = event.dataTransfer.getData("text");
      if (edids.length) {
        addFiles(edids);
      } else if (!files.length && text) {
        addText(text);
      }
    });
  };

  return { draw, listen, add };
})();

const settings = (() => {
  const form = byId("settings");
  let descriptions = [];

  const take = (name, value) => {
    if (value === "" || value === false) {
      delete state.settings[name];
    } else {
      state.settings[name] = value;
    }
    changed();
  };

  const control = ({ name, value, is_flag: isFlag }, id, described) => {
    const given = state.settings[name];
    const common = { id, "aria-describedby": described };
    if (isFlag) {
      return element("input", { ...common, type: "checkbox", checked: given === true,
        onchange: event => take(name, event.target.checked) });
    }
    if (value.includes("|")) {
      const options = ["", ...value.split("|")];
      return element("select", { ...common, onchange: event => take(name, event.target.value) }, options.map(option =>
        element("option", { value: option, selected: option === (given || "") }, option || "as the platform says")));
    }
    const field = element("input", { ...common, type: "text", autocomplete: "off", spellcheck: "false", maxlength: 100,
      placeholder: value, oninput: event => take(name, event.target.value.trim()) });
    field.value = typeof given === "string" ? given : "";
    return field;
  };

  const row = description => {
    const id = `setting-${description.name}`;
    const words = description.name.replaceAll("-", " ");
    const label = element("label", { for: id }, words.length < 3 ? words.toUpperCase() : words);
    return element("div", { class: description.is_flag ? "setting flag" : "setting" }, label,
      control(description, id, `${id}-help`),
      element("p", { class: "quiet", id: `${id}-help` }, description.description),
      element("p", { class: "wrong", id: `${id}-wrong`, role: "alert" }));
  };

  const traces = () => element("div", { class: "setting flag" },
    element("label", { for: "traces" }, "traces"),
    element("input", { type: "checkbox", id: "traces", checked: state.traces, "aria-describedby": "traces-help", onchange: event => {
      state.traces = event.target.checked;
      changed();
    } }), element("p", { class: "quiet", id: "traces-help" }, "Trace every decision, among the messages"));

  const draw = () => fill(form, descriptions.map(row), traces());

  return {
    draw,
    listen: given => {
      descriptions = given;
      form.addEventListener("submit", event => event.preventDefault());
    },
    /** Puts what is wrong below the settings that it is about. */
    complain: problems => {
      for (const { name } of descriptions) {
        const problem = problems.find(one => one.place === "setting" && one.name === name);
        byId(`setting-${name}-wrong`).textContent = problem ? problem.text : "";
        byId(`setting-${name}`).setAttribute("aria-invalid", String(Boolean(problem)));
      }
    },
  };
})();

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
    select.append(element("option", { value: "" }, "one's own"), element("option", { value: DEFAULT_NAME }, DEFAULT_NAME),
      ...Object.keys(builtIn.platforms).map(name => element("option", { value: name }, name)));
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
    fill(byId("findings"), limited(list, MOST_FINDINGS).map(({ severity, line, key, text }) => element("li", { class: severity },
      line ? element("button", { type: "button", onclick: () => editor.goTo(line) }, `line ${line}`) : null,
      element("b", {}, severity), " ", key ? element("code", {}, key) : null, key ? ": " : "", text)),
    list.length > MOST_FINDINGS ? element("li", {}, "and more") : null);
  };

  return { draw, listen, open, take, showFindings, get text() { return editor.text; }, ownName: OWN_NAME };
})();

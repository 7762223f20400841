// The EDIDs of displays: dropped, pasted, opened or taken from the samples. Each change ends in changed(), of page.js.

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
    remove && element("button", { type: "button", class: "remove", "aria-label": `Remove ${name}`, onclick: remove },
      "✕"));

  const removed = index => {
    state.sinks.splice(index, 1);
    state.active = state.active === index ? Math.min(index, state.sinks.length - 1)
      : state.active - (state.active > index ? 1 : 0);
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
  const addText = text => add([{ name: "pasted text", bytes: () => bytesOfText(text.slice(0, MOST_FILE_BYTES + 1)) }]);

  const listen = () => {
    const samples = byId("samples");
    for (const name of Object.keys(builtIn.sinks)) {
      samples.append(element("option", { value: name }, name));
    }
    samples.addEventListener("change", () => {
      const name = samples.value;
      samples.value = "";
      if (name) {
        add([{ name, bytes: () => bytesOfText(builtIn.sinks[name]) }]);
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

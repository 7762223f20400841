// The settings' form, made from what the core says of them.

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

  const takeTraces = event => {
    state.traces = event.target.checked;
    changed();
  };
  const traces = () => element("div", { class: "setting flag" },
    element("label", { for: "traces" }, "traces"),
    element("input", { type: "checkbox", id: "traces", checked: state.traces, "aria-describedby": "traces-help",
      onchange: takeTraces }),
    element("p", { class: "quiet", id: "traces-help" }, "Trace every decision, among the messages"));

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

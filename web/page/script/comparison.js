// Two EDIDs side by side, and all displays in front of the same platform.

const NO_DISPLAY = "There is no display to compare with: open the EDID of one, or take a sample.";

const differences = { left: "sink", right: "new", changesOnly: true };
let lastHex = "";  // The new EDID as text.

/** What can be compared, by a key that stays when the list of displays changes. */
const comparable = () => {
  const keyOf = index => index === state.active ? "sink" : `display ${index}`;
  const entries = state.sinks.map((sink, index) => [keyOf(index), sink.name, sink]);
  return [...entries, ["new", "new EDID", { name: "new EDID", text: lastHex }]];
};

const differenceTable = (rows, left, right) => {
  const shown = rows.filter(row => !differences.changesOnly || row.left !== row.right);
  if (!shown.length) {
    return element("p", {}, "No field differs.");
  }
  const headers = ["Field", left, right];
  return [element("table", { class: "differences" },
    element("thead", {}, element("tr", {}, headers.map(header => element("th", { scope: "col" }, header)))),
    element("tbody", {}, limited(shown).map(row => tableRow(headers, [row.field, row.left, row.right], true,
      { class: row.left !== row.right ? "differs" : "" })))), leftOut(shown)];
};

const showDifferences = ({ explanation, hex }) => {
  lastHex = hex;
  if (!state.sinks.length) {
    fill(byId("differences"), element("h3", {}, "Field by field"), element("p", {}, NO_DISPLAY));
    return;
  }
  const choices = comparable();
  const keys = choices.map(([key]) => key);
  differences.left = keys.includes(differences.left) ? differences.left : keys[0];
  differences.right = keys.includes(differences.right) ? differences.right : "new";
  const chosen = side => choices.find(([key]) => key === differences[side]);
  const body = element("div", { class: "table" });
  const draw = async () => {
    const [left, right] = [chosen("left"), chosen("right")];
    try {
      const rows = left[0] === "sink" && right[0] === "new"
        ? explanation.comparison.map(row => ({ field: row.field, left: row.sink, right: row.new_edid }))
        : (await core.ask("compare", { left: left[2], right: right[2] })).rows;
      fill(body, differenceTable(rows, left[1], right[1]));
    } catch (failure) {
      fill(body, element("p", { class: "problem" }, failure.message));
    }
  };
  const select = (side, label) => element("label", {}, label, element("select", { onchange: event => {
    differences[side] = event.target.value;
    draw();
  } }, choices.map(([key, name]) => element("option", { value: key, selected: differences[side] === key }, name))));
  const changesOnly = element("input", { type: "checkbox", checked: differences.changesOnly, onchange: event => {
    differences.changesOnly = event.target.checked;
    draw();
  } });
  fill(byId("differences"), element("h3", {}, "Field by field"),
    element("div", { class: "filters" }, select("left", "Left "), select("right", "Right "),
      element("label", {}, changesOnly, " only what differs")), body);
  draw();
};

/** A row for each display: what the same box would show in front of it. */
const showDisplays = async () => {
  const headers = ["Display", "Best video", "Preferred video", "Audio", "Lost"];
  const row = async (sink, index) => {
    const name = element("button", { type: "button", class: "source", onclick: () => {
      state.active = index;
      displays.draw();
      changed();
    } }, sink.name);
    try {
      const { explanation, problems } = await core.ask("compose", composition(sink));
      if (!explanation) {
        return [name, problems.map(problem => problem.text).join("; "), "", "", ""];
      }
      const { best_video: best, preferred_video: preferred, audio, lost } = explanation.summary;
      return [name, best || "none", preferred || "none", lines(audio), lostOf(lost)];
    } catch (failure) {
      return [name, failure.message, "", "", ""];
    }
  };
  const rows = await Promise.all(state.sinks.map(row));
  fill(byId("displays"), element("h3", {}, "The same box in front of each display"),
    rows.length ? table(headers, rows) : element("p", {}, NO_DISPLAY));
};

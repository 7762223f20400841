// What became of every mode and format. A subject or a section that is new in the document of explain appears by
// itself.

/** Of the sections that the summary does not count: what was derived, which nobody misses where it is left out. */
const DERIVED_SECTIONS = { derived: "Derived values", hdmi2: "HDMI 2" };

const sectionTitles = ({ summary, decisions }) => {
  const titles = new Map(summary.counts.map(({ section, title }) => [section, title]));
  for (const { section } of decisions) {
    if (!titles.has(section)) {
      titles.set(section, DERIVED_SECTIONS[section] || section[0].toUpperCase() + section.slice(1));
    }
  }
  return titles;
};

/** The class of a verdict; one that is new has none. */
const verdictClass = ({ verdict, section }) =>
  ({ "offered": "offered", "changed": "changed", "left out": section in DERIVED_SECTIONS ? "idle" : "out" })[verdict] || "";

const decisionFilter = { text: "", verdict: "", section: "" };

const decisionRow = (decision, headers) => tableRow(headers, [
  decision.name, element("span", { class: `verdict ${verdictClass(decision)}` }, decision.verdict_text),
  decision.sentence,
  element("span", { class: "sources" }, decision.sources.map(source => source.kind === "platform" && source.line
    ? lineLink(source.line, source.text) : element("span", {}, source.text)))], true,
{ "data-section": decision.section });

const isShown = decision => {
  const { text, verdict, section } = decisionFilter;
  const { name, verdict_text: verdictText, sentence, sources } = decision;
  const words = [name, verdictText, sentence, ...sources.map(source => source.text)];
  return (!verdict || decision.verdict === verdict) && (!section || decision.section === section) &&
    words.join("\n").toLowerCase().includes(text.trim().toLowerCase());
};

const showDecisions = ({ explanation }) => {
  const panel = byId("decisions");
  const titles = sectionTitles(explanation);
  const headers = ["What", "Verdict", "Why", "From"];
  const body = element("div", { class: "table" });
  const count = element("output", { "aria-live": "polite" });
  const drawRows = () => {
    const shown = explanation.decisions.filter(isShown);
    count.textContent = `${shown.length} of ${explanation.decisions.length}`;
    const groups = [...titles].map(([id, title]) => [title, shown.filter(decision => decision.section === id)]);
    fill(body, element("table", { class: "decisions" },
      element("thead", {}, element("tr", {}, headers.map(header => element("th", { scope: "col" }, header)))),
      groups.filter(([, rows]) => rows.length).map(([title, rows]) => element("tbody", {},
        element("tr", {}, element("th", { colspan: 4, scope: "rowgroup" }, title)),
        limited(rows).map(decision => decisionRow(decision, headers))))), leftOut(shown));
  };
  const select = (name, label, options) => element("label", {}, label, element("select", { onchange: event => {
    decisionFilter[name] = event.target.value;
    drawRows();
  } }, options.map(([value, text]) => element("option", { value, selected: decisionFilter[name] === value }, text))));
  const verdicts = [...new Set(explanation.decisions.map(decision => decision.verdict))];
  const text = element("input", { type: "search", placeholder: "1080p, audio_mask, :83", oninput: event => {
    decisionFilter.text = event.target.value;
    drawRows();
  } });
  text.value = decisionFilter.text;
  fill(panel, element("h3", {}, "What became of every mode and format"),
    element("div", { class: "filters" }, element("label", {}, "Text ", text),
      select("verdict", "Verdict ", [["", "all"], ...verdicts.map(verdict => [verdict, verdict])]),
      select("section", "Subject ", [["", "all"], ...titles]), count),
    body);
  drawRows();
};

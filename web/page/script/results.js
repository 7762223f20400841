// What came of a composition, part by part. Each part is made from the document of explain, so that a subject that is
// new there appears by itself.

const SHOWN_LOST = 6;

const showProblems = problems => fillAnew(byId("problems"), problems, () => problems.map(({ place, line, text }) =>
  element("p", { class: "problem" }, element("b", {}, line ? `${place}, line ${line}` : place), ": ", text)));

/** For those who hear the page: what has changed at the top of it. */
const announceSummary = ({ title, summary }) => fillAnew(byId("heard"), [title, summary], () =>
  `${title}: at best ${summary.best_video || "no video"}, ${summary.lost.length || "nothing"} lost.`);

const warningsOf = ({ sink, warnings }) => [
  ...(sink ? sink.status.gaps : []).map(text => element("p", { class: "warning" }, element("b", {}, "Display: "), text)),
  ...warnings.map(text => element("p", { class: "warning" }, element("b", {}, "Warning: "), text)),
];

const lines = texts => texts.length ? texts.map(text => element("span", {}, text)) : "none";

const lostOf = lost => lost.length <= SHOWN_LOST ? lines(lost)
  : [...lines(lost.slice(0, SHOWN_LOST)), element("details", {}, element("summary", {}, `and ${lost.length - SHOWN_LOST} more`), lines(lost.slice(SHOWN_LOST)))];

const showSummary = explanation => {
  const { summary } = explanation;
  const fact = (name, value, kind = "") => element("div", { class: kind }, element("dt", {}, name), element("dd", {}, value));
  fill(byId("summary"),
    warningsOf(explanation),
    element("dl", {},
      fact("Best video", summary.best_video || "none", "big"),
      fact("Preferred video", summary.preferred_video || "none", "big"),
      fact("Audio", lines(summary.audio)),
      explanation.sink ? fact("Lost: the display has it, the box does not show it", lostOf(summary.lost), summary.lost.length ? "lost" : "") : null,
      summary.reasons.length ? fact("Most common reasons", lines(summary.reasons.map(({ reason, count }) => `${count} × ${reason}`))) : null),
    element("ul", { class: "counts" }, summary.counts.map(({ title, offered, left_out: leftOutCount }) => element("li", {},
      title, ": ", element("b", {}, `${offered} offered`), `, ${leftOutCount} left out`))));
};

/** Of the sections that the summary does not count. */
const SECTION_TITLES = { derived: "Derived values", hdmi2: "HDMI 2" };

const sectionTitles = ({ summary, decisions }) => {
  const titles = new Map(summary.counts.map(({ section, title }) => [section, title]));
  for (const { section } of decisions) {
    if (!titles.has(section)) {
      titles.set(section, SECTION_TITLES[section] || section[0].toUpperCase() + section.slice(1));
    }
  }
  return titles;
};

/** The class of a verdict; one that is new has none. */
const verdictClass = ({ verdict, section }) =>
  ({ "offered": "offered", "changed": "changed", "left out": section === "derived" || section === "hdmi2" ? "idle" : "out" })[verdict] || "";

const decisionFilter = { text: "", verdict: "", section: "" };

const decisionRow = (decision, headers) => tableRow(headers, [
  decision.name, element("span", { class: `verdict ${verdictClass(decision)}` }, decision.verdict_text), decision.sentence,
  element("span", { class: "sources" }, decision.sources.map(source => source.kind === "platform" && source.line
    ? element("button", { type: "button", class: "source", onclick: () => editor.goTo(source.line) }, source.text)
    : element("span", {}, source.text)))], true, { "data-section": decision.section });

const isShown = decision => {
  const { text, verdict, section } = decisionFilter;
  const words = [decision.name, decision.verdict_text, decision.sentence, ...decision.sources.map(source => source.text)];
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

const showReport = ({ report, sink_report: sinkReport, explanation }) => fill(byId("report"),
  element("h3", {}, "Report"),
  element("div", { class: "reports" },
    element("figure", {}, element("figcaption", {}, "New EDID"), element("pre", { tabindex: 0 }, report)),
    sinkReport ? element("figure", {}, element("figcaption", {}, explanation.sink.source), element("pre", { tabindex: 0 }, sinkReport)) : null));

const showKeys = ({ explanation: { keys } }) => {
  const lineNumber = text => Number((/^line (\d+)$/.exec(text) || [])[1]);
  const place = text => lineNumber(text)
    ? element("button", { type: "button", class: "source", onclick: () => editor.goTo(lineNumber(text)) }, text) : text;
  fill(byId("keys"), element("h3", {}, "What was read of the platform"),
    table(["Key", "Value", "Default", "Limits", "From"], limited(keys).map(key =>
      [element("code", {}, key.key), key.value, key.default, key.limits, place(key.from)])), leftOut(keys));
};

const showMessages = ({ messages }) => fill(byId("messages"), element("h3", {}, "What the library says"),
  messages ? element("pre", { tabindex: 0 }, messages) : element("p", {}, "Nothing."));

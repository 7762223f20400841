// What comes first of a composition: what is wrong, what is offered at best, what was lost and why.

const SHOWN_LOST = 6;

const showProblems = problems => fillAnew(byId("problems"), problems, () => problems.map(({ place, line, text }) =>
  element("p", { class: "problem" }, element("b", {}, line ? `${place}, line ${line}` : place), ": ", text)));

/** For those who hear the page: what has changed at the top of it. */
const announceSummary = ({ title, summary }) => fillAnew(byId("heard"), [title, summary], () =>
  `${title}: at best ${summary.best_video || "no video"}, ${summary.lost.length || "nothing"} lost.`);

const warningsOf = ({ sink, warnings }) => [
  ...(sink ? sink.status.gaps : []).map(text => ["Display: ", text]), ...warnings.map(text => ["Warning: ", text]),
];

const lines = texts => texts.length ? texts.map(text => element("span", {}, text)) : "none";

const lostOf = lost => lost.length <= SHOWN_LOST ? lines(lost) : [lines(lost.slice(0, SHOWN_LOST)),
  element("details", {}, element("summary", {}, `and ${lost.length - SHOWN_LOST} more`),
    lines(lost.slice(SHOWN_LOST)))];

const showSummary = explanation => {
  const { summary } = explanation;
  const fact = (name, value, kind = "") =>
    element("div", { class: kind }, element("dt", {}, name), element("dd", {}, value));
  const lost = () => fact("Lost: the display has it, the box does not show it", lostOf(summary.lost),
    summary.lost.length ? "lost" : "");
  const reasons = () => fact("Most common reasons",
    lines(summary.reasons.map(({ reason, count: times }) => `${times} × ${reason}`)));
  const count = ({ title, offered, left_out: leftOutCount }) => element("li", {},
    title, ": ", element("b", {}, `${offered} offered`), `, ${leftOutCount} left out`);
  fill(byId("summary"),
    warningsOf(explanation).map(([of, text]) => element("p", { class: "warning" }, element("b", {}, of), text)),
    element("dl", {},
      fact("Best video", summary.best_video || "none", "big"),
      fact("Preferred video", summary.preferred_video || "none", "big"),
      fact("Audio", lines(summary.audio)),
      explanation.sink ? lost() : null,
      summary.reasons.length ? reasons() : null),
    element("ul", { class: "counts" }, summary.counts.map(count)));
};

// What is read rather than looked at: reports, the platform's keys, what the library says.

const reportOf = (title, text) =>
  element("figure", {}, element("figcaption", {}, title), element("pre", { tabindex: 0 }, text));

const showReport = ({ report, sink_report: sinkReport, explanation }) => fill(byId("report"),
  element("h3", {}, "Report"),
  element("div", { class: "reports" },
    reportOf("New EDID", report), sinkReport ? reportOf(explanation.sink.source, sinkReport) : null));

const showKeys = ({ explanation: { keys } }) => {
  const lineNumber = text => Number((/^line (\d+)$/.exec(text) || [])[1]);
  const place = text => lineNumber(text) ? lineLink(lineNumber(text)) : text;
  fill(byId("keys"), element("h3", {}, "What was read of the platform"),
    table(["Key", "Value", "Default", "Limits", "From"], limited(keys).map(key =>
      [element("code", {}, key.key), key.value, key.default, key.limits, place(key.from)])), leftOut(keys));
};

const showMessages = ({ messages }) => fill(byId("messages"), element("h3", {}, "What the library says"),
  messages ? element("pre", { tabindex: 0 }, messages) : element("p", {}, "Nothing."));

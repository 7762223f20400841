// Composes anew after each change; while one composition runs, the changes since wait for the next.

const tell = text => { byId("told").textContent = text; };

let isComposing = false;
let isStale = false;

const show = result => {
  const { explanation, problems } = result;
  const ofPlatform = problems.filter(problem => problem.place === "platform" && problem.line)
    .map(problem => ({ severity: "error", key: "", ...problem }));
  // What is wrong with the settings' table of a platform is among the findings already.
  const isFound = ({ line }) => result.findings.some(finding => finding.line === line && finding.severity === "error");
  const findings = [...ofPlatform.filter(problem => !isFound(problem)), ...result.findings];
  platform.showFindings(findings, result.findings_in_all || 0);
  settings.complain(problems);
  showProblems(problems);
  byId("results").classList.toggle("old", !explanation);
  downloads.show(explanation ? result : null);
  if (!explanation) {
    byId("title").textContent = "Nothing is composed";
    return;
  }
  byId("title").textContent = explanation.title;
  document.title = explanation.title;
  byId("made").textContent = `${explanation.program}, composed in ${Math.max(1, Math.round(result.milliseconds))} ms.`;
  showSummary(explanation);
  announceSummary(explanation);
  tabs.show(result);
};

/** Whoever waits for the page hears of each composition. */
const announce = () => document.dispatchEvent(new CustomEvent("composed"));

const compose = async () => {
  try {
    show(await core.ask("compose", composition()));
  } catch (failure) {
    show({ findings: [], problems: [{ place: "page", text: failure.message }] });
  }
  announce();
};

/** The fragment follows what is composed, so that the address can be copied as well. */
const remember = (() => {
  let timer = 0;
  return () => {
    clearTimeout(timer);
    timer = setTimeout(async () => history.replaceState(null, "", `#${await link.fragment()}`), 500);
  };
})();

const changed = async () => {
  isStale = true;
  if (isComposing) {
    return;
  }
  isComposing = true;
  while (isStale) {
    isStale = false;
    await compose();
  }
  isComposing = false;
  want.look();
  remember();
};

const drawInputs = () => {
  displays.draw();
  settings.draw();
  platform.draw();
  want.draw();
};

const readLink = async () => {
  const fragment = location.hash.slice(1);
  if (!fragment) {
    return;
  }
  try {
    const given = await link.read(fragment);
    const problem = given.platform && editor.refusal(given.platform.text);
    if (problem) {
      throw new Error(`its platform has ${problem}`);
    }
    Object.assign(state, given);
  } catch (failure) {
    tell(`The link cannot be read: ${failure.message}.`);
  }
};

const start = async () => {
  const about = await core.ask("about");
  settings.listen(about.settings);
  platform.listen(about.platform);
  displays.listen();
  want.listen();
  tabs.listen();
  downloads.listen();
  for (const part of document.querySelectorAll("[data-open-when-wide]")) {
    part.open = matchMedia("(min-width: 68rem)").matches;
  }
  await readLink();
  drawInputs();
  addEventListener("hashchange", async () => {
    await readLink();
    drawInputs();
    changed();
  });
  await changed();
};

// For scripts in the browser's console, and for tests.
window.edidComposer = Object.freeze({ ask: core.ask, state });

start().catch(failure => {
  byId("title").textContent = "This browser cannot run the page";
  showProblems([{ place: "page", text: failure.message }]);
});

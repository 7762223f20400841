// What stands in the way of one mode or format, and a button for each way that leads there.

const want = (() => {
  const EXAMPLES = ["1080p60", "4k30", "pcm8", "truehd", "3d", "deep-color"];
  const field = byId("want");
  const answers = byId("answers");

  const apply = async (answer, way) => {
    try {
      const result = await core.ask("apply", { ...composition(), want: state.want, answer, way });
      if (result.problems.length) {
        throw new Error(result.problems[0].text);
      }
      for (const [name, value] of Object.entries(result.settings)) {
        if (value === null) {
          delete state.settings[name];
        } else {
          state.settings[name] = value;
        }
      }
      settings.draw();
      const { name } = state.platform || { name: platform.ownName };
      if (result.platform !== platform.text) {
        platform.take({ name, text: result.platform });
        tell("Done. “Undo” takes back what has changed in the platform.");
      } else {
        changed();
        tell("Done: the settings have changed.");
      }
    } catch (failure) {
      tell(failure.message);
    }
  };

  const way = (steps, answer, number, isOther) => element("div", { class: "way" },
    element("p", {}, isOther ? "Or:" : "To have it offered:"),
    element("ul", {}, steps.map(step => element("li", {}, step.text, step.line ? [" ", lineLink(step.line)] : null))),
    element("button", { type: "button", class: isOther ? "" : "main", onclick: () => apply(answer, number) },
      steps.length === 1 ? "Do this step" : `Do these ${steps.length} steps`));

  const verdictOf = ({ offered }) =>
    element("span", { class: `verdict ${offered ? "offered" : "out"}` }, offered ? "offered" : "not offered");

  const shown = (answer, number) => element("article", { class: `answer ${answer.offered ? "yes" : "no"}` },
    element("h3", {}, verdictOf(answer), " ", answer.name),
    answer.reasons.map(reason => element("p", {}, reason)),
    answer.steps.length ? way(answer.steps, number, 0, false) : null,
    answer.other_ways.map((steps, index) => way(steps, number, index + 1, true)),
    answer.no_way ? element("p", {}, answer.no_way) : null);

  const look = async () => {
    if (!state.want) {
      fill(answers);
      return;
    }
    const wanted = state.want;
    try {
      const { answer, problems } = await core.ask("want", { ...composition(), want: wanted });
      if (wanted === state.want) {
        fill(answers, answer ? answer.answers.map(shown)
          : problems.map(problem => element("p", { class: "quiet" }, problem.text)));
      }
    } catch (failure) {
      if (wanted === state.want) {
        fill(answers, element("p", { class: "quiet" }, failure.message.replace(/^--want: /, "")));
      }
    }
  };

  const listen = () => {
    let timer = 0;
    const take = text => {
      state.want = text.trim();
      clearTimeout(timer);
      timer = setTimeout(() => {
        look();
        remember();
      }, 150);
    };
    field.addEventListener("input", () => take(field.value));
    byId("want-form").addEventListener("submit", event => event.preventDefault());
    fill(byId("want-chips"), EXAMPLES.map(text => element("button", { type: "button", onclick: () => {
      field.value = text;
      take(text);
    } }, text)));
  };

  return { listen, look, draw: () => { field.value = state.want; } };
})();

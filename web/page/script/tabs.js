// The parts of a result behind tabs. One that is not seen is drawn when it is opened, or printed.

const tabs = (() => {
  /** How each is drawn, and from what: while that is the same, what is drawn stays, and so do focus and scroll bar. */
  const parts = {
    decisions: [showDecisions, ({ explanation }) => explanation.decisions],
    bytes: [showBytes, ({ explanation }) => explanation.edid],
    differences: [showDifferences, ({ explanation, hex }) => [explanation.comparison, hex, state.sinks, state.active]],
    displays: [showDisplays, () => [state.sinks, state.platform, state.settings]],
    report: [showReport, ({ report, sink_report: sinkReport }) => [report, sinkReport]],
    keys: [showKeys, ({ explanation }) => explanation.keys],
    messages: [showMessages, ({ messages }) => messages],
  };
  const drawn = {};
  const panels = [...document.querySelectorAll("[role=tabpanel]")];
  let result = null;
  let stale = new Set();
  let open = panels[0].id;
  let buttons = [];

  const draw = id => {
    if (!result || !stale.delete(id)) {
      return;
    }
    const [show, from] = parts[id];
    const content = JSON.stringify(from(result));
    if (drawn[id] !== content) {
      drawn[id] = content;
      show(result);
    }
  };

  const show = (id, focus) => {
    open = id;
    for (const panel of panels) {
      panel.hidden = panel.id !== id;
    }
    for (const button of buttons) {
      const isOpen = button.dataset.panel === id;
      button.setAttribute("aria-selected", String(isOpen));
      button.tabIndex = isOpen ? 0 : -1;
      if (isOpen && focus) {
        button.focus();
      }
    }
    draw(id);
  };

  const step = event => {
    const index = panels.findIndex(panel => panel.id === open);
    const next = { ArrowLeft: index - 1, ArrowRight: index + 1, Home: 0, End: panels.length - 1 }[event.key];
    if (next !== undefined) {
      event.preventDefault();
      show(panels[(next + panels.length) % panels.length].id, true);
    }
  };

  return {
    listen: () => {
      buttons = panels.map(panel => element("button", { type: "button", role: "tab", id: `tab-${panel.id}`,
        "data-panel": panel.id, "aria-controls": panel.id, onclick: () => show(panel.id, false),
        onkeydown: step }, panel.dataset.tab));
      panels.forEach(panel => panel.setAttribute("aria-labelledby", `tab-${panel.id}`));
      fill(byId("tabs"), buttons);
      show(open, false);
      addEventListener("beforeprint", () => [...stale].filter(id => id !== "displays").forEach(draw));
    },
    show: given => {
      result = given;
      stale = new Set(Object.keys(parts));
      draw(open);
    },
  };
})();

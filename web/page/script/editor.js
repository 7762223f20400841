// The platform's text with line numbers, and with findings at their lines. Of these, only those that can be seen are
// drawn.

const editor = (() => {
  const MARKS = { error: "✕", warning: "!", note: "i" };
  // A browser lays out the whole text at once, and stands still as long.
  const MOST_LINES = 5000;
  const MOST_CHARACTERS = 256 * 1024;
  const MOST_SEEN = 300;  // Characters of a line.
  const LINE = 20;  // Pixels, as in the style sheet.
  const MARGIN = 8;
  const field = byId("platform-text");
  const gutter = byId("gutter");
  const marks = byId("marks");
  let lines = [""];
  let findings = new Map();  // By line.
  let isDue = false;

  const severest = list => ["error", "warning", "note"].find(severity => list.some(one => one.severity === severity));

  const numberOf = line => {
    const here = findings.get(line);
    const severity = here && severest(here);
    return element("span", { class: severity || "" }, here ? `${MARKS[severity]} ${line}` : String(line));
  };

  /** The line's text unseen, so that what is said stands after it. */
  const markOf = (line, top) => {
    const here = findings.get(line);
    const said = here.map(finding => finding.text).join("; ");
    const mark = element("div", { class: severest(here) },
      element("span", { class: "ghost" }, lines[line - 1].slice(0, MOST_SEEN)),
      element("span", { class: "said" }, said.slice(0, MOST_SEEN)));
    mark.style.top = `${top}px`;
    return mark;
  };

  const drawNow = () => {
    isDue = false;
    const first = Math.max(0, Math.floor((field.scrollTop - MARGIN) / LINE));
    const last = Math.min(lines.length, first + Math.ceil(field.clientHeight / LINE) + 2);
    const numbers = [];
    const drawn = [];
    for (let index = first; index < last; ++index) {
      numbers.push(numberOf(index + 1));
      if (findings.has(index + 1)) {
        drawn.push(markOf(index + 1, MARGIN + index * LINE - field.scrollTop));
      }
    }
    fill(gutter, numbers);
    gutter.style.transform = `translateY(${MARGIN + first * LINE - field.scrollTop}px)`;
    fill(marks, drawn);
    marks.style.transform = `translateX(${-field.scrollLeft}px)`;
  };

  /** With the next frame: what is seen has a place only then. */
  const draw = () => {
    if (!isDue) {
      isDue = true;
      requestAnimationFrame(drawNow);
    }
  };

  const split = () => {
    const digits = String(lines.length).length;
    lines = field.value.split("\n");
    if (String(lines.length).length !== digits) {
      byId("editor").style.setProperty("--digits", Math.max(3, String(lines.length).length));
    }
  };

  /** Why a text cannot be edited here; empty when it can. */
  const refusal = text => {
    if (text.length > MOST_CHARACTERS) {
      return `${text.length} characters, and the editor takes ${MOST_CHARACTERS}`;
    }
    const number = text.split("\n", MOST_LINES + 1).length;
    return number > MOST_LINES ? `more than ${MOST_LINES} lines, which the editor does not take` : "";
  };

  field.maxLength = MOST_CHARACTERS;
  field.addEventListener("paste", event => {
    const problem = refusal(field.value + event.clipboardData.getData("text"));
    if (problem) {
      event.preventDefault();
      tell(`With what you paste the platform has ${problem}.`);
    }
  });
  field.addEventListener("scroll", draw);
  new ResizeObserver(draw).observe(field);

  return {
    field,
    draw,
    split,
    refusal,
    get text() {
      return field.value;
    },
    set text(text) {
      field.value = text;
      split();
      draw();
    },
    show: list => {
      findings = new Map();
      for (const finding of list) {
        if (finding.line) {
          findings.set(finding.line, [...(findings.get(finding.line) || []), finding]);
        }
      }
      draw();
    },
    goTo: line => {
      field.closest("details").open = true;
      const begin = lines.slice(0, line - 1).reduce((length, text) => length + text.length + 1, 0);
      field.focus();
      field.setSelectionRange(begin, begin + (lines[line - 1] || "").length);
      field.scrollTop = Math.max(0, (line - 1) * LINE - field.clientHeight / 2);
      field.scrollLeft = 0;
    },
  };
})();

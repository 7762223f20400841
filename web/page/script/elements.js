// Elements are made from texts and nothing else: no markup of an EDID or a platform ever reaches the page.

const byId = id => document.getElementById(id);

/** Replaces what an element holds by texts, elements and lists of them; null stands for nothing. */
const fill = (node, ...children) => {
  node.replaceChildren(...children.flat(Infinity).filter(child => child !== null && child !== undefined));
  return node;
};

/** element("b", { title: "x", onclick: () => {} }, "text", otherElement); an attribute that is false is not there. */
const element = (tag, attributes = {}, ...children) => {
  const node = document.createElement(tag);
  for (const [name, value] of Object.entries(attributes)) {
    if (name.startsWith("on")) {
      node.addEventListener(name.slice(2), value);
    } else if (value === true) {
      node.setAttribute(name, "");
    } else if (value !== false && value !== null && value !== undefined) {
      node.setAttribute(name, value);
    }
  }
  return fill(node, ...children);
};

/** Replaces what an element says where it is something else: a screen reader says again what is replaced. */
const fillAnew = (node, content, make) => {
  const key = JSON.stringify(content);
  if (node.dataset.content !== key) {
    node.dataset.content = key;
    fill(node, make());
  }
};

/** A table with headers. Each row is a list of cells, texts or elements; the first names the row where @p named. */
const table = (headers, rows, named = true) => element("table", {},
  element("thead", {}, element("tr", {}, headers.map(header => element("th", { scope: "col" }, header)))),
  element("tbody", {}, rows.map(row => tableRow(headers, row, named))));

const tableRow = (headers, cells, named, attributes = {}) => element("tr", attributes, cells.map((cell, index) =>
  named && index === 0
    ? element("th", { scope: "row" }, cell)
    : element("td", { "data-label": headers[index] }, cell)));

/** The first of many: a hostile input has no end of rows, which a browser would choke on. */
const MOST_ROWS = 500;
const limited = (list, most = MOST_ROWS) => list.slice(0, most);
const leftOut = (list, most = MOST_ROWS) => list.length <= most ? null
  : element("p", { class: "quiet" }, `${list.length - most} more are not shown.`);

const hexDigits = value => value.toString(16).toUpperCase().padStart(2, "0");
const hexNumber = value => `0x${hexDigits(value)}`;
/** Leads to a line of the platform. */
const lineLink = (line, text = `line ${line}`) =>
  element("button", { type: "button", class: "source", onclick: () => editor.goTo(line) }, text);

const counted = (number, noun) => `${number} ${noun}${number === 1 ? "" : "s"}`;

// The new EDID's bytes in colours by part, with the meaning of the one that is pointed at or has the focus.

const BLOCK_SIZE = 128;
const HUES = [215, 280, 180, 45, 0, 320, 130, 25, 245, 300, 80, 160, 340, 60, 200];
const UNUSED = "Unused";

const showBytes = ({ explanation }) => {
  const bytes = explanation.edid.match(/../g).map(digits => parseInt(digits, 16));
  const fields = explanation.bytes;
  const parts = [...new Set(fields.map(field => field.part))];
  const fieldOf = fields.flatMap(field => Array(field.size).fill(field));
  const colored = (node, part) => {
    node.style.setProperty("--hue", HUES[parts.indexOf(part) % HUES.length]);
    node.classList.toggle("unused", part === UNUSED);
    return node;
  };

  const now = element("div", { class: "now", "aria-live": "polite" });
  const cells = [];
  const tell = offset => {
    const field = fieldOf[offset];
    cells.forEach((cell, index) => {
      cell.classList.toggle("in", fieldOf[index] === field);
      cell.tabIndex = index === offset ? 0 : -1;
    });
    fill(now, element("b", {}, `${hexNumber(offset)} (${offset}) = ${hexNumber(bytes[offset])} (${bytes[offset]})`),
      `, ${field.part}`, element("br"), `${field.name}: ${field.meaning}`);
  };
  const step = (event, offset) => {
    const grid = cells[offset].parentNode;
    const across = getComputedStyle(grid).gridTemplateColumns.split(" ").length - 1;
    const steps = { ArrowLeft: -1, ArrowRight: 1, ArrowUp: -across, ArrowDown: across };
    const next = cells[offset + (steps[event.key] || 0)];
    if (steps[event.key] && next) {
      event.preventDefault();
      next.focus();
    }
  };
  bytes.forEach((byte, offset) => {
    const field = fieldOf[offset];
    cells.push(colored(element("button", { type: "button", class: "byte", tabindex: offset ? -1 : 0,
      "aria-label": `${hexNumber(offset)}: ${hexNumber(byte)}, ${field.name}`,
      onfocus: () => tell(offset), onmouseenter: () => tell(offset), onclick: () => tell(offset),
      onkeydown: event => step(event, offset) }, hexDigits(byte)), field.part));
  });

  /** Lines of 16, or of 8 on a narrow screen: the second half has an offset of its own, shown there only. */
  const offsetOf = index =>
    element("span", { class: index % 16 ? "half" : "", "aria-hidden": "true" }, hexDigits(index));
  const block = begin => element("div", { class: "grid" }, cells.slice(begin, begin + BLOCK_SIZE).map((cell, index) =>
    [index % 8 ? null : offsetOf(begin + index), cell]));
  const blocks = [];
  for (let begin = 0; begin < bytes.length; begin += BLOCK_SIZE) {
    blocks.push(element("h4", {}, begin ? "CEA-861 extension" : "Base block"), block(begin));
  }

  const rows = fields.map(field => [hexNumber(field.offset),
    element("code", {}, bytes.slice(field.offset, field.offset + field.size).map(hexDigits).join(" ")),
    colored(element("span", { class: "part" }, field.part), field.part), field.name, field.meaning]);
  const fieldTable = table(["Offset", "Bytes", "Part", "Field", "Meaning"], rows);
  fieldTable.className = "bytewise";
  fill(byId("bytes"), element("h3", {}, `The ${bytes.length} bytes`),
    element("p", { class: "quiet hint" }, "Point at, tap or move to a byte with the arrow keys: its meaning is below."),
    blocks, now, element("h4", {}, "Byte by byte"), fieldTable);
  tell(0);
};

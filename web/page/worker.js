// Runs the core away from the page, so that nothing freezes it. Stands after Emscripten's createCore.
"use strict";

let core = null;

/** Copies bytes into the core's memory, calls it, and takes its document out again. */
const run = (request, content) => {
  const text = new TextEncoder().encode(JSON.stringify(request));
  const place = core._malloc(text.length + content.length + 1);
  if (!place) {
    return { error: "There is no memory for that." };
  }
  core.HEAPU8.set(text, place);
  core.HEAPU8.set(content, place + text.length);
  try {
    const begin = core._edid_web_run(place, text.length, place + text.length, content.length);
    const end = core.HEAPU8.indexOf(0, begin);
    return JSON.parse(new TextDecoder().decode(core.HEAPU8.subarray(begin, end)));
  } finally {
    core._free(place);
  }
};

/** The page shows no more of a list than that, and to send it takes longer than to make it. */
const MOST_ENTRIES = 2000;

const bounded = value => {
  if (Array.isArray(value)) {
    return value.slice(0, MOST_ENTRIES).map(bounded);
  }
  return value !== null && typeof value === "object"
    ? Object.fromEntries(Object.entries(value).map(([name, member]) => [name, bounded(member)])) : value;
};

const start = module => createCore({
  instantiateWasm: (imports, done) => {
    const instance = new WebAssembly.Instance(module, imports);
    done(instance, module);
    return instance.exports;
  },
  // The core's own documents say all that there is to say.
  print: () => {},
  printErr: () => {},
});

onmessage = async event => {
  const { module, id, request, content } = event.data;
  if (module) {
    core = await start(module);
    return;
  }
  const begin = performance.now();
  try {
    const answer = bounded(run(request, content || new Uint8Array()));
    postMessage({ id, answer, milliseconds: performance.now() - begin });
  } catch (problem) {
    // What the core is after that is unknown: the page starts another.
    postMessage({ id, failure: String(problem && problem.message || problem) });
  }
};

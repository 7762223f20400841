// What is composed: everything that a link holds.

const NO_SINK = -1;

const state = {
  sinks: [],  // { name, text }: the text is hexadecimal.
  active: NO_SINK,
  platform: null,  // { name, text }; null: the default one.
  settings: {},  // Texts and flags, by name.
  want: "",
  traces: false,
};

const activeSink = () => state.active === NO_SINK ? null : state.sinks[state.active];

/** The members that an operation about a composition takes. */
const composition = (sink = activeSink()) => ({
  sink, platform: state.platform, settings: state.settings, debug: state.traces,
});

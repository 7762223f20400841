// A link's fragment: a version letter, then the state as JSON, compressed where the browser can, in base64url.
const link = (() => {
  const COMPRESSED = "z";
  const PLAIN = "p";
  const MOST_BYTES = 4 * 1024 * 1024;
  const MOST_SINKS = 50;

  const collected = async stream => {
    const reader = stream.getReader();
    const chunks = [];
    let size = 0;
    for (;;) {
      const { done, value } = await reader.read();
      if (done) {
        break;
      }
      size += value.length;
      if (size > MOST_BYTES) {
        await reader.cancel();
        throw new Error("it is too large");
      }
      chunks.push(value);
    }
    return new Uint8Array(await new Blob(chunks).arrayBuffer());
  };

  const piped = (bytes, transform) => collected(new Blob([bytes]).stream().pipeThrough(transform));

  const encoded = bytes => {
    let text = "";
    for (let place = 0; place < bytes.length; place += 0x8000) {
      text += String.fromCharCode(...bytes.subarray(place, place + 0x8000));
    }
    return btoa(text).replace(/\+/g, "-").replace(/\//g, "_").replace(/=+$/, "");
  };

  const decoded = text =>
    Uint8Array.from(atob(text.replace(/-/g, "+").replace(/_/g, "/")), letter => letter.charCodeAt(0));

  const isFile = file => typeof file?.name === "string" && typeof file.text === "string";
  const isIndex = (index, list) => Number.isInteger(index) && index >= 0 && index < list.length;
  const isSetting = value => typeof value === "string" || typeof value === "boolean";

  /** Takes what has the right shape; whether it makes sense is the core's to say. */
  const checked = given => {
    const sinks = Array.isArray(given.sinks) ? given.sinks.filter(isFile).slice(0, MOST_SINKS) : [];
    const settings = Object.entries(given.settings || {}).filter(([, value]) => isSetting(value));
    return {
      sinks: sinks.map(({ name, text }) => ({ name, text })),
      active: isIndex(given.active, sinks) ? given.active : NO_SINK,
      platform: isFile(given.platform) ? { name: given.platform.name, text: given.platform.text } : null,
      settings: Object.fromEntries(settings),
      want: typeof given.want === "string" ? given.want.slice(0, 100) : "",
      traces: given.traces === true,
    };
  };

  return {
    fragment: async () => {
      const bytes = new TextEncoder().encode(JSON.stringify(state));
      return window.CompressionStream
        ? COMPRESSED + encoded(await piped(bytes, new CompressionStream("deflate-raw")))
        : PLAIN + encoded(bytes);
    },
    /** The state of a fragment; throws what is wrong with it. */
    read: async fragment => {
      let bytes = decoded(fragment.slice(1));
      if (fragment[0] === COMPRESSED) {
        bytes = await piped(bytes, new DecompressionStream("deflate-raw"));
      } else if (fragment[0] !== PLAIN) {
        throw new Error("it is of another version");
      }
      return checked(JSON.parse(new TextDecoder().decode(bytes)));
    },
  };
})();

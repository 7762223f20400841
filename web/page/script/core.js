// The worker with the core in it: one request at a time, each with a limit on its time.

const TIME_LIMIT = 5000;

/** For browsers that hold scripts' addresses to a policy: this one, of our own text. */
const policy = window.trustedTypes
  ? trustedTypes.createPolicy("worker", { createScriptURL: url => url })
  : { createScriptURL: url => url };

const core = (() => {
  const compiled = (() => {
    const text = atob(byId("core").textContent);
    const bytes = new Uint8Array(text.length);
    for (let place = 0; place < text.length; ++place) {
      bytes[place] = text.charCodeAt(place);
    }
    return WebAssembly.compile(bytes);
  })();
  let worker = null;
  let waiting = Promise.resolve();
  let lastId = 0;

  const start = async () => {
    const source = new Blob([byId("worker-source").textContent], { type: "text/javascript" });
    const url = URL.createObjectURL(source);
    worker = new Worker(policy.createScriptURL(url));
    worker.postMessage({ module: await compiled });
  };

  /** Nobody knows what is left in a worker that was stopped or has failed. */
  const stop = () => {
    worker?.terminate();
    worker = null;
  };

  const served = async (request, content) => {
    if (!worker) {
      await start();
    }
    const id = ++lastId;
    return new Promise((resolve, reject) => {
      const fail = text => {
        clearTimeout(timer);
        stop();
        reject(new Error(text));
      };
      const timer = setTimeout(() => fail(`This took longer than ${TIME_LIMIT / 1000} s and was stopped.`), TIME_LIMIT);
      worker.onerror = event => fail(`This could not be computed: ${event.message}`);
      worker.onmessage = event => {
        if (event.data.id !== id) {
          return;
        }
        if (event.data.failure !== undefined) {
          fail(`This could not be computed: ${event.data.failure}`);
          return;
        }
        clearTimeout(timer);
        if (event.data.answer.error !== undefined) {
          reject(new Error(event.data.answer.error));
        } else {
          resolve({ ...event.data.answer, milliseconds: event.data.milliseconds });
        }
      };
      worker.postMessage({ id, request, content });
    });
  };

  return {
    /** What an operation returns; rejected with what is wrong. */
    ask: (operation, members = {}, content = null) => {
      const answer = waiting.then(() => served({ operation, ...members }, content));
      waiting = answer.catch(() => {});
      return answer;
    },
  };
})();

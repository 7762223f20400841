// Samples that come along, and files that the user gives.

const builtIn = JSON.parse(byId("built-in").textContent);
const MOST_FILE_BYTES = 1024 * 1024;  // As the program reads; the core says so too, but a larger file is not even read.

const bytesOf = async file => {
  if (file.size > MOST_FILE_BYTES) {
    throw new Error(`${file.name}: larger than 1 MiB`);
  }
  return new Uint8Array(await file.arrayBuffer());
};

const bytesOfText = text => new TextEncoder().encode(text);

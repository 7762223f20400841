// What can be taken away: files, a link, paper.

const downloads = (() => {
  let result = null;
  const stem = () => (activeSink()?.name || "no_display").replace(/\.[^.]*$/, "").replace(/[^\w-]+/g, "_");
  const bytes = () => Uint8Array.from(result.explanation.edid.match(/../g), digits => parseInt(digits, 16));
  const kinds = {
    bin: () => [bytes(), `${stem()}.composed.bin`, "application/octet-stream"],
    hex: () => [result.hex, `${stem()}.composed.hex`, "text/plain"],
    toml: () => [platform.text, state.platform ? state.platform.name : platform.ownName, "application/toml"],
    json: () => [JSON.stringify(result.explanation, null, 2) + "\n", `${stem()}.explained.json`, "application/json"],
  };

  const save = kind => {
    const [content, name, type] = kinds[kind]();
    const url = URL.createObjectURL(new Blob([content], { type }));
    element("a", { href: url, download: name }).click();
    setTimeout(() => URL.revokeObjectURL(url), 10000);
  };

  const share = async () => {
    const address = `${location.href.split("#")[0]}#${await link.fragment()}`;
    const field = byId("link-text");
    byId("link").hidden = false;
    field.value = address;
    try {
      await navigator.clipboard.writeText(address);
      tell(`Copied: ${counted(Math.ceil(address.length / 1000), "kilobyte")} with displays, platform and settings.`);
    } catch {
      field.focus();
      field.select();
      tell("Here it is: copy it.");
    }
  };

  return {
    listen: () => {
      byId("share").addEventListener("click", share);
      byId("print").addEventListener("click", () => print());
      document.querySelectorAll("[data-download]").forEach(button =>
        button.addEventListener("click", () => save(button.dataset.download)));
    },
    show: given => {
      result = given;
      document.querySelectorAll("[data-download], #share, #print").forEach(button => {
        button.disabled = !result && ["bin", "hex", "json"].includes(button.dataset.download);
      });
    },
  };
})();

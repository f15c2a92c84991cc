// Publishes one service with an mDNS implementation that is not Avahi:
//
//   node second_responder.js INTERFACE NAME TYPE PORT KEY=VALUE...
//
// A line of KEY=VALUE pairs, tab-separated, on standard input replaces the TXT record. At the end
// of input it says goodbye. Prints "published NAME" and "updated".

const { createRequire } = require("node:module");
const { getResponder } = createRequire(`${process.cwd()}/`)("@homebridge/ciao");

const [wanted, name, type, port, ...pairs] = process.argv.slice(2);
const record = (texts) => Object.fromEntries(texts.map((text) => text.split(/=(.*)/s, 2)));

const responder = getResponder({ interface: wanted });
const service = responder.createService({
  name, type, port: Number(port), txt: record(pairs), restrictedAddresses: [wanted],
});
service.on("name-change", (newName) => console.log(`published ${newName}`));
service.advertise().then(() => console.log(`published ${name}`));

require("node:readline").createInterface({ input: process.stdin })
  .on("line", (line) => {
    service.updateTxt(record(line.split("\t")));
    console.log("updated");
  })
  .on("close", () => responder.shutdown().then(() => process.exit(0)));

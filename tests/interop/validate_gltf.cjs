// Holds glTF files to the Khronos validator: node validate_gltf.cjs FILE...
//
// A line for each file with its errors, warnings and hints. Exit status 1 where a file has an error or a warning, 3
// where the validator is not installed.
'use strict';

const fs = require('node:fs');
const path = require('node:path');

function loadValidator() {
  try {
    return require('gltf-validator');
  } catch {
    console.error('gltf-validator is not installed: npm install gltf-validator, in a folder that NODE_PATH names');
    process.exit(3);
  }
}

async function main(files) {
  const validator = loadValidator();
  let faulty = 0;
  for (const file of files) {
    const report = await validator.validateBytes(new Uint8Array(fs.readFileSync(file)), {
      uri: path.basename(file),
      externalResourceFunction: async (uri) =>
        new Uint8Array(await fs.promises.readFile(path.join(path.dirname(file), decodeURIComponent(uri)))),
    });
    const { numErrors, numWarnings, numHints, messages } = report.issues;
    console.log(`${file}: ${numErrors} errors, ${numWarnings} warnings, ${numHints} hints`);
    for (const message of messages) {
      if (message.severity <= 1) console.log(`  ${message.code} ${message.pointer}: ${message.message}`);
    }
    if (numErrors + numWarnings > 0) faulty += 1;
  }
  console.log(`${files.length} files, ${faulty} with errors or warnings`);
  process.exitCode = faulty > 0 ? 1 : 0;
}

main(process.argv.slice(2)).catch((failure) => {
  console.error(`validate-gltf: ${failure.message ?? failure}`);
  process.exitCode = 1;
});

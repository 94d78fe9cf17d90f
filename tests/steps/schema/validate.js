// SPDX-License-Identifier: MIT
// Validates sources against the schema with ajv: the examples and the sources on the page must be
// accepted, each mistake refused.
'use strict';
const fs = require('fs');
const path = require('path');
const Ajv = require('ajv');
const YAML = require('yaml');

const root = process.argv[2];
const schema = JSON.parse(fs.readFileSync(path.join(root, 'docs/steps.schema.json'), 'utf8'));
const validate = new Ajv({ allErrors: true, allowUnionTypes: true }).compile(schema);
let faults = 0;

function fault(message) {
  console.error(message);
  ++faults;
}

function expectAccepted(name, text) {
  if (!validate(YAML.parse(text))) fault(`${name}: refused: ${JSON.stringify(validate.errors)}`);
}

const examples = fs.readdirSync(path.join(root, 'examples'))
  .flatMap((folder) => fs.readdirSync(path.join(root, 'examples', folder))
    .filter((file) => file.endsWith('.yaml'))
    .map((file) => path.join(root, 'examples', folder, file)));
for (const file of examples) expectAccepted(file, fs.readFileSync(file, 'utf8'));

const page = fs.readFileSync(path.join(root, 'docs/steps.md'), 'utf8');
const whole = [...page.matchAll(/```yaml\n(window:[^`]*)```/g)].map((match) => match[1]);
whole.forEach((text, i) => expectAccepted(`docs/steps.md, source ${i + 1}`, text));

// What the compiler finds wrong by form, one mistake each.
const mistakes = YAML.parse(fs.readFileSync(path.join(__dirname, 'mistakes.yaml'), 'utf8'));
for (const [name, source] of Object.entries(mistakes)) {
  if (validate(source)) fault(`${name}: accepted`);
}

const accepted = examples.length + whole.length;
console.log(`${accepted} sources accepted, ${Object.keys(mistakes).length} mistakes refused, ${faults} faults`);
process.exit(faults === 0 && accepted > 5 ? 0 : 1);

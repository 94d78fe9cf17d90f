// SPDX-License-Identifier: MIT
// Validates sources against the schema with ajv: the examples and the sources on the page must be
// accepted, each mistake refused.
'use strict';
const fs = require('fs');
const path = require('path');
const Ajv = require('ajv');
const YAML = require('yaml');

const root = process.argv[2];
const schemaNamed = (name) => JSON.parse(fs.readFileSync(path.join(root, 'docs', name), 'utf8'));
const ajv = new Ajv({ allErrors: true, allowUnionTypes: true });
ajv.addSchema(schemaNamed('steps.schema.json'), 'steps.schema.json');
const validate = ajv.getSchema('steps.schema.json');
const validatePart = ajv.compile(schemaNamed('steps-part.schema.json'));
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
const whole = [...page.matchAll(/```yaml\n((?:window|include):[^`]*)```/g)].map((match) => match[1]);
whole.forEach((text, i) => expectAccepted(`docs/steps.md, source ${i + 1}`, text));

// A file that sources include needs no steps. What is wrong in one is wrong in the other.
const part = [...page.matchAll(/```yaml\n# common.yaml\n([^`]*)```/g)].map((match) => match[1]);
if (part.length !== 1 || !validatePart(YAML.parse(part[0]))) fault('docs/steps.md: the included file: refused');
if (validate(YAML.parse(part[0]))) fault('docs/steps.md: the included file: accepted as a source');
if (validatePart({ stps: {} })) fault('an unknown entry of an included file: accepted');

// What the compiler finds wrong by form, one mistake each.
const mistakes = YAML.parse(fs.readFileSync(path.join(__dirname, 'mistakes.yaml'), 'utf8'));
for (const [name, source] of Object.entries(mistakes)) {
  if (validate(source)) fault(`${name}: accepted`);
}

const accepted = examples.length + whole.length;
console.log(`${accepted} sources accepted, ${Object.keys(mistakes).length} mistakes refused, ${faults} faults`);
process.exit(faults === 0 && accepted > 5 ? 0 : 1);

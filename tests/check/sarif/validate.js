// SPDX-License-Identifier: MIT
// Validates SARIF reports against the format's schema, and proves that the schema refuses a changed one.
'use strict';
const fs = require('fs');
const path = require('path');
const Ajv = require('ajv/dist/2020');

const folder = path.dirname(require.resolve('@microsoft/sarif-multitool-linux/package.json'));
const schema = JSON.parse(fs.readFileSync(path.join(folder, 'sarif-2.1.0.json'), 'utf8'));
const validate = new Ajv({ allErrors: true, strict: false, validateFormats: false }).compile(schema);
const reports = process.argv.slice(2).map((file) => [file, JSON.parse(fs.readFileSync(file, 'utf8'))]);
let faults = 0;

function fault(message) {
  console.error(message);
  ++faults;
}

for (const [file, report] of reports) {
  if (!validate(report)) fault(`${file}: ${JSON.stringify(validate.errors, null, 1)}`);
}

const results = reports.flatMap(([, report]) => report.runs[0].results);
const notifications = reports.flatMap(([, report]) => report.runs[0].invocations)
  .flatMap((invocation) => invocation.toolExecutionNotifications ?? []);
if (!results.some((result) => result.codeFlows)) fault('no report has a path');
if (notifications.length === 0) fault('no report has a script that could not be checked');

const changed = structuredClone(reports[0][1]);
changed.runs[0].results[0].level = 'fatal';
if (validate(changed)) fault('the schema accepts a level that does not exist');

console.log(`${reports.length} reports with ${results.length} results and ` +
  `${notifications.length} notifications: ${faults} faults`);
process.exit(faults === 0 ? 0 : 1);

// SPDX-License-Identifier: MIT
// Asks yaml-language-server, which editors use, what it completes, explains and marks with the schema.
'use strict';
const { spawn } = require('child_process');
const path = require('path');
const { pathToFileURL } = require('url');

const root = path.resolve(process.argv[2]);
const server = spawn(process.execPath, [require.resolve('yaml-language-server/bin/yaml-language-server'), '--stdio'],
  { stdio: ['pipe', 'pipe', 'ignore'] });
const schema = pathToFileURL(path.join(root, 'docs/steps.schema.json')).href;
const settings = { yaml: { schemas: { [schema]: ['*.yaml'] }, completion: true, hover: true, validate: true } };

let buffer = Buffer.alloc(0);
let lastId = 0;
const waiting = new Map();
const diagnostics = new Map();
const diagnosed = [];

function send(message) {
  const text = JSON.stringify({ jsonrpc: '2.0', ...message });
  server.stdin.write(`Content-Length: ${Buffer.byteLength(text)}\r\n\r\n${text}`);
}

function request(method, params) {
  const id = ++lastId;
  send({ id, method, params });
  return new Promise((resolve) => waiting.set(id, resolve));
}

function handle(message) {
  if (message.method === 'workspace/configuration') {
    send({ id: message.id, result: message.params.items.map((item) => settings[item.section] || {}) });
  } else if (message.method === 'textDocument/publishDiagnostics') {
    diagnostics.set(message.params.uri, message.params.diagnostics);
    diagnosed.forEach((see) => see());
  } else if (message.method && message.id !== undefined) {
    send({ id: message.id, result: null });
  } else if (waiting.has(message.id)) {
    waiting.get(message.id)(message.result);
    waiting.delete(message.id);
  }
}

server.stdout.on('data', (data) => {
  buffer = Buffer.concat([buffer, data]);
  for (;;) {
    const head = buffer.indexOf('\r\n\r\n');
    if (head < 0) return;
    const size = Number(/Content-Length: (\d+)/.exec(buffer.toString('utf8', 0, head))[1]);
    if (buffer.length < head + 4 + size) return;
    const text = buffer.toString('utf8', head + 4, head + 4 + size);
    buffer = buffer.subarray(head + 4 + size);
    handle(JSON.parse(text));
  }
});

let faults = 0;
function expect(what, holds, found) {
  if (holds) return;
  ++faults;
  console.error(`${what}; found ${JSON.stringify(found)}`);
}

// Opens a source; the bar is where the cursor is.
let opened = 0;
function open(text) {
  const offset = text.indexOf('|');
  const before = text.slice(0, offset < 0 ? 0 : offset).split('\n');
  const uri = pathToFileURL(path.join(root, `source-${++opened}.yaml`)).href;
  const whole = offset < 0 ? text : text.slice(0, offset) + text.slice(offset + 1);
  send({ method: 'textDocument/didOpen', params: { textDocument: { uri, languageId: 'yaml', version: 1, text: whole } } });
  return { textDocument: { uri }, position: { line: before.length - 1, character: before[before.length - 1].length } };
}

// The server reads the schema when it looks at the source for the first time.
function seen({ textDocument }) {
  return new Promise((resolve) => {
    const see = () => { if (diagnostics.has(textDocument.uri)) resolve(); };
    diagnosed.push(see);
    see();
  });
}

async function ask(what, text) {
  const source = open(text);
  await seen(source);
  return request(`textDocument/${what}`, source);
}

async function main() {
  await request('initialize', { processId: process.pid, rootUri: null, capabilities: { workspace: { configuration: true } } });
  send({ method: 'initialized', params: {} });
  send({ method: 'workspace/didChangeConfiguration', params: { settings } });

  const head = 'window: host.plist\ncontrols:\n  next: 12\nsteps:\n  one:\n';
  const properties = await ask('completion', `${head}    next:\n      |`);
  const labels = (properties.items || properties).map((item) => item.label);
  for (const label of ['title', 'press', 'flash', 'tooltip']) {
    expect(`expected the completion “${label}” among the properties of a control`, labels.includes(label), labels);
  }
  const words = await ask('completion', `${head}    |`);
  const wordLabels = (words.items || words).map((item) => item.label);
  for (const label of ['show', 'hide', 'like', 'back passes over']) {
    expect(`expected the completion “${label}” at a step`, wordLabels.includes(label), wordLabels);
  }
  const hover = await ask('hover', `${head}    next:\n      fla|sh: yes\n`);
  const explanation = JSON.stringify(hover);
  expect('expected an explanation of “flash”', explanation.includes('flashes as long as'), hover);

  const wrong = open(`${head}    next: {prss: end}\n`);
  await seen(wrong);
  const marks = diagnostics.get(wrong.textDocument.uri);
  expect('expected a mark at “prss”', marks.some((mark) => mark.range.start.line === 5), marks);

  console.log(`${4 + 4 + 1 + 1} answers of the editor's server, ${faults} faults`);
  server.kill();
  process.exit(faults === 0 ? 0 : 1);
}

setTimeout(() => { console.error('yaml-language-server does not answer'); server.kill(); process.exit(1); }, 60000).unref();
main();

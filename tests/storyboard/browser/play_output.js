// SPDX-License-Identifier: MIT
// Reads what `qz-walkthrough play` prints.
'use strict';
const {execFileSync} = require('child_process');

const squeezed = (text) => text.replace(/\s+/g, '');

// The words of a command line, as the page quotes them for a shell.
const wordsOf = (line) => [...line.matchAll(/(?:[^\s']|'[^']*')+/g)].map(([word]) => word.replace(/'/g, ''));

// Plays a command line of a page, and returns all that is printed.
function run(tool, line) {
  const [, ...words] = wordsOf(line);
  try {
    return execFileSync(tool, [...words, '--toolkit', 'memory', '--no-check'],
        {encoding: 'utf8', stdio: ['ignore', 'pipe', 'ignore']});
  } catch (error) {
    if (error.status === 1) return error.stdout;  // the walk-through is stuck, which the page says too
    throw error;
  }
}

// The rows of the last table of controls. A row goes on in lines without a name; lines about runs of a text and
// about changes do not belong to it.
function rowsOf(output) {
  const lines = output.split('\n');
  const heading = lines.findLastIndex((line) => /^ +(tag|name) +kind +shows +details$/.test(line));
  const [kind, shows, details] = ['kind', 'shows', 'details'].map((word) => lines[heading].indexOf(word));
  const rows = [];
  let isOpen = false;
  for (const line of lines.slice(heading + 1)) {
    if (line === '') break;
    const cells = [line.slice(4, kind), line.slice(kind, shows), line.slice(shows, details), line.slice(details)];
    const name = squeezed(cells[0]);
    const isAside = name === '' && (/^[“↳→]/.test(cells[2]) || cells[1].trim() !== '');
    if (isAside) isOpen = false;
    if (name !== '') {
      rows.push({name, kind: cells[1].trim(), content: '', details: ''});
      isOpen = true;
    }
    if (!isOpen) continue;
    rows.at(-1).content += squeezed(cells[2]);
    rows.at(-1).details += squeezed(cells[3]);
  }
  return rows;
}

// What a user sees after the moves of a command line.
exports.seenAfter = (tool, line) => {
  const output = run(tool, line);
  const standing = output.split('\n').findLast((each) => each.startsWith('The walk-through '));
  if (/ended\.$/.test(standing)) return {standing, says: []};
  const isSaid = (row) => !/(^|,)hidden(,|$)/.test(row.details) && (row.content !== '' || /button|box$/.test(row.kind));
  const isEmptyImage = (row) => row.kind === 'box' || row.kind === 'view';
  const says = rowsOf(output).filter((row) => isSaid(row) && !isEmptyImage(row))
      .map((row) => ({...row, details: row.details.replace(/,?highlighted/, '').replace(/^,/, '')}));
  return {standing, says};
};

exports.squeezed = squeezed;

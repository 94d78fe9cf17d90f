// SPDX-License-Identifier: MIT
// Plays storyboards in a browser:  node check.js TOOL PAGE…
//
// Goes to every step by clicking pictures, and compares the page with what `play` prints for the same presses;
// plays with the keyboard alone, on a phone, and prints. Fails on requests, console messages and what axe-core finds.
'use strict';
const assert = require('assert');
const fs = require('fs');
const path = require('path');
const {chromium} = require('playwright-core');
const {seenAfter, squeezed} = require('./play_output.js');

const axe = fs.readFileSync(require.resolve('axe-core/axe.min.js'), 'utf8');
const [, , tool, ...files] = process.argv;
const counts = {steps: 0, endings: 0, clicks: 0};

// The shortest moves to each step from the first one: lists of links, each as a step and what it is called there.
const waysOf = (page) => page.evaluate(() => {
  const first = document.querySelector('.step').id;
  const ways = {[first]: []};
  for (const queue = [first]; queue.length > 0;) {
    const from = queue.shift();
    for (const link of document.getElementById(from).querySelectorAll('a[data-move][href]')) {
      const to = link.hash.slice(1);
      if (ways[to]) continue;
      ways[to] = [...ways[from], {from, move: link.dataset.move, to}];
      queue.push(to);
    }
  }
  return ways;
});

const linkOf = (page, {from, move}) => page.locator(`[id="${from}"] a[data-move="${move}"]`).first();

const seenOn = (page) => page.evaluate(() => {
  const step = document.querySelector('.step.current');
  const text = (element, name) => element.querySelector('.' + name)?.textContent || '';
  return {
    id: step.id,
    standing: text(step, 'standing'),
    command: document.getElementById('_command').value,
    says: [...step.querySelectorAll('.says li')].map((li) => (
        {name: text(li, 'name'), kind: text(li, 'kind'), content: text(li, 'content'), details: text(li, 'details')})),
  };
});

const isAt = (page, step) => page.locator(`.step.current[id="${step}"]`).waitFor({timeout: 10000});

const sorted = (rows) => rows.map((row) => JSON.stringify(
    [row.name, row.kind, row.content, row.details].map(squeezed))).sort();

async function compare(page, wanted) {
  const seen = await seenOn(page);
  assert.strictEqual(seen.id, wanted);
  const played = seenAfter(tool, seen.command);
  assert.strictEqual(seen.standing, played.standing, seen.command);
  assert.deepStrictEqual(sorted(seen.says), sorted(played.says), seen.command);
}

async function isFineFor(page, what) {
  const violations = await page.evaluate(`${axe}; axe.run().then((result) => result.violations)`);
  const words = violations.map((each) => `${each.id}: ${each.nodes[0].html.slice(0, 200)}`);
  assert.deepStrictEqual(words, [], `axe-core, ${what}`);
}

// Every step, by clicking what is pressed in pictures.
async function clickThrough(page, url) {
  await page.goto(url);
  const ways = await waysOf(page);
  const all = await page.locator('.step').count();
  assert.strictEqual(Object.keys(ways).length, all, 'every step can be come to');
  for (const [step, way] of Object.entries(ways)) {
    await page.click('#_again');
    for (const move of way) await linkOf(page, move).click();
    await compare(page, step);
    counts.clicks += way.length;
    counts.steps += 1;
    if (/ended/.test((await seenOn(page)).standing)) counts.endings += 1;
  }
  return ways;
}

const longest = (ways) => Object.values(ways).reduce((a, b) => (b.length > a.length ? b : a));

async function useKeyboard(page, url, ways) {
  await page.goto(url);
  for (const move of longest(ways)) {
    const isThere = () => page.evaluate(({from, move: wanted}) => {
      const {dataset, closest} = document.activeElement;
      return dataset.move === wanted && closest.call(document.activeElement, '.step').id === from;
    }, move);
    for (let tabs = 0; !await isThere(); ++tabs) {
      assert.ok(tabs < 1000, `Tab comes to ${move.move} in ${move.from}`);
      await page.keyboard.press('Tab');
    }
    await page.keyboard.press('Enter');
    assert.strictEqual((await seenOn(page)).id, move.to);
  }
  for (const move of longest(ways).slice().reverse()) {
    await page.click('#_back');
    await isAt(page, move.from);
  }
  assert.ok(await page.locator('#_back').isDisabled());
}

async function usePhone(browser, url, ways) {
  const phone = await browser.newContext({viewport: {width: 360, height: 640}, hasTouch: true, isMobile: true});
  const page = await watched(phone);
  await page.goto(url);
  for (const move of longest(ways)) await linkOf(page, move).tap();
  assert.strictEqual((await seenOn(page)).id, longest(ways).at(-1).to);
  assert.ok(await page.evaluate(() => document.documentElement.scrollWidth <= innerWidth), 'fits a phone');
  await isFineFor(page, 'on a phone');
  await phone.close();
}

async function print(page, url) {
  await page.goto(url);
  const pdf = await page.pdf({format: 'A4'});
  const pages = (pdf.toString('latin1').match(/\/Type \/Page\b/g) || []).length;
  const steps = await page.locator('.step').count();
  assert.ok(pages >= Math.min(steps / 4, 3), `${steps} steps are on ${pages} sheets`);
  await page.emulateMedia({media: 'print'});
  assert.strictEqual(await page.locator('.step:visible').count(), steps);
  await page.emulateMedia({media: 'screen'});
}

// Links to steps, the search, and a timer that is waited for.
async function useTheRest(page, url) {
  await page.goto(url);
  const last = await page.locator('.step').last().getAttribute('id');
  await page.goto(`${url}#${last}`);
  await compare(page, last);
  await page.fill('#_search', await page.locator('#_contents a').last().textContent());
  const found = await page.locator('#_contents li:visible').count();
  assert.ok(found >= 1, 'the search finds the step');
  await page.fill('#_search', 'no step says this');
  assert.strictEqual(await page.locator('#_contents li:visible').count(), 0);
  await page.click('#_again');
  const timer = await page.evaluate(() => {
    const wait = [...document.querySelectorAll('.wait')].find((each) => each.dataset.seconds <= 3);
    return wait && {step: wait.closest('.step').id, to: wait.parentElement.querySelector('a').hash.slice(1)};
  });
  if (!timer) return;
  await page.goto(`${url}#${timer.step}`);
  await page.click('.step.current .wait');
  await isAt(page, timer.to);
}

// A new page that fails on messages and requests.
async function watched(context) {
  const page = await context.newPage();
  const refuse = (what) => {
    console.error(what);
    process.exitCode = 1;
  };
  page.on('console', (message) => refuse(`console: ${message.text()}`));
  page.on('pageerror', (error) => refuse(`error: ${error.message}`));
  page.on('request', (request) => {
    if (!/^(data:|file:)/.test(request.url())) refuse(`request: ${request.url()}`);
  });
  page.on('dialog', (dialog) => refuse(`dialog: ${dialog.message()}`));
  return page;
}

async function check(browser, file) {
  const url = `file://${path.resolve(file)}`;
  const context = await browser.newContext({reducedMotion: 'reduce'});
  const page = await watched(context);
  const ways = await clickThrough(page, url);
  await isFineFor(page, 'in the light');
  await page.emulateMedia({colorScheme: 'dark'});
  await isFineFor(page, 'in the dark');
  await useKeyboard(page, url, ways);
  await useTheRest(page, url);
  await print(page, url);
  await context.close();
  await usePhone(browser, url, ways);
}

(async () => {
  const browser = await chromium.launch({executablePath: process.env.CHROMIUM || '/usr/bin/chromium', args: ['--no-sandbox']});
  for (const file of files) {
    console.log(path.basename(file));
    await check(browser, file);
  }
  await browser.close();
  assert.ok(counts.endings >= files.length, 'every page has an ending');
  console.log(`${files.length} pages: ${counts.steps} steps and ${counts.endings} endings by ${counts.clicks} clicks`);
})().catch((error) => {
  console.error(error);
  process.exit(1);
});

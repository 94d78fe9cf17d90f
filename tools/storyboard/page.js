// SPDX-License-Identifier: MIT
// Plays a storyboard: shows one step at a time, and keeps the moves that led to it.
'use strict';
(() => {
  const at = (id) => document.getElementById(id);
  const steps = [...document.querySelectorAll('.step')];
  const links = new Map([...document.querySelectorAll('#contents a')].map((a) => [a.hash, a]));
  const reduced = matchMedia('(prefers-reduced-motion: reduce)');
  let current = null;
  let walk = null;  // the step where it began, and the moves since
  let countdown = 0;

  const stepOf = (hash) => {
    const found = at(hash.slice(1));
    return found && found.classList.contains('step') ? found : null;
  };

  const fill = (step) => {
    for (const image of step.querySelectorAll('img[data-same]')) {
      image.src = at(image.dataset.same).src;
      image.removeAttribute('data-same');
    }
  };

  const stopWaiting = () => {
    clearInterval(countdown);
    for (const wait of current ? current.querySelectorAll('.wait') : []) {
      wait.parentElement.querySelector('.countdown').textContent = wait.dataset.seconds;
      wait.disabled = false;
    }
  };

  const show = (step, isMove) => {
    stopWaiting();
    if (current) current.classList.remove('current');
    links.get('#' + (current || step).id)?.removeAttribute('aria-current');
    current = step;
    fill(step);
    step.classList.add('current');
    const link = links.get('#' + step.id);
    link?.setAttribute('aria-current', 'true');
    at('command').value = [at(walk.from).dataset.command, ...walk.moves].join(' ');
    at('back').disabled = walk.moves.length === 0;
    at('status').textContent = '';
    if (!isMove) return;
    step.querySelector('h2').focus({preventScroll: true});
    step.scrollIntoView({block: 'nearest', behavior: reduced.matches ? 'auto' : 'smooth'});
  };

  const begin = (step, isMove) => {
    walk = {from: step.id, moves: []};
    history.replaceState(walk, '');
    show(step, isMove);
  };

  // A step that was not come to by moves: a link, the address, or the browser's own Back.
  addEventListener('popstate', (event) => {
    const step = stepOf(location.hash) || (location.hash ? null : steps[0]);
    if (!step) return;
    if (!event.state || !event.state.moves) return begin(step, true);
    walk = event.state;
    show(step, true);
  });

  const move = (link) => {
    const step = stepOf(link.hash);
    walk = {from: walk.from, moves: [...walk.moves, link.dataset.move]};
    history.pushState(walk, '', link.hash);
    show(step, true);
  };

  document.addEventListener('click', (event) => {
    const link = event.target.closest('a[data-move]');
    if (!link || event.ctrlKey || event.metaKey || event.shiftKey) return;
    event.preventDefault();
    if (link.hash) move(link);
  });

  const wait = (button) => {
    const shown = button.parentElement.querySelector('.countdown');
    const end = performance.now() + 1000 * button.dataset.seconds;
    button.disabled = true;
    countdown = setInterval(() => {
      const left = (end - performance.now()) / 1000;
      shown.textContent = Math.max(left, 0).toFixed(1);
      if (left > 0) return;
      clearInterval(countdown);
      button.parentElement.querySelector('.skip').click();
    }, 100);
  };

  for (const button of document.querySelectorAll('.wait')) {
    button.hidden = false;
    button.addEventListener('click', () => wait(button));
  }

  at('back').addEventListener('click', () => history.back());
  at('again').addEventListener('click', () => {
    walk = {from: steps[0].id, moves: []};
    history.pushState(walk, '', '#' + steps[0].id);
    show(steps[0], true);
  });
  at('copy').addEventListener('click', async () => {
    at('command').select();
    const copied = await navigator.clipboard?.writeText(at('command').value).then(() => true, () => false)
        || document.execCommand('copy');
    at('status').textContent = copied ? 'Copied' : 'Press Ctrl-C to copy';
  });

  const texts = new Map();  // of the steps, in small letters
  const textOf = (id) => {
    if (!texts.has(id)) texts.set(id, at(id).textContent.toLowerCase());
    return texts.get(id);
  };
  at('search').addEventListener('input', () => {
    const wanted = at('search').value.trim().toLowerCase();
    for (const [hash, link] of links) {
      link.parentElement.hidden = wanted !== '' && !textOf(hash.slice(1)).includes(wanted);
    }
  });

  addEventListener('beforeprint', () => {
    for (const step of steps) fill(step);
    for (const image of document.images) image.loading = 'eager';
  });

  document.querySelector('.player').hidden = false;
  steps[0].classList.remove('current');
  begin(stepOf(location.hash) || steps[0], location.hash !== '');
})();

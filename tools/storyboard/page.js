// SPDX-License-Identifier: MIT
// Plays a storyboard: shows one step at a time, and keeps the moves that led to it.
'use strict';
(() => {
  const at = (id) => document.getElementById(id);
  const steps = [...document.querySelectorAll('.step')];
  const links = new Map([...document.querySelectorAll('#_contents a')].map((a) => [a.hash, a]));
  const reduced = matchMedia('(prefers-reduced-motion: reduce)');
  let current = null;
  let walk = null;  // the step where it began, and the moves since
  let countdown = 0;

  const stepOf = (hash) => {
    const found = at(hash.slice(1));
    return found && found.classList.contains('step') ? found : null;
  };

  // --- the map, which a page may be without ---

  const map = at('_map');
  const nodes = map ? [...map.querySelectorAll('.node')] : [];
  const edges = map ? [...map.querySelectorAll('.edge')] : [];
  let zoom = 1;

  const showOnMap = (step) => {
    const {node} = step.dataset;
    for (const each of nodes) each.toggleAttribute('aria-current', each.dataset.node === node);
    for (const edge of edges) {
      edge.classList.toggle('front', edge.dataset.from === node || edge.dataset.to === node);
    }
    if (map && map.open) nodes[node].scrollIntoView({block: 'nearest', inline: 'nearest'});
  };

  const setZoom = (wanted) => {
    zoom = Math.min(Math.max(wanted, .1), 3);
    map.querySelector('.sheet').style.zoom = zoom;
  };

  // Drags the map by its background.
  const dragMap = (frame) => {
    frame.addEventListener('pointerdown', (event) => {
      if (event.pointerType !== 'mouse' || event.target.closest('.node')) return;
      const pan = (moved) => frame.scrollBy(-moved.movementX, -moved.movementY);
      const end = () => frame.removeEventListener('pointermove', pan);
      frame.setPointerCapture(event.pointerId);
      frame.addEventListener('pointermove', pan);
      frame.addEventListener('pointerup', end, {once: true});
    });
    frame.addEventListener('wheel', (event) => {
      if (!event.ctrlKey) return;
      event.preventDefault();
      setZoom(zoom * (event.deltaY < 0 ? 1.2 : 1 / 1.2));
    }, {passive: false});
  };

  if (map) {
    const frame = map.querySelector('.map');
    const sheet = map.querySelector('.sheet');
    const [width, height] = [parseFloat(sheet.style.width), parseFloat(sheet.style.height)];
    at('_larger').addEventListener('click', () => setZoom(zoom * 1.3));
    at('_smaller').addEventListener('click', () => setZoom(zoom / 1.3));
    at('_whole').addEventListener('click', () => setZoom(
        Math.min((frame.clientWidth - 40) / width, (frame.clientHeight - 40) / height, 1)));
    map.addEventListener('toggle', () => map.open && showOnMap(current));
    dragMap(frame);
  }

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
    step.classList.add('current');
    const link = links.get('#' + step.id);
    link?.setAttribute('aria-current', 'true');
    at('_command').value = [at(walk.from).dataset.command, ...walk.moves].join(' ');
    showOnMap(step);
    at('_back').disabled = walk.moves.length === 0;
    at('_status').textContent = '';
    if (!isMove) return;
    step.querySelector('h2').focus({preventScroll: true});
    step.querySelector('h2').scrollIntoView({block: 'nearest', behavior: reduced.matches ? 'auto' : 'smooth'});
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

  at('_back').addEventListener('click', () => history.back());
  at('_again').addEventListener('click', () => {
    walk = {from: steps[0].id, moves: []};
    history.pushState(walk, '', '#' + steps[0].id);
    show(steps[0], true);
  });
  at('_copy').addEventListener('click', async () => {
    at('_command').select();
    const copied = await navigator.clipboard?.writeText(at('_command').value).then(() => true, () => false)
        || document.execCommand('copy');
    at('_status').textContent = copied ? 'Copied' : 'Press Ctrl-C to copy';
  });

  const texts = new Map();  // of the steps, in small letters
  const textOf = (id) => {
    if (!texts.has(id)) texts.set(id, at(id).textContent.toLowerCase());
    return texts.get(id);
  };
  at('_search').addEventListener('input', () => {
    const wanted = at('_search').value.trim().toLowerCase();
    const found = new Set();  // nodes
    for (const [hash, link] of links) {
      const isFound = wanted === '' || textOf(hash.slice(1)).includes(wanted);
      link.parentElement.hidden = !isFound;
      if (isFound) found.add(at(hash.slice(1)).dataset.node);
    }
    for (const node of nodes) node.classList.toggle('dim', !found.has(node.dataset.node));
  });

  document.querySelector('.player').hidden = false;
  steps[0].classList.remove('current');
  begin(stepOf(location.hash) || steps[0], location.hash !== '');
})();

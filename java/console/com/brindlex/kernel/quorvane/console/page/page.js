// The shell of the page: its places, its keys, and what all places draw with. Texts of a log only
// ever become text nodes.
import { openLog } from './log.js';
import { openTry } from './try.js';
import { openSession } from './session.js';
import { openDictionary } from './dictionary.js';
import { byId, note } from './parts.js';

const places = ['log', 'try', 'session', 'dictionary'];
const opening = { try: openTry, session: openSession, dictionary: openDictionary };
let current = 'log';

function show(place, focus) {
  for (const each of places) {
    const tab = byId('tab-' + each);
    byId(each).hidden = each !== place;
    tab.setAttribute('aria-selected', String(each === place));
    tab.tabIndex = each === place ? 0 : -1;
  }
  current = place;
  note('');
  if (focus) {
    byId('tab-' + place).focus();
  }
  if (opening[place]) {
    opening[place]();
    delete opening[place];
  }
}

function isWriting(target) {
  return target.matches('input:not([type="checkbox"]), textarea, select');
}

for (const place of places) {
  byId('tab-' + place).addEventListener('click', () => show(place));
}

byId('tabs').addEventListener('keydown', event => {
  const step = { ArrowRight: 1, ArrowLeft: -1 }[event.key];
  if (step) {
    show(places[(places.indexOf(current) + step + places.length) % places.length], true);
    event.preventDefault();
  }
});

document.addEventListener('keydown', event => {
  if (event.ctrlKey || event.altKey || event.metaKey || isWriting(event.target)) {
    return;
  }
  if (event.key >= '1' && event.key <= '4') {
    show(places[event.key - 1], true);
  } else if (event.key === '/') {
    const field = document.querySelector('#' + current + ' [type="search"]');
    if (field && field.offsetParent) {
      field.focus();
      event.preventDefault();
    }
  }
});

openLog(() => current === 'log');

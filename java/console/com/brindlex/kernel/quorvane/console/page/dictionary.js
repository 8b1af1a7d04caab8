// Dictionary: every tag, operation, code and message, found as one writes.
import { ask, byId, h } from './parts.js';

const MOST = 200;
let entries = [];

function rank(entry, text) {
  const key = entry.key.toLowerCase();
  return key === text ? 0 : key.startsWith(text) ? 1 : key.includes(text) ? 2 : 3;
}

function search() {
  const text = byId('dictionary-search').value.trim().toLowerCase();
  const words = text.split(/\s+/);
  const found = entries.filter(entry => words.every(each => entry.search.includes(each)))
      .sort((a, b) => rank(a, text) - rank(b, text));
  byId('dictionary-count').textContent = found.length + ' found'
      + (found.length > MOST ? ', the first ' + MOST + ' are shown' : '');
  byId('dictionary-found').replaceChildren(...found.slice(0, MOST).map(entry =>
      h('div', { className: 'entry' },
          h('div', { className: 'kind' }, entry.kind),
          h('div', { className: 'key' }, entry.key),
          h('div', null, entry.title, h('small', null, entry.more),
              h('small', null, entry.where)))));
}

export async function openDictionary() {
  const all = await ask('dictionary');
  if (all) {
    entries = all.entries;
    entries.forEach(each => {
      each.search = Object.values(each).join(' ').toLowerCase();
    });
    byId('dictionary-search').addEventListener('input', search);
    search();
  }
}

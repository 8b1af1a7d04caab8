// Log: the timeline on the left, the message taken apart on the right. Only the rows in view are
// drawn, however many there are.
import { saveCsv } from './csv.js';
import { ask, byId, h, messageTable, note } from './parts.js';

const HEIGHT = 46;
const SPARE = 6;
const POLL_MILLIS = 1000;

const list = byId('log-rows');
const spacer = h('div');
let log = null;      // the id of the log at the server
let file = '';       // the name of the file that is followed; empty for another log
let rows = [];       // all rows of the timeline
let shown = [];      // the numbers of those that the filter takes
let answers = {};    // the number of the answer by the line of its request
let asked = {};      // the number of a row by its line
let chosen = -1;     // the number of the row that is shown on the right
let reading = 0;     // counts logs: an answer about an older one comes too late

/** Shows a log; without a charset it is a text, which has none to choose. */
async function read(id, charset, name) {
  const mine = ++reading;
  log = id;
  file = name || '';
  showCharset(charset);
  rows = [];
  answers = {};
  asked = {};
  chosen = -1;
  list.scrollTop = 0;
  list.setAttribute('aria-busy', 'true');
  byId('log-open').hidden = true;
  byId('log-read').hidden = false;
  byId('log-message').replaceChildren(
      h('p', { className: 'about' }, 'Choose a message: it and its answer are taken apart here.'));
  document.title = name ? name + ' · quorvane' : 'quorvane';
  filter();
  while (mine === reading) {
    const more = await ask('rows?log=' + id + '&from=' + rows.length);
    if (mine !== reading || !more) {
      return;
    }
    more.rows.forEach(take);
    if (more.rows.length) {
      filter();
    }
    if (more.cut) {
      note('The log goes on: only its first ' + more.total + ' messages are shown.');
    }
    list.setAttribute('aria-busy', String(rows.length < more.total));
    if (rows.length >= more.total) {
      if (!name) {
        break;
      }
      await new Promise(done => setTimeout(done, POLL_MILLIS));
    }
  }
  if (!rows.length) {
    note('No message found in this log.');
  }
}

function take(row) {
  const number = rows.length;
  row.search = [row.time, row.account, row.idNumber, row.instrument, row.operation, row.title,
    row.words, row.status, row.requestId].join(' ').toLowerCase();
  row.bad = row.faults.length > 0 || row.status === 'refused' || row.status === 'failed';
  asked[row.line] = number;
  if (row.requestLine) {
    answers[row.requestLine] = number;
  }
  rows.push(row);
}

function filter() {
  const words = byId('log-filter').value.toLowerCase().split(/\s+/).filter(each => each);
  const failures = byId('log-failures').checked;
  shown = [];
  rows.forEach((row, number) => {
    if ((!failures || row.bad) && words.every(each => row.search.includes(each))) {
      shown.push(number);
    }
  });
  const all = rows.length + (rows.length === 1 ? ' message' : ' messages');
  byId('log-count').textContent = shown.length === rows.length ? all : shown.length + ' of ' + all;
  spacer.style.height = shown.length * HEIGHT + 'px';
  draw();
}

function draw() {
  const first = Math.max(0, Math.floor(list.scrollTop / HEIGHT) - SPARE);
  const last = Math.min(shown.length,
      Math.ceil((list.scrollTop + list.clientHeight) / HEIGHT) + SPARE);
  const tied = chosen < 0 ? -1 : partner(chosen);
  const drawn = [spacer];
  for (let place = first; place < last; place++) {
    drawn.push(line(place, tied));
  }
  list.replaceChildren(...drawn);
  list.setAttribute('aria-activedescendant', chosen < 0 ? '' : 'row-' + chosen);
}

function line(place, tied) {
  const number = shown[place];
  const row = rows[number];
  const name = row.operation.replace(/(En|De)code/, '');
  const took = row.millis === null ? '' : ' · ' + row.millis + ' ms';
  const faults = [...new Set(row.faults.map(each => each.kind))].join(', ');
  const element = h('div', {
    className: 'row' + (row.bad ? ' bad' : '') + (number === tied ? ' tied' : ''),
    id: 'row-' + number, role: 'option', 'aria-selected': String(number === chosen),
    'aria-setsize': shown.length, 'aria-posinset': place + 1,
  }, h('div', { className: 'head' }, (row.isRequest ? '→ ' : '← ') + row.time + ' ',
      h('b', null, name || '(unknown)'),
      ' ' + (row.account ? row.account + ' · ' : '') + row.status + took),
  h('div', { className: 'words', title: row.words },
      row.words + (faults ? ' [' + faults + ']' : '')));
  element.style.top = place * HEIGHT + 'px';
  element.addEventListener('click', () => choose(place));
  return element;
}

function partner(number) {
  const row = rows[number];
  const other = row.requestLine ? asked[row.requestLine] : answers[row.line];
  return other === undefined ? -1 : other;
}

async function choose(place) {
  if (place < 0 || place >= shown.length) {
    return;
  }
  chosen = shown[place];
  const top = place * HEIGHT;
  if (top < list.scrollTop) {
    list.scrollTop = top;
  } else if (top + HEIGHT > list.scrollTop + list.clientHeight) {
    list.scrollTop = top + HEIGHT - list.clientHeight;
  }
  draw();
  const number = chosen;
  const mine = reading;
  const pair = [number, partner(number)].filter(each => each >= 0).sort((a, b) => a - b);
  const messages = await Promise.all(pair.map(each => ask('message?log=' + log + '&row=' + each)));
  if (number === chosen && mine === reading && messages.every(each => each)) {
    byId('log-message').replaceChildren(h('div', { className: 'pair' },
        ...pair.map((each, at) => section(rows[each], messages[at]))));
    byId('log-message').scrollTop = 0;
  }
}

function section(row, message) {
  const about = ['line ' + row.line, row.time, message.operations.slice(0, 3).join(' or '),
    row.requestId && 'request ' + row.requestId,
    row.millis === null ? '' : 'after ' + row.millis + ' ms'].filter(each => each).join(' · ');
  const element = h('section', { 'aria-label': row.isRequest ? 'Request' : 'Answer' },
      h('h2', null, (row.isRequest ? '→ ' : '← ') + message.words),
      h('p', { className: 'about' }, about), ...messageTable(message));
  const first = element.querySelector('tr.bad');
  if (first) {
    const show = h('button', { type: 'button' }, row.faults.length === 1
        ? 'Show the fault' : 'Show the first of ' + row.faults.length + ' faults');
    show.addEventListener('click', () => first.scrollIntoView({ block: 'center' }));
    element.querySelector('.about').after(show);
  }
  return element;
}

function nextFailure(step) {
  for (let at = place() + step; at >= 0 && at < shown.length; at += step) {
    if (rows[shown[at]].bad) {
      choose(at);
      return;
    }
  }
}

const place = () => shown.indexOf(chosen);

function key(event) {
  const page = Math.max(1, Math.floor(list.clientHeight / HEIGHT) - 1);
  const at = place();
  const to = {
    ArrowDown: at + 1, ArrowUp: Math.max(0, at - 1), Home: 0, End: shown.length - 1,
    PageDown: Math.min(shown.length - 1, at + page), PageUp: Math.max(0, at - page),
  }[event.key];
  if (to !== undefined) {
    choose(to);
  } else if (event.key === 'n' || event.key === 'p') {
    nextFailure(event.key === 'n' ? 1 : -1);
  } else if (event.key === 'Enter') {
    byId('log-message').focus();
  } else {
    return;
  }
  event.preventDefault();
}

function showCharset(charset) {
  const select = byId('log-charset');
  byId('log-in').hidden = !charset;
  if (charset && ![...select.options].some(each => each.value === charset)) {
    select.append(h('option', null, charset));
  }
  select.value = charset || '';
}

async function readAgain() {
  const charset = byId('log-charset').value;
  const again = await ask('charset?log=' + log + '&charset=' + charset, { method: 'POST' });
  if (again) {
    await read(again.log, charset, file);
  }
}

async function send(body, from) {
  note('');
  const opened = await ask('log?from=' + from, { method: 'POST', body });
  if (opened) {
    byId('log-save').hidden = true;
    byId('log-filter').value = '';
    await read(opened.log, from === 'file' ? opened.charset : '');
    list.focus();
  }
}

async function mask(event) {
  event.preventDefault();
  const keep = [...byId('log-mask').querySelectorAll('input:not(:checked)')]
      .map(each => each.value).join(',');
  const masked = await ask('mask?log=' + log + '&keep=' + keep, { method: 'POST' });
  if (masked) {
    byId('log-masking').open = false;
    byId('log-save').href = 'api/masked?log=' + masked.log;
    byId('log-save').hidden = false;
    await read(masked.log);
    list.focus();
  }
}

function other() {
  byId('log-read').hidden = true;
  byId('log-open').hidden = false;
  byId('log-back').hidden = !log;
  byId('log-text').focus();
}

function drops(isHere) {
  document.addEventListener('dragover', event => event.preventDefault());
  document.addEventListener('drop', event => {
    event.preventDefault();
    const file = event.dataTransfer.files[0];
    const text = event.dataTransfer.getData('text/plain');
    if (isHere() && (file || text)) {
      send(file || text, file ? 'file' : 'paste');
    }
  });
  document.addEventListener('paste', event => {
    if (isHere() && !event.target.matches('input, textarea')) {
      send(event.clipboardData.getData('text/plain'), 'paste');
    }
  });
}

export async function openLog(isHere) {
  list.append(spacer);
  list.addEventListener('scroll', draw);
  list.addEventListener('keydown', key);
  new ResizeObserver(draw).observe(list);
  byId('log-message').addEventListener('keydown', event => {
    if (event.key === 'Escape') {
      list.focus();
    }
  });
  byId('log-filter').addEventListener('input', () => { list.scrollTop = 0; filter(); });
  byId('log-filter').addEventListener('keydown', event => {
    if (event.key === 'Enter' || event.key === 'Escape') {
      list.focus();
    }
  });
  byId('log-failures').addEventListener('change', filter);
  byId('log-mask').addEventListener('submit', mask);
  byId('log-csv').addEventListener('click', () => saveCsv(shown.map(number => rows[number])));
  byId('log-charset').addEventListener('change', readAgain);
  byId('log-other').addEventListener('click', other);
  byId('log-back').addEventListener('click', () => {
    byId('log-open').hidden = true;
    byId('log-read').hidden = false;
  });
  byId('log-open').addEventListener('submit', event => {
    event.preventDefault();
    send(byId('log-text').value, 'paste');
  });
  byId('log-text').addEventListener('keydown', event => {
    if (event.key === 'Enter' && (event.ctrlKey || event.metaKey)) {
      byId('log-open').requestSubmit();
    }
  });
  byId('log-file').addEventListener('change', event => {
    if (event.target.files[0]) {
      send(event.target.files[0], 'file');
    }
  });
  drops(isHere);
  const start = await ask('start');
  if (start && start.log) {
    read(start.log, start.charset, start.name);
  }
}

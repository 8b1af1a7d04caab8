// Session: orders to the simulated gateway, and what the exchange makes of them.
import { ask, bringIntoView, byId, h, messageTable, note, resultTable, tell } from './parts.js';
import { allForms, choice, inputs, problems, written } from './try.js';

const ACTS = {
  fill: ['Fill a stock order', ['order', 'A0001'], ['quantity', '1000', 'shares'],
    ['price', '995.00']],
  'fill-futures': ['Fill a futures order', ['order', 'F0001'], ['quantity', '1', 'contracts'],
    ['price', '17500'], ['price2', '', 'of leg 2']],
  fail: ['Refuse a stock order', ['order', 'A0001'], ['text', '交易所退單!']],
  'fail-futures': ['Refuse a futures order', ['order', 'F0001'], ['text', '交易所退單!']],
  line: ['The way to the host', ['line', 'up', 'up, gateway_down, broker_timeout or silent']],
  anew: ['Begin anew'],
};

let sequence = 1;

function showLists(state) {
  if (state) {
    const parts = [h('p', { className: 'about' }, 'The way to the host: ' + state.line)];
    for (const [title, result] of Object.entries(state.lists)) {
      parts.push(h('h2', null, title), ...resultTable(result));
    }
    byId('session-lists').replaceChildren(...parts);
  }
}

function showSent(value) {
  byId('session-result').replaceChildren(h('h2', null, 'What was sent and answered'),
      h('div', { className: 'pair' }, ...['request', 'reply'].map(kind =>
          h('section', null, h('h2', null, (kind === 'request' ? '→ ' : '← ') + value[kind].words),
              ...messageTable(value[kind])))));
  bringIntoView(byId('session-lists'));
}

function showForm(all, name) {
  const element = byId('session-form');
  const form = all.find(each => each.name === name);
  element.replaceChildren(h('h2', null, 'Order, or ask'),
      choice(all, name, other => showForm(all, other)), inputs(form),
      h('button', { type: 'submit' }, 'Send'));
  element.onsubmit = async event => {
    event.preventDefault();
    element.querySelector('[name="seqNo"]').value = sequence++;
    const value = await tell('session/send', written(element, name));
    if (value) {
      problems(element, value.problems);
      if (value.request) {
        showSent(value);
      }
      showLists(await ask('session'));
    }
  };
}

function showAct(name) {
  const element = byId('session-act');
  const [, ...fields] = ACTS[name];
  const select = h('select', { 'aria-label': 'What happens' }, ...Object.entries(ACTS).map(
      ([each, [title]]) => h('option', { value: each }, title)));
  select.value = name;
  select.addEventListener('change', () => showAct(select.value));
  element.replaceChildren(h('fieldset', null, h('legend', null, 'At the exchange'), select,
      h('div', { className: 'inputs' }, ...fields.map(([field, usual, unit]) => h('label', null,
          h('span', null, field), h('input', { name: field, value: usual }),
          h('small', null, unit || '')))),
      h('button', { type: 'submit' }, 'Let it happen')));
  element.onsubmit = async event => {
    event.preventDefault();
    note('');
    showLists(await tell('session/act', { ...written(element, ''), act: name }));
  };
}

export async function openSession() {
  const all = (await allForms()).filter(each => each.encoder);
  if (all.length) {
    showForm(all, 'SubmitOrderEncode');
    showAct('fill');
    showLists(await ask('session'));
  }
}

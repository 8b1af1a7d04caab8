// Try: a form for each operation; the library itself encodes and decodes.
import { ask, bringIntoView, byId, bytes, h, messageTable, note, resultTable, tell } from './parts.js';

let forms = null;

/** All operations with the inputs of their forms. */
export async function allForms() {
  forms = forms || await ask('forms');
  return forms || [];
}

function input(each) {
  if (!each.codes.length) {
    return h('input', { name: each.name, value: each.usual, spellcheck: false });
  }
  const select = h('select', { name: each.name }, ...each.codes.map(code =>
      h('option', { value: code.code },
          code.code.trim() && code.label !== code.code ? code.code + ' ' + code.label : code.label)));
  if (!each.codes.some(code => code.code === each.usual)) {
    select.prepend(h('option', { value: each.usual }, each.usual || '(none)'));
  }
  select.value = each.usual;
  return select;
}

/** The inputs of a form, each with what it is for. */
export function inputs(form) {
  return h('div', { className: 'inputs' }, ...form.inputs.map(each =>
      h('label', { 'data-name': each.name }, h('span', null, each.name), input(each),
          h('small', null, each.purpose))));
}

/** A list of operations to choose from. */
export function choice(some, chosen, change) {
  const select = h('select', { 'aria-label': 'Operation' }, ...some.map(each =>
      h('option', { value: each.name }, each.name + ': ' + each.title)));
  select.value = chosen;
  select.addEventListener('change', () => change(select.value));
  return select;
}

/** What is written in a form, by name. */
export function written(element, operation) {
  const values = { operation };
  element.querySelectorAll('[name]').forEach(each => { values[each.name] = each.value; });
  return values;
}

/** Shows at each input why it cannot be sent; those of no input go into the note. */
export function problems(element, some) {
  element.querySelectorAll('label .fault').forEach(each => each.remove());
  const left = [];
  for (const each of some || []) {
    const label = element.querySelector('label[data-name="' + CSS.escape(each.argument) + '"]');
    if (label) {
      label.append(h('span', { className: 'fault' }, each.argument + ' ' + each.reason));
    } else {
      left.push(each.argument + ' ' + each.reason);
    }
  }
  note(left.join('; '));
}

function copyButtons(copies) {
  return h('p', { className: 'bar' }, ...[['java', 'Java'], ['kotlin', 'Kotlin'],
    ['golden', 'a golden case']].map(([kind, name]) => {
    const button = h('button', { type: 'button' }, 'Copy as ' + name);
    button.addEventListener('click', async () => {
      await navigator.clipboard.writeText(copies[kind]);
      button.textContent = 'Copied as ' + name;
    });
    return button;
  }));
}

function showResult(value) {
  const parts = [];
  if (value.result) {
    parts.push(h('h2', null, 'Result: ' + value.result.outcome + ', status ' + value.result.status),
        ...resultTable(value.result), h('pre', null, value.result.text),
        h('h2', null, 'The reply taken apart'), ...messageTable(value.message));
  } else if (value.message) {
    parts.push(h('h2', null, value.message.words), h('pre', null, value.text),
        ...messageTable(value.message));
  }
  if (value.text) {
    parts.push(bytes(value.text));
  }
  if (value.copies) {
    parts.push(copyButtons(value.copies));
  }
  byId('try-result').replaceChildren(...parts);
  bringIntoView(byId('try-result'));
}

function show(all, name) {
  const form = all.find(each => each.name === name);
  const fields = form.encoder ? inputs(form)
      : h('div', { className: 'inputs whole' }, h('label', null, h('span', null, 'reply'),
          h('textarea', { name: 'reply', rows: 8, spellcheck: false }),
          h('small', null, 'a reply of the gateway, as it came')));
  const element = byId('try-form');
  element.replaceChildren(choice(all, name, other => show(all, other)), fields,
      h('button', { type: 'submit' }, form.encoder ? 'Encode' : 'Decode'));
  element.onsubmit = async event => {
    event.preventDefault();
    const path = form.encoder ? 'encode' : 'decode';
    const value = await tell(path, written(element, name));
    if (value) {
      problems(element, value.problems);
      showResult(value);
    }
  };
  byId('try-result').replaceChildren();
}

export async function openTry() {
  const all = await allForms();
  if (all.length) {
    show(all, 'SubmitOrderEncode');
  }
}

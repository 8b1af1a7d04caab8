// What all places draw and ask with.

export const byId = id => document.getElementById(id);

/** An element; its children are elements, or texts that become text nodes. */
export function h(name, properties, ...children) {
  const element = document.createElement(name);
  for (const [key, value] of Object.entries(properties || {})) {
    if (key in element && key !== 'list') {
      element[key] = value;
    } else {
      element.setAttribute(key, value);
    }
  }
  element.append(...children.filter(each => each !== null && each !== undefined));
  return element;
}

export function note(text) {
  byId('note').textContent = text;
}

/** Asks the server; null, and a note, when it refuses. */
export async function ask(path, options) {
  try {
    const answer = await fetch('api/' + path, options);
    const value = await answer.json();
    if (answer.ok) {
      return value;
    }
    note(value.error);
  } catch (failure) {
    note('The page’s server does not answer: was it ended?');
  }
  return null;
}

/** On a narrow screen an answer stands below the form that asked for it. */
export function bringIntoView(element) {
  if (element.getBoundingClientRect().top > window.innerHeight / 2) {
    element.scrollIntoView({ block: 'start' });
  }
}

export const tell = (path, value) => ask(path, { method: 'POST', body: JSON.stringify(value) });

export function faultLine(fault) {
  return h('p', { className: 'fault' }, h('b', null, fault.kind), ': ' + fault.text);
}

/** A message taken apart: field, value, meaning, and each fault at its field. */
export function messageTable(message) {
  const parts = message.faults.map(faultLine);
  for (const group of message.groups) {
    if (message.groups.length > 1) {
      parts.push(h('h3', null, group.title));
    }
    const rows = group.fields.map(field => h('tr', { className: field.faults.length ? 'bad' : '' },
        h('td', null, field.tag ? h('code', null, field.tag + ' ') : null,
            field.name === null ? '(unknown)' : field.name),
        h('td', { className: 'value' }, field.value),
        h('td', null, field.meaning, ...field.faults.map(faultLine))));
    parts.push(h('table', { className: 'fields' },
        parts.some(each => each.tagName === 'TABLE') ? null : h('thead', null, h('tr', null,
            ...['Field', 'Value', 'Meaning, fault'].map(each => h('th', { scope: 'col' }, each)))),
        h('tbody', null, ...rows)));
  }
  parts.push(h('details', null, h('summary', null, 'The message as it stands'),
      h('pre', null, message.text)));
  return parts;
}

/** The bytes of a text as they go out, sixteen a line. */
export function bytes(text) {
  const all = new TextEncoder().encode(text);
  const lines = [];
  for (let at = 0; at < all.length; at += 16) {
    const some = [...all.slice(at, at + 16)];
    const hex = some.map(each => each.toString(16).padStart(2, '0')).join(' ');
    const shown = some.map(each => each > 31 && each < 127 ? String.fromCharCode(each) : '·');
    lines.push(at.toString(16).padStart(4, '0') + '  ' + hex.padEnd(48) + ' ' + shown.join(''));
  }
  return h('details', null, h('summary', null, all.length + ' bytes'),
      h('pre', { className: 'bytes' }, lines.join('\n')));
}

function cell(value) {
  if (value === null) {
    return '';
  }
  return typeof value === 'object' ? value.code + (value.name ? ' ' + value.name : '')
                                   : String(value);
}

/** The result that the library made of a reply. */
export function resultTable(result) {
  const parts = [];
  if (result.message) {
    parts.push(h('p', { className: 'fault' },
        result.message.text + (result.message.code ? ' (' + result.message.code + ')' : '')));
  }
  for (const section of result.sections) {
    parts.push(h('h3', null, section.table + ': ' + (section.rows.length || 'none')));
    if (section.rows.length) {
      const names = Object.keys(section.rows[0]);
      parts.push(h('div', { className: 'scroll', tabIndex: 0 }, h('table', null,
          h('thead', null, h('tr', null, ...names.map(each => h('th', { scope: 'col' }, each)))),
          h('tbody', null, ...section.rows.map(row => h('tr', null,
              ...names.map(each => h('td', null, cell(row[each])))))))));
    }
  }
  result.faults.forEach(each => parts.push(h('p', { className: 'fault' }, each.text)));
  return parts;
}

// The timeline as a spreadsheet takes it, as `quorvane timeline --csv` writes it.
import { h } from './parts.js';

const COLUMNS = {
  line: row => row.line, time: row => row.time,
  direction: row => row.isRequest ? 'request' : 'reply',
  operation: row => row.operation, title: row => row.title, account: row => row.account,
  instrument: row => row.instrument, words: row => row.words, status: row => row.status,
  request_id: row => row.requestId, request_line: row => row.requestLine || '',
  millis: row => row.millis === null ? '' : row.millis,
  faults: row => row.faults.map(each => each.kind).join(' '),
};

/** A cell that a spreadsheet would calculate is shown as the text that it is. */
function cell(value) {
  const text = String(value).replace(/^(?!-?\d+$)[=+\-@\t\r]/, "'$&");
  return /[",\r\n]/.test(text) ? '"' + text.replaceAll('"', '""') + '"' : text;
}

export function csv(rows) {
  const lines = [Object.keys(COLUMNS), ...rows.map(row =>
      Object.values(COLUMNS).map(value => cell(value(row))))];
  return lines.map(line => line.join(',') + '\r\n').join('');
}

/** Saves rows; the byte order mark tells spreadsheets that it is UTF-8. */
export function saveCsv(rows) {
  const url = URL.createObjectURL(new Blob(['\uFEFF' + csv(rows)], { type: 'text/csv' }));
  h('a', { href: url, download: 'timeline.csv' }).click();
  setTimeout(() => URL.revokeObjectURL(url), 60000);
}

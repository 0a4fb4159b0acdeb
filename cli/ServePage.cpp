// The page of `robotcfg serve`: HTML, style and script compiled into the
// tool, so that it works offline and loads nothing from elsewhere.
#include "cli/ServePage.h"

const char *servePageHtml() {
  return R"HTML(<!DOCTYPE html>
<html lang="en">
<head>
<meta charset="utf-8">
<meta name="viewport" content="width=device-width, initial-scale=1">
<title>robotcfg setup</title>
<link rel="stylesheet" href="/app.css">
<script src="/app.js" defer></script>
</head>
<body>
<header>
  <h1>Robot setup</h1>
  <label>Program <select id="program" aria-label="Program"></select></label>
  <button id="undo" type="button">Undo</button>
  <button id="save" type="button">Save</button>
  <button id="reload" type="button" hidden>Reload from disk</button>
  <span id="status" role="status" aria-live="polite"></span>
</header>
<main>
  <section id="dialogs" aria-label="Setup">
    <div role="tablist" id="tabs" aria-label="Setup tabs"></div>
    <div id="panels"></div>
  </section>
  <aside>
    <h2>Configuration block</h2>
    <pre id="block" aria-label="Generated block and its difference from the file"></pre>
    <h2>Findings</h2>
    <ul id="findings"></ul>
    <h2>Wiring</h2>
    <div id="picture" aria-label="Wiring picture"></div>
  </aside>
</main>
</body>
</html>
)HTML";
}

const char *servePageCss() {
  return R"CSS(body { font-family: sans-serif; margin: 0; color: #111827; background: #f9fafb; }
header { display: flex; gap: 1em; align-items: center; padding: .5em 1em; background: #1f2937; color: #fff; }
header h1 { font-size: 1.2em; margin: 0 1em 0 0; }
main { display: grid; grid-template-columns: minmax(0, 3fr) minmax(0, 2fr); gap: 1em; padding: 1em; }
[role=tablist] { display: flex; flex-wrap: wrap; gap: .25em; }
[role=tab] { padding: .4em .8em; border: 1px solid #9ca3af; background: #e5e7eb; cursor: pointer; }
[role=tab][aria-selected=true] { background: #fff; border-bottom-color: #fff; font-weight: bold; }
[role=tabpanel] { background: #fff; border: 1px solid #9ca3af; padding: .5em; overflow-x: auto; }
table { border-collapse: collapse; width: 100%; }
th, td { border-bottom: 1px solid #e5e7eb; padding: .25em .5em; text-align: left; }
tr.focus { outline: 3px solid #f59e0b; }
pre { background: #111827; color: #e5e7eb; padding: .5em; overflow-x: auto; font-size: 12px; }
pre .add { color: #86efac; } pre .del { color: #fca5a5; }
#findings li { cursor: pointer; } #findings li.error { color: #b91c1c; } #findings li.warning { color: #b45309; }
#picture svg { max-width: 100%; height: auto; background: #fff; }
#status.bad { color: #fca5a5; }
button:focus, select:focus, input:focus, [role=tab]:focus { outline: 3px solid #f59e0b; }
)CSS";
}

const char *servePageScript() {
  return R"JS('use strict';
const token = new URLSearchParams(location.search).get('token') || '';
let state = null;
let currentTab = 'Motors';
const $ = (id) => document.getElementById(id);

async function api(path, body) {
  const options = { method: body ? 'POST' : 'GET', headers: { 'Authorization': 'token ' + token } };
  if (body) { options.headers['Content-Type'] = 'application/json'; options.body = JSON.stringify(body); }
  const response = await fetch(path, options);
  const data = await response.json();
  return { ok: response.ok, status: response.status, data };
}

function say(text, bad) { const s = $('status'); s.textContent = text; s.className = bad ? 'bad' : ''; }

function el(tag, attrs, ...children) {
  const node = document.createElement(tag);
  for (const [k, v] of Object.entries(attrs || {})) {
    if (k.startsWith('on')) node.addEventListener(k.slice(2), v); else if (v !== null && v !== undefined) node.setAttribute(k, v);
  }
  for (const c of children) node.append(c instanceof Node ? c : document.createTextNode(String(c)));
  return node;
}

async function edit(path, value) {
  const r = await api('/api/edit', { program: $('program').value, edits: [{ op: 'set', path, value }] });
  if (!r.ok) { say(r.data.error, true); render(); return; }
  state = r.data; say(path + ' = ' + (value === null ? 'none' : value)); render();
}

function select(label, path, value, words, withNone) {
  const s = el('select', { 'aria-label': label, onchange: (e) => edit(path, e.target.value === '' ? null : e.target.value) });
  if (withNone) s.append(el('option', { value: '' }, '(none)'));
  for (const w of words || []) s.append(el('option', { value: w }, w));
  if (value !== null && value !== undefined && !(words || []).includes(value)) s.append(el('option', { value }, value));
  s.value = value === null || value === undefined ? '' : value;
  return s;
}

function checkbox(label, path, checked) {
  const c = el('input', { type: 'checkbox', 'aria-label': label, onchange: (e) => edit(path, e.target.checked) });
  c.checked = !!checked; return c;
}

function nameInput(label, path, value) {
  return el('input', { type: 'text', value: value || '', 'aria-label': label, size: 14,
                       onchange: (e) => edit(path, e.target.value) });
}

function table(headers, rows) {
  return el('table', {}, el('thead', {}, el('tr', {}, ...headers.map((h) => el('th', { scope: 'col' }, h)))),
            el('tbody', {}, ...rows));
}

const tabs = {
  'Motors': (d) => table(['Port', 'Name', 'Type', 'Reversed', 'PID', 'Encoder', 'Encoder port', 'Drive side'],
    d.motors.map((m) => el('tr', { 'data-port': m.port }, el('th', { scope: 'row' }, m.port),
      el('td', {}, nameInput('Name of motor ' + m.port, 'motor.' + m.port + '.name', m.name)),
      el('td', {}, select('Type of motor ' + m.port, 'motor.' + m.port + '.type', m.type, m.choices.type, true)),
      el('td', {}, checkbox('Motor ' + m.port + ' reversed', 'motor.' + m.port + '.reversed', m.reversed)),
      el('td', {}, checkbox('Motor ' + m.port + ' PID control', 'motor.' + m.port + '.pidControl', m.pidControl)),
      el('td', {}, checkbox('Motor ' + m.port + ' encoder', 'motor.' + m.port + '.encoder', m.encoder)),
      el('td', {}, select('Encoder port of motor ' + m.port, 'motor.' + m.port + '.encoderPort', m.encoderPort, m.choices.encoderPort, true)),
      el('td', {}, select('Drive side of motor ' + m.port, 'motor.' + m.port + '.driveSide', m.driveSide, m.choices.driveSide, false))))),
  'Sensors': (d) => table(['Port', 'Name', 'Type', 'Mode'],
    d.sensors.map((s) => el('tr', { 'data-port': s.port }, el('th', { scope: 'row' }, s.port),
      el('td', {}, nameInput('Name of sensor ' + s.port, 'sensor.' + s.port + '.name', s.name)),
      el('td', {}, select('Type of sensor ' + s.port, 'sensor.' + s.port + '.type', s.type, s.choices.type, true)),
      el('td', {}, select('Mode of sensor ' + s.port, 'sensor.' + s.port + '.mode', s.mode, s.choices.mode, true))))),
  'Servos': (d) => table(['Port', 'Name', 'Type'],
    d.servos.map((s) => el('tr', { 'data-port': s.port }, el('th', { scope: 'row' }, s.port),
      el('td', {}, nameInput('Name of servo ' + s.port, 'servo.' + s.port + '.name', s.name)),
      el('td', {}, select('Type of servo ' + s.port, 'servo.' + s.port + '.type', s.type, s.choices.type, true))))),
  'Controllers/Hubs': (d) => d.hubs.length ? table(['Sensor port', 'Daisy chain'],
    d.hubs.map((h) => el('tr', {}, el('th', { scope: 'row' }, h.port), el('td', {}, h.chain.join(', ')))))
    : el('p', {}, 'No motor or servo controllers.'),
  'Drive train': (d) => {
    const rows = [el('tr', {}, el('th', { scope: 'row' }, 'Drive train'),
      el('td', {}, select('Drive train type', 'drive.type', d.driveTrain ? d.driveTrain.type : null, d.choices.driveTrain, true)))];
    (d.driveTrain ? d.driveTrain.motors : []).forEach((m, i) => rows.push(el('tr', {}, el('th', { scope: 'row' }, 'Motor ' + (i + 1)),
      el('td', {}, select('Drive train motor ' + (i + 1), 'drive.motor' + (i + 1), m, d.choices.motorPorts, true)))));
    rows.push(el('tr', {}, el('th', { scope: 'row' }, 'Joystick drive'),
      el('td', {}, select('Joystick drive', 'joystick.type', d.joystickDrive ? d.joystickDrive.type : null, d.choices.joystickDrive, true))));
    return table(['Setting', 'Value'], rows);
  },
  'Board and plug-ins': (d) => table(['Setting', 'Value'], [
    el('tr', {}, el('th', { scope: 'row' }, 'Board'), el('td', {}, d.choices.board.length
      ? select('Controller board', 'board', d.board.word, d.choices.board, false) : d.board.name)),
    el('tr', {}, el('th', { scope: 'row' }, 'CPU'), el('td', {}, (d.board.cpu || '-') + ' at ' + d.board.clockSpeed + ' Hz')),
    el('tr', {}, el('th', { scope: 'row' }, 'Plug-in boards'), el('td', {}, d.board.plugins.filter((p) => p).join(', ') || 'none'))]),
  'Serial ports': (d) => table(['Port', 'Use', 'Baud rate'], [
    ...d.uarts.map((u) => el('tr', {}, el('th', { scope: 'row' }, u.port || '-'),
      el('td', {}, select('Use of ' + u.port, 'uart.' + u.port + '.use', u.use, d.choices.uartUse, false)),
      el('td', {}, select('Baud rate of ' + u.port, 'uart.' + u.port + '.baud', u.baud, d.choices.baudRate, false)))),
    ...d.i2c.map((p) => el('tr', {}, el('th', { scope: 'row' }, p.port || '-'),
      el('td', {}, select('Use of ' + p.port, 'i2c.' + p.port + '.use', p.use, d.choices.i2cUse, false)), el('td', {}, '')))]),
  'Program and memory': (d) => table(['Setting', 'Value'], [
    el('tr', {}, el('th', { scope: 'row' }, 'Program type'),
      el('td', {}, select('Program type', 'programType', d.programType, d.choices.programType, false))),
    ...d.choices.firmware.map((f) => el('tr', {}, el('th', { scope: 'row' }, f),
      el('td', {}, checkbox('Firmware feature ' + f, 'firmware.' + f, d.firmware.includes(f))))),
    el('tr', {}, el('th', { scope: 'row' }, 'Memory sizes'), el('td', {}, d.memory.sizes.join(', ')))]),
  'Network': (d) => d.network ? table(['Network', 'Type', 'Number', 'Channel'], [el('tr', {},
    el('td', {}, d.network.name), el('td', {}, d.network.type || '-'), el('td', {}, d.network.number), el('td', {}, d.network.channel))])
    : el('p', {}, 'Not part of a network.'),
  'Models': (d) => el('p', {}, 'Standard model: ' + (d.standardModel || 'none') + '. User model: ' + (d.userModel || 'none') + '.'),
};

function showTab(name) {
  currentTab = name;
  for (const t of $('tabs').children) t.setAttribute('aria-selected', t.dataset.tab === name ? 'true' : 'false');
  for (const p of $('panels').children) p.hidden = p.dataset.tab !== name;
}

function render() {
  if (!state) return;
  const d = state.document;
  $('tabs').replaceChildren(...Object.keys(tabs).map((name, i) => el('button', { role: 'tab', type: 'button', 'data-tab': name,
    id: 'tab-' + i, 'aria-controls': 'panel-' + i, onclick: () => showTab(name),
    onkeydown: (e) => { const names = Object.keys(tabs); const k = names.indexOf(name);
      if (e.key === 'ArrowRight' || e.key === 'ArrowLeft') { const n = names[(k + (e.key === 'ArrowRight' ? 1 : names.length - 1)) % names.length];
        showTab(n); $('tab-' + names.indexOf(n)).focus(); } } }, name)));
  $('panels').replaceChildren(...Object.entries(tabs).map(([name, build], i) =>
    el('div', { role: 'tabpanel', id: 'panel-' + i, 'aria-labelledby': 'tab-' + i, 'data-tab': name }, build(d))));
  showTab(currentTab);
  $('block').replaceChildren(...state.diff.map((line) =>
    el('span', { class: line[0] === '+' ? 'add' : line[0] === '-' ? 'del' : '' }, line + '\n')));
  const findings = Array.isArray(state.findings) ? state.findings : (state.findings && state.findings.findings) || [];
  $('findings').replaceChildren(...(findings.length ? findings.map((f) => el('li', { class: f.severity, tabindex: 0,
    onclick: () => jumpTo(f), onkeydown: (e) => { if (e.key === 'Enter') jumpTo(f); } },
    'line ' + f.line + ': ' + f.message)) : [el('li', {}, 'No findings.')]));
  $('picture').innerHTML = state.picture;
  $('undo').disabled = state.edits === 0;
}

function jumpTo(finding) {
  for (const name of ['Motors', 'Sensors', 'Servos']) {
    const panel = [...$('panels').children].find((p) => p.dataset.tab === name);
    const row = [...panel.querySelectorAll('tr[data-port]')].find((r) => (finding.message || '').includes("'" + r.dataset.port + "'")
      || (finding.message || '').includes(' ' + r.dataset.port));
    if (row) { showTab(name); row.classList.add('focus'); const c = row.querySelector('select, input'); if (c) c.focus(); return; }
  }
}

async function load() {
  const r = await api('/api/load', { program: $('program').value });
  if (!r.ok) { say(r.data.error, true); return; }
  state = r.data; $('reload').hidden = true; say(state.editable ? 'loaded' : 'the file has rejected lines: fix them first', !state.editable); render();
}

$('program').addEventListener('change', load);
$('undo').addEventListener('click', async () => { const r = await api('/api/undo', { program: $('program').value });
  if (r.ok) { state = r.data; say('undone'); render(); } else say(r.data.error, true); });
$('save').addEventListener('click', async () => { const r = await api('/api/save', { program: $('program').value });
  if (r.ok) { say('saved'); await load(); say('saved'); }
  else { say(r.data.error, true); if (r.data.conflict) $('reload').hidden = false; } });
$('reload').addEventListener('click', load);

(async () => {
  const r = await api('/api/programs');
  if (!r.ok) { say(r.data.error || 'refused', true); return; }
  $('program').replaceChildren(...r.data.programs.map((p) => el('option', { value: p }, p)));
  if (r.data.programs.length) await load();
})();
)JS";
}

// The page: a photo, a look and brush strokes, previewed as the phone will
// render them. Every pixel comes from the library in the worker; this file
// only shows them and turns pointer events into the tool engine's touches.
import { TOOLS, STROKE_MODES } from './library.js';

const $ = (id) => document.getElementById(id);

// ---------------------------------------------------------------- worker

const worker = new Worker('worker.js', { type: 'module' });
const pending = new Map();
let nextId = 1;
let busy = 0;
let idleWaiters = [];
const workerReady = new Promise((resolve) => {
  worker.addEventListener('message', function first({ data }) {
    if (data.ready) {
      worker.removeEventListener('message', first);
      resolve();
    }
  });
});

worker.addEventListener('message', ({ data }) => {
  const request = pending.get(data.id);
  if (!request) return;
  if ('progress' in data) {
    request.onProgress?.(data.progress, data.stage);
    return;
  }
  pending.delete(data.id);
  if ('error' in data) request.reject(new Error(data.error));
  else request.resolve(data.reply);
  if (--busy === 0) settle();
});

function call(type, payload = {}, { transfer = [], onProgress } = {}) {
  const id = nextId++;
  busy++;
  return new Promise((resolve, reject) => {
    pending.set(id, { resolve, reject, onProgress });
    worker.postMessage({ id, type, ...payload }, transfer);
  });
}

// Work of the page's own that ends in worker calls (opening a photo) counts
// as busy from its first step.
let tasks = 0;
async function track(promise) {
  tasks++;
  try {
    return await promise;
  } finally {
    tasks--;
    settle();
  }
}

function settle() {
  if (busy > 0 || tasks > 0 || lookTimer !== null || lookRunning) return;
  const waiters = idleWaiters;
  idleWaiters = [];
  waiters.forEach((resolve) => resolve());
}

// ---------------------------------------------------------------- state

const page = {
  photo: null, // { width, height, name }
  preview: null, // { width, height }
  looks: [], // { name, file, text, item }
  lookIndex: -1,
  look: null, // the look applied, or null
  gestures: [],
  painting: false, // a brush session runs in the worker
  lastExport: null,
};

function lookSettings() {
  return {
    seed: Number($('seed').value),
    strength: Number($('strength').value),
    borders: $('borders').checked,
  };
}

function tool() {
  return TOOLS.find((t) => t.name === $('tool').value);
}

function hexColour(hex) {
  const v = parseInt(hex.slice(1), 16);
  return { r: (v >> 16) & 255, g: (v >> 8) & 255, b: v & 255, a: 255 };
}

// The brush edit as a script `vorlite paint` reads.
function scriptText(gestures = page.gestures) {
  const script = { tool: tool().name, strength: Number($('tool-strength').value) };
  if (tool().colour) script.color = hexColour($('colour').value);
  script.gestures = gestures;
  return JSON.stringify(script, null, 1)
    .replace(/\[\n\s*(-?[\d.]+),\n\s*(-?[\d.]+)\n\s*\]/g, '[$1, $2]');
}

// ---------------------------------------------------------------- drawing

function draw(canvas, rgba, width, height) {
  if (canvas.width !== width || canvas.height !== height) {
    canvas.width = width;
    canvas.height = height;
  }
  canvas.getContext('2d').putImageData(new ImageData(new Uint8ClampedArray(rgba.buffer), width, height), 0, 0);
}

function drawBox(box, rgba) {
  const [x, y, w, h] = box;
  $('after').getContext('2d').putImageData(new ImageData(new Uint8ClampedArray(rgba.buffer), w, h), x, y);
}

function notice(text, kind = 'error') {
  const el = $('notice');
  el.textContent = text;
  el.className = 'notice ' + kind;
  el.hidden = !text;
}

// ---------------------------------------------------------------- photos

// RGBA bytes of an image file as the tool reads them: upright by its EXIF
// orientation, its colour profile not applied, alpha not premultiplied.
async function decode(blob, name) {
  let bitmap;
  try {
    bitmap = await createImageBitmap(blob, {
      imageOrientation: 'from-image',
      colorSpaceConversion: 'none',
      premultiplyAlpha: 'none',
    });
  } catch {
    throw new Error(`${name} is not a photo this browser can read: open a PNG or JPEG file`);
  }
  const canvas = new OffscreenCanvas(bitmap.width, bitmap.height);
  const context = canvas.getContext('2d');
  context.drawImage(bitmap, 0, 0);
  const data = context.getImageData(0, 0, bitmap.width, bitmap.height).data;
  bitmap.close();
  return { rgba: new Uint8Array(data.buffer), width: canvas.width, height: canvas.height };
}

async function openPhoto(blob, name) {
  let photo;
  try {
    photo = await decode(blob, name);
  } catch (error) {
    notice(error.message);
    return false;
  }
  notice('');
  const reply = await call('open', photo, { transfer: [photo.rgba.buffer] });
  page.photo = { width: reply.photoWidth, height: reply.photoHeight, name };
  page.preview = { width: reply.width, height: reply.height };
  page.gestures = [];
  page.painting = false;
  draw($('before'), reply.rgba.slice(), reply.width, reply.height);
  draw($('after'), reply.rgba, reply.width, reply.height);
  $('drop').hidden = true;
  await applyLook();
  await renderThumbnails();
  return true;
}

function openUrl(url) {
  return track(fetch(url).then(async (response) => openPhoto(await response.blob(), url.split('/').pop())));
}

async function loadSamples() {
  const list = await (await fetch('photos/index.json')).json();
  for (const name of list) {
    const button = document.createElement('button');
    button.className = 'sample';
    button.title = name;
    const img = document.createElement('img');
    img.src = 'photos/' + name;
    img.alt = name;
    button.append(img);
    button.addEventListener('click', () => openUrl('photos/' + name));
    $('samples').append(button);
  }
  return list;
}

// ---------------------------------------------------------------- looks

async function loadLooks() {
  const list = await (await fetch('looks/index.json')).json();
  for (const file of list) {
    const text = await (await fetch('looks/' + file)).text();
    const item = document.createElement('button');
    item.className = 'look';
    const thumb = document.createElement('canvas');
    const label = document.createElement('span');
    label.textContent = file.replace(/\.json$/, '').replace(/-/g, ' ');
    item.append(thumb, label);
    const look = { name: label.textContent, file, text, item, thumb };
    item.addEventListener('click', () => chooseLook(page.looks.indexOf(look)));
    $('looks').append(item);
    page.looks.push(look);
  }
}

async function renderThumbnails() {
  for (const look of page.looks) {
    const reply = await call('thumbnail', { look: { text: look.text, ...lookSettings() } });
    draw(look.thumb, reply.rgba, reply.width, reply.height);
  }
}

function chooseLook(index) {
  page.lookIndex = index;
  page.looks.forEach((look, i) => look.item.classList.toggle('active', i === index));
  $('editor').value = index >= 0 ? page.looks[index].text : '';
  scheduleLook(0);
}

// A slider runs the look at once; while a run is under way, further
// changes wait for it and then run once, with the latest settings. Typing
// waits for a pause first.
let lookTimer = null;
let lookRunning = false;
let lookAgain = false;

async function runLook() {
  if (lookRunning) {
    lookAgain = true;
    return;
  }
  lookRunning = true;
  try {
    do {
      lookAgain = false;
      await applyLook();
    } while (lookAgain);
  } finally {
    lookRunning = false;
    settle();
  }
}

function scheduleLook(delay = 150) {
  if (lookTimer !== null) clearTimeout(lookTimer);
  lookTimer = null;
  if (delay === 0) {
    runLook();
    return;
  }
  lookTimer = setTimeout(() => {
    lookTimer = null;
    runLook();
  }, delay);
}

// The editor's document on the preview; a broken one shows its diagnostic
// and leaves the picture as it was.
async function applyLook() {
  if (!page.photo) return;
  const text = $('editor').value;
  const look = text.trim() === '' ? null : { text, ...lookSettings() };
  if (look) {
    const verdict = await call('check', look);
    $('diagnostic').textContent = verdict.ok ? 'runs: ' + verdict.message : verdict.message;
    $('diagnostic').classList.toggle('error', !verdict.ok);
    if (!verdict.ok) return;
  } else {
    $('diagnostic').textContent = '';
  }
  const reply = await call('look', { look, script: page.painting ? scriptText() : null });
  if (!reply.ok) {
    $('diagnostic').textContent = reply.message;
    $('diagnostic').classList.add('error');
    return;
  }
  page.look = look;
  draw($('after'), reply.rgba, page.preview.width, page.preview.height);
}

// ---------------------------------------------------------------- brushes

function photoPoint(event) {
  const rect = $('after').getBoundingClientRect();
  const clamp = (v, high) => Math.min(high, Math.max(0, v));
  return [
    clamp(Math.floor(((event.clientX - rect.left) / rect.width) * page.photo.width), page.photo.width - 1),
    clamp(Math.floor(((event.clientY - rect.top) / rect.height) * page.photo.height), page.photo.height - 1),
  ];
}

// The worker answers in order, so a session asked for here is there for
// every touch posted after it.
function ensureSession() {
  if (page.painting) return;
  page.painting = true;
  call('paintStart', { script: scriptText([]) }).then((reply) => {
    if (reply.ok) return;
    page.painting = false;
    notice(reply.message);
  });
}

// Replays the script after a change of tool settings or an undo.
async function restartSession() {
  if (page.gestures.length === 0) {
    page.painting = false;
    const reply = await call('paintEnd');
    draw($('after'), reply.rgba, page.preview.width, page.preview.height);
    return;
  }
  const reply = await call('paintStart', { script: scriptText() });
  if (!reply.ok) notice(reply.message);
  page.painting = reply.ok;
  draw($('after'), reply.rgba, page.preview.width, page.preview.height);
}

async function touch(point, last) {
  const reply = await call('touch', { x: point[0], y: point[1], last });
  if (reply.box) drawBox(reply.box, reply.rgba);
}

// A stroke is drawn a touch behind the pointer: a touch is known to be the
// last only when the pointer lifts, and the engine is told on that touch.
let gesture = null;

function pointerDown(event) {
  if ($('brush-panel').hidden || !page.photo || event.button !== 0) return;
  event.preventDefault();
  $('after').setPointerCapture(event.pointerId);
  const point = photoPoint(event);
  const kind = $('gesture').value;
  gesture = { kind, points: [point], start: point, drawn: 0 };
  if (kind === 'stroke') {
    const radius = Number($('radius').value);
    gesture.record = { type: 'stroke', radius, mode: $('mode').value, points: gesture.points };
    ensureSession();
    call('stroke', { radius, mode: STROKE_MODES[$('mode').value] });
  }
  showOutline(point, point);
}

function pointerMove(event) {
  if (!gesture) return;
  const point = photoPoint(event);
  const last = gesture.points[gesture.points.length - 1];
  if (gesture.kind !== 'stroke') {
    gesture.end = point;
    showOutline(gesture.start, point);
    return;
  }
  if (point[0] === last[0] && point[1] === last[1]) return;
  touch(last, false);
  gesture.points.push(point);
}

function pointerUp(event) {
  if (!gesture) return;
  const point = photoPoint(event);
  const done = gesture;
  gesture = null;
  hideOutline();
  if (done.kind === 'stroke') {
    const last = done.points[done.points.length - 1];
    if (point[0] !== last[0] || point[1] !== last[1]) {
      touch(last, false);
      done.points.push(point);
    }
    touch(done.points[done.points.length - 1], true);
    page.gestures.push(done.record);
    return;
  }
  const [cx, cy] = done.start;
  const dx = point[0] - cx;
  const dy = point[1] - cy;
  const length = Math.round(Math.hypot(dx, dy));
  const record =
    done.kind === 'radial'
      ? { type: 'radial', center: [cx, cy], radius: length }
      : { type: 'linear', center: [cx, cy], width: length, angle: Math.round((Math.atan2(dy, dx) * 180) / Math.PI) };
  page.gestures.push(record);
  ensureSession();
  const size = record.type === 'radial' ? record.radius : record.width;
  call('shape', { kind: record.type === 'radial' ? 1 : 2, x: cx, y: cy, size, angle: record.angle ?? 0 }).then((reply) =>
    draw($('after'), reply.rgba, page.preview.width, page.preview.height),
  );
}

// The shape being dragged, outlined over the picture.
function showOutline(from, to) {
  const outline = $('outline') ?? Object.assign(document.createElement('div'), { id: 'outline' });
  if (!outline.isConnected) $('frame').append(outline);
  const kind = gesture?.kind;
  if (kind === 'stroke' || !kind) {
    outline.hidden = true;
    return;
  }
  const rect = $('after').getBoundingClientRect();
  const scale = rect.width / page.photo.width;
  const length = Math.hypot(to[0] - from[0], to[1] - from[1]) * scale;
  outline.hidden = false;
  outline.className = kind;
  const x = from[0] * scale;
  const y = from[1] * scale;
  if (kind === 'radial') {
    Object.assign(outline.style, {
      left: `${x - length}px`, top: `${y - length}px`, width: `${2 * length}px`, height: `${2 * length}px`, transform: '',
    });
  } else {
    const angle = Math.atan2(to[1] - from[1], to[0] - from[0]);
    Object.assign(outline.style, {
      left: `${x}px`, top: `${y}px`, width: `${length}px`, height: '0px', transform: `rotate(${angle}rad)`,
    });
  }
}

function hideOutline() {
  const outline = $('outline');
  if (outline) outline.hidden = true;
}

function fillTools() {
  for (const t of TOOLS) {
    const option = document.createElement('option');
    option.value = t.name;
    option.textContent = t.label;
    $('tool').append(option);
  }
  syncToolControls();
}

function syncToolControls() {
  const t = tool();
  const gestureSelect = $('gesture');
  gestureSelect.querySelector('[value=stroke]').disabled = !t.strokes;
  gestureSelect.querySelector('[value=radial]').disabled = !t.shapes;
  gestureSelect.querySelector('[value=linear]').disabled = !t.shapes;
  if (gestureSelect.selectedOptions[0].disabled) gestureSelect.value = t.strokes ? 'stroke' : 'radial';
  $('mode').querySelector('[value=color-aware]').disabled = !t.colourAware;
  if ($('mode').selectedOptions[0].disabled) $('mode').value = 'apply';
  $('colour-row').hidden = !t.colour;
}

// ---------------------------------------------------------------- export

function download(blob, name) {
  const link = document.createElement('a');
  link.href = URL.createObjectURL(blob);
  link.download = name;
  document.body.append(link);
  link.click();
  link.remove();
  setTimeout(() => URL.revokeObjectURL(link.href), 10000);
}

function baseName() {
  return (page.photo?.name ?? 'photo').replace(/\.[^.]*$/, '');
}

// The full-resolution photo with the look and the brush edit, as `vorlite
// apply` and then `vorlite paint` make it.
async function exportPhoto(type) {
  if (!page.photo) return null;
  const bar = $('progress');
  bar.hidden = false;
  const onProgress = (fraction, stage) => {
    bar.firstElementChild.style.width = `${Math.round(fraction * 100)}%`;
    bar.lastElementChild.textContent = stage;
  };
  try {
    const reply = await call(
      'export',
      {
        look: page.look,
        script: page.gestures.length ? scriptText() : null,
        format: type,
        quality: 0.92,
      },
      { onProgress },
    );
    if (!reply.ok) {
      notice(reply.message);
      return null;
    }
    page.lastExport = reply;
    if (reply.blob) download(reply.blob, `${baseName()}-vorlite.${type === 'image/png' ? 'png' : 'jpg'}`);
    return reply;
  } finally {
    bar.hidden = true;
  }
}

// ---------------------------------------------------------------- wiring

function bindRange(id, format) {
  const input = $(id);
  const output = $(id + '-value');
  const show = () => (output.textContent = format(Number(input.value)));
  input.addEventListener('input', show);
  show();
}

function wire() {
  $('file').addEventListener('change', (e) => e.target.files[0] && track(openPhoto(e.target.files[0], e.target.files[0].name)));
  const frame = $('frame');
  frame.addEventListener('dragover', (e) => e.preventDefault());
  frame.addEventListener('drop', (e) => {
    e.preventDefault();
    const file = e.dataTransfer.files[0];
    if (file) track(openPhoto(file, file.name));
  });

  bindRange('seed', (v) => String(v));
  bindRange('strength', (v) => v.toFixed(2));
  bindRange('radius', (v) => String(v));
  bindRange('tool-strength', (v) => v.toFixed(2));
  for (const id of ['seed', 'strength']) $(id).addEventListener('input', () => scheduleLook(0));
  $('borders').addEventListener('change', () => scheduleLook(0));
  $('seed').addEventListener('change', renderThumbnails);
  $('strength').addEventListener('change', renderThumbnails);
  $('editor').addEventListener('input', () => {
    page.looks.forEach((look) => look.item.classList.toggle('active', look.text === $('editor').value));
    scheduleLook();
  });

  $('tab-look').addEventListener('click', () => showTab('look'));
  $('tab-brush').addEventListener('click', () => showTab('brush'));
  $('tool').addEventListener('change', () => {
    syncToolControls();
    page.gestures = [];
    page.painting = false;
    restartSession();
  });
  for (const id of ['tool-strength', 'colour']) $(id).addEventListener('change', restartSession);
  $('undo').addEventListener('click', () => {
    page.gestures.pop();
    restartSession();
  });
  $('clear').addEventListener('click', () => {
    page.gestures = [];
    restartSession();
  });

  const after = $('after');
  after.addEventListener('pointerdown', pointerDown);
  after.addEventListener('pointermove', pointerMove);
  after.addEventListener('pointerup', pointerUp);
  after.addEventListener('pointercancel', pointerUp);

  wireSplit();

  $('export-png').addEventListener('click', () => exportPhoto('image/png'));
  $('export-jpeg').addEventListener('click', () => exportPhoto('image/jpeg'));
  $('save-look').addEventListener('click', () => {
    const name = page.lookIndex >= 0 ? page.looks[page.lookIndex].file : 'look.json';
    download(new Blob([$('editor').value], { type: 'application/json' }), name);
  });
  $('save-script').addEventListener('click', () => {
    download(new Blob([scriptText() + '\n'], { type: 'application/json' }), `${baseName()}-brush.json`);
  });
}

function showTab(name) {
  $('tab-look').classList.toggle('active', name === 'look');
  $('tab-brush').classList.toggle('active', name === 'brush');
  $('look-panel').hidden = name !== 'look';
  $('brush-panel').hidden = name !== 'brush';
  $('frame').classList.toggle('painting', name === 'brush');
}

// The original shows left of the split, the edit right of it.
function wireSplit() {
  const split = $('split');
  const place = (fraction) => {
    const percent = Math.min(100, Math.max(0, fraction * 100));
    split.style.left = `${percent}%`;
    $('after').style.clipPath = `inset(0 0 0 ${percent}%)`;
  };
  place(0);
  split.addEventListener('pointerdown', (e) => {
    e.preventDefault();
    split.setPointerCapture(e.pointerId);
    const move = (m) => {
      const rect = $('frame').getBoundingClientRect();
      place((m.clientX - rect.left) / rect.width);
    };
    const up = () => {
      split.removeEventListener('pointermove', move);
      split.removeEventListener('pointerup', up);
    };
    split.addEventListener('pointermove', move);
    split.addEventListener('pointerup', up);
  });
}

// What the browser tests read: the page's own state, never a shortcut
// around it.
window.vorlitePage = {
  ready: null,
  idle: () => new Promise((resolve) => {
    idleWaiters.push(resolve);
    settle();
  }),
  script: () => scriptText(),
  exportPhoto,
  openUrl,
  get lastExport() {
    return page.lastExport && { hash: page.lastExport.hash, width: page.lastExport.width, height: page.lastExport.height };
  },
  get looks() {
    return page.looks.map((l) => l.file);
  },
  get preview() {
    return page.preview;
  },
};

// Whatever else goes wrong (the worker out of memory on a huge photo, a
// sample that will not load) is said on the page, not only in the console.
window.addEventListener('unhandledrejection', (event) => notice(String(event.reason?.message ?? event.reason)));
worker.addEventListener('error', (event) => notice(`the library's worker stopped: ${event.message ?? 'unknown error'}`));

window.vorlitePage.ready = (async () => {
  fillTools();
  wire();
  await workerReady;
  await loadLooks();
  const samples = await loadSamples();
  if (samples.length) await openUrl('photos/' + samples[0]);
})();

// The library runs here, off the page's thread, so that a long render never
// freezes the page. Every request carries an id; every reply echoes it.
import createVorlite from './module/vorlite.mjs';
import { Library, PREVIEW_BOX } from './library.js';

const library = new Library(await createVorlite());

const state = {
  photo: null, // { rgba, width, height }: the photo as opened
  preview: null, // the photo fitted inside the preview box
  base: null, // the preview with the look, on which the brush paints
  thumb: null, // a small copy for the looks' thumbnails
  look: null, // { text, seed, strength, borders } or null
  script: null, // the brush script so far, as text, or null
};

function fitted(image, box) {
  return library.preview(image.rgba, image.width, image.height, box);
}

function withLook(image, look) {
  if (!look) return { ok: true, message: '', rgba: image.rgba };
  return library.apply(look.text, image.rgba, image.width, image.height, look);
}

// The brush session restarted on the current base, replaying the script.
function restartPaint() {
  if (!state.script) return { ok: true, message: '' };
  const { base, photo } = state;
  return library.paintStart(state.script, base.rgba, base.width, base.height, photo.width, photo.height);
}

function shown() {
  const view = state.script ? library.paintShown() : null;
  return view ? view.slice() : state.base.rgba.slice();
}

async function sha256(bytes) {
  const digest = await crypto.subtle.digest('SHA-256', bytes);
  return Array.from(new Uint8Array(digest), (b) => b.toString(16).padStart(2, '0')).join('');
}

async function encode(image, type, quality) {
  const canvas = new OffscreenCanvas(image.width, image.height);
  const context = canvas.getContext('2d');
  context.putImageData(new ImageData(new Uint8ClampedArray(image.rgba.buffer), image.width, image.height), 0, 0);
  return canvas.convertToBlob({ type, quality });
}

const handlers = {
  open({ rgba, width, height }) {
    state.photo = { rgba: new Uint8Array(rgba), width, height };
    state.preview = fitted(state.photo, PREVIEW_BOX);
    state.thumb = fitted(state.photo, 160);
    state.base = state.preview;
    state.look = null;
    state.script = null;
    const p = state.preview;
    return { width: p.width, height: p.height, photoWidth: width, photoHeight: height, rgba: p.rgba.slice() };
  },

  check({ text, seed, strength, borders }) {
    return library.check(text, { seed, strength, borders });
  },

  // A look on the preview; the brush edit, if any, replayed on top.
  look({ look, script }) {
    const result = withLook(state.preview, look);
    if (!result.ok) return { ok: false, message: result.message };
    state.look = look;
    state.script = script;
    state.base = { rgba: result.rgba, width: state.preview.width, height: state.preview.height };
    const paint = restartPaint();
    return { ok: paint.ok, message: paint.ok ? result.message : paint.message, rgba: shown() };
  },

  thumbnail({ look }) {
    const result = withLook(state.thumb, look);
    return { ok: result.ok, rgba: result.rgba.slice(), width: state.thumb.width, height: state.thumb.height };
  },

  paintStart({ script }) {
    state.script = script;
    const result = restartPaint();
    if (!result.ok) state.script = null;
    return { ok: result.ok, message: result.message, rgba: shown() };
  },

  paintEnd() {
    state.script = null;
    return { rgba: shown() };
  },

  stroke({ radius, mode }) {
    library.paintStroke(radius, mode);
    return {};
  },

  // A touch: the box it re-rendered and that box's pixels.
  touch({ x, y, last }) {
    const box = library.paintTouch(x, y, last);
    if (!box) return { box: null };
    const { width, height } = state.base;
    const x0 = Math.max(0, box[0]);
    const y0 = Math.max(0, box[1]);
    const x1 = Math.min(width - 1, box[2]);
    const y1 = Math.min(height - 1, box[3]);
    if (x1 < x0 || y1 < y0) return { box: null };
    const view = library.paintShown();
    const w = x1 - x0 + 1;
    const h = y1 - y0 + 1;
    const rgba = new Uint8Array(w * h * 4);
    for (let y = 0; y < h; ++y) {
      const from = ((y0 + y) * width + x0) * 4;
      rgba.set(view.subarray(from, from + w * 4), y * w * 4);
    }
    return { box: [x0, y0, w, h], rgba };
  },

  shape({ kind, x, y, size, angle }) {
    library.paintShape(kind, x, y, size, angle);
    return { rgba: shown() };
  },

  // The full-resolution photo: the look, then the brush script replayed as
  // `vorlite paint` replays it; encoded when a type is given.
  async export({ look, script, format, quality }, progress) {
    const { photo } = state;
    progress(0.05, 'look');
    let rgba = photo.rgba;
    if (look) {
      const result = library.apply(look.text, rgba, photo.width, photo.height, look);
      if (!result.ok) return { ok: false, message: result.message };
      rgba = result.rgba;
    }
    progress(0.5, 'brush');
    if (script) {
      const result = library.paintRender(script, rgba, photo.width, photo.height, PREVIEW_BOX);
      if (!result.ok) return { ok: false, message: result.message };
      rgba = result.rgba;
    }
    progress(0.8, 'encoding');
    const image = { rgba: rgba === photo.rgba ? rgba.slice() : rgba, width: photo.width, height: photo.height };
    const hash = await sha256(image.rgba);
    const blob = format ? await encode(image, format, quality) : null;
    progress(1, 'done');
    return { ok: true, hash, blob, width: photo.width, height: photo.height };
  },
};

// Requests are answered one at a time, in order: a touch never overtakes
// the stroke it belongs to.
let queue = Promise.resolve();
self.onmessage = ({ data }) => {
  queue = queue.then(async () => {
    const progress = (fraction, stage) => self.postMessage({ id: data.id, progress: fraction, stage });
    try {
      const reply = await handlers[data.type](data, progress);
      const transfer = reply && reply.rgba && reply.rgba.buffer ? [reply.rgba.buffer] : [];
      self.postMessage({ id: data.id, reply }, transfer);
    } catch (error) {
      self.postMessage({ id: data.id, error: String(error && error.message ? error.message : error) });
    }
  });
};
self.postMessage({ ready: true });

// The WebAssembly module's entry points as JavaScript calls on RGBA byte
// arrays. Used by the page's worker, and by the tests and benchmarks under
// Node, so that all of them drive the library the same way.

export class Library {
  constructor(module) {
    this.m = module;
  }

  // A copy of `text` in the module's memory, as a C string; the caller frees it.
  #string(text) {
    const size = this.m.lengthBytesUTF8(text) + 1;
    const p = this.m._malloc(size);
    this.m.stringToUTF8(text, p, size);
    return p;
  }

  #message() {
    return this.m.UTF8ToString(this.m._vw_message());
  }

  // Pixels copied into the module's memory; the caller frees them.
  #pixels(rgba) {
    const p = this.m._malloc(rgba.length);
    if (p === 0) throw new Error('out of memory for a photo of ' + rgba.length + ' bytes');
    this.m.HEAPU8.set(rgba, p);
    return p;
  }

  #copyOut(p, length) {
    return this.m.HEAPU8.slice(p, p + length);
  }

  // { ok, message }: the processors it runs, or the one-line diagnostic.
  check(text, { seed = 0, strength = 1, borders = true } = {}) {
    const t = this.#string(text);
    try {
      const ok = this.m._vw_check(t, seed >>> 0, strength, borders ? 1 : 0) === 1;
      return { ok, message: this.#message() };
    } finally {
      this.m._free(t);
    }
  }

  // { ok, message, rgba }: the look run on a copy of the pixels; on failure
  // rgba is the input unchanged.
  apply(text, rgba, width, height, { seed = 0, strength = 1, borders = true } = {}) {
    const t = this.#string(text);
    const p = this.#pixels(rgba);
    try {
      const ok = this.m._vw_apply(t, p, width, height, seed >>> 0, strength, borders ? 1 : 0) === 1;
      return { ok, message: this.#message(), rgba: ok ? this.#copyOut(p, rgba.length) : rgba };
    } finally {
      this.m._free(p);
      this.m._free(t);
    }
  }

  // { rgba, width, height }: the photo fitted inside box x box, never enlarged.
  preview(rgba, width, height, box) {
    const p = this.#pixels(rgba);
    try {
      const out = this.m._vw_preview(p, width, height, box);
      const w = this.m._vw_result_width();
      const h = this.m._vw_result_height();
      return { rgba: this.#copyOut(out, w * h * 4), width: w, height: h };
    } finally {
      this.m._free(p);
    }
  }

  // Starts a brush session on a preview of a photo of photoWidth x
  // photoHeight, replaying the script's gestures so far; { ok, message }.
  paintStart(script, preview, previewWidth, previewHeight, photoWidth, photoHeight) {
    const t = this.#string(script);
    const p = this.#pixels(preview);
    try {
      const ok = this.m._vw_paint_start(t, p, previewWidth, previewHeight, photoWidth, photoHeight) === 1;
      this.shownBytes = previewWidth * previewHeight * 4;
      return { ok, message: this.#message() };
    } finally {
      this.m._free(p);
      this.m._free(t);
    }
  }

  // mode: 1 apply, 2 erase, 3 colour-aware.
  paintStroke(radius, mode) {
    this.m._vw_paint_stroke(radius, mode, 0, 255, 255, 255, 255);
  }

  // [x0, y0, x1, y1]: the preview box the touch re-rendered.
  paintTouch(x, y, last) {
    const p = this.m._vw_paint_touch(x, y, last ? 1 : 0);
    if (p === 0) return null;
    return Array.from(this.m.HEAP32.subarray(p >> 2, (p >> 2) + 4));
  }

  paintShape(kind, x, y, size, angle) {
    this.m._vw_paint_shape(kind, x, y, size, angle);
  }

  // The session's preview, as a view into the module's memory (valid until
  // the next call).
  paintShown() {
    const p = this.m._vw_paint_shown();
    return p === 0 ? null : this.m.HEAPU8.subarray(p, p + this.shownBytes);
  }

  // { ok, message, rgba }: the script replayed on the photo as `vorlite
  // paint` does, with a preview fitted inside box x box.
  paintRender(script, rgba, width, height, box = 1080) {
    const t = this.#string(script);
    const p = this.#pixels(rgba);
    try {
      const ok = this.m._vw_paint_render(t, p, width, height, box) === 1;
      return { ok, message: this.#message(), rgba: ok ? this.#copyOut(p, rgba.length) : rgba };
    } finally {
      this.m._free(p);
      this.m._free(t);
    }
  }
}

// The engine's tool kinds as a brush script names them: edited with
// strokes, with radial or linear shapes, or both.
export const TOOLS = [
  { name: 'desaturate-except', label: 'Colour except', strokes: true, shapes: true, colourAware: true },
  { name: 'blur', label: 'Blur', strokes: false, shapes: true },
  { name: 'blur-brush', label: 'Blur brush', strokes: true, shapes: true },
  { name: 'red-eye', label: 'Red eye', strokes: true, shapes: true },
  { name: 'whiten', label: 'Whiten', strokes: true, shapes: true },
  { name: 'darken', label: 'Darken', strokes: true, shapes: true },
  { name: 'tint-warm', label: 'Warm tint', strokes: false, shapes: true },
  { name: 'tint-amber', label: 'Amber tint', strokes: false, shapes: true },
  { name: 'tint-rose', label: 'Rose tint', strokes: false, shapes: true },
  { name: 'sharpen', label: 'Sharpen', strokes: false, shapes: true },
  { name: 'soften', label: 'Soften', strokes: false, shapes: true },
  { name: 'paint', label: 'Colour paint', strokes: true, shapes: false, colour: true },
];

export const STROKE_MODES = { apply: 1, erase: 2, 'color-aware': 3 };

// The preview's longest side, as on a phone.
export const PREVIEW_BOX = 1080;

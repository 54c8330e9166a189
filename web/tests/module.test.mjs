// The WebAssembly module under Node against the native tool: the same
// looks, checks and brush scripts give the same bytes and the same words.
import assert from 'node:assert/strict';
import { readFileSync, readdirSync } from 'node:fs';
import { join } from 'node:path';
import { before, describe, test } from 'node:test';

import { hash, loadLibrary, readPhoto, root, runTool, toolCheck } from './harness.mjs';

const looksDir = join(root, 'examples/effects');
const toolsDir = join(root, 'examples/tools');
const looks = readdirSync(looksDir).filter((n) => n.endsWith('.json')).sort();
const scripts = readdirSync(toolsDir).filter((n) => n.endsWith('.json')).sort();
const photoOf = (path) => readFileSync(path, 'utf8').match(/^\/\/ photo: (\S+)/m)[1];

let library;
before(async () => {
  library = await loadLibrary();
});

describe('looks', () => {
  // Two photos, a seed and strength other than the defaults, borders on and off.
  const runs = [
    { photo: 'chelsea.png', seed: 7, strength: 0.8, borders: true },
    { photo: 'coffee.png', seed: 123456, strength: 1, borders: false },
  ];
  for (const look of looks) {
    test(`${look} gives the native tool's bytes`, () => {
      const text = readFileSync(join(looksDir, look), 'utf8');
      for (const run of runs) {
        const photo = readPhoto(run.photo);
        const ours = library.apply(text, photo.rgba, photo.width, photo.height, run);
        assert.ok(ours.ok, ours.message);
        const args = ['apply', join(looksDir, look), join(root, 'build/photos', run.photo), '--seed', String(run.seed),
          '--strength', String(run.strength)];
        if (!run.borders) args.push('--no-borders');
        const native = runTool(args);
        assert.equal(hash(ours.rgba), hash(native.rgba), `${look} on ${run.photo}`);
      }
    });
  }
});

test('a broken document is refused with the words of vorlite check, the pixels untouched', async () => {
  const { writeFileSync, mkdtempSync } = await import('node:fs');
  const { tmpdir } = await import('node:os');
  const dir = mkdtempSync(join(tmpdir(), 'vorlite-check-'));
  const documents = [
    '{"identifier": "x", "processors": [{"name": "gamma", "parameters": {}}]}',
    '{"identifier": "x", "processors": [\n  {"name": "nope", "parameters": {}}\n]}',
    '{"identifier": "x", "processors": [1, 2',
    '[]',
    '',
  ];
  const photo = readPhoto('coffee.png');
  for (const [i, text] of documents.entries()) {
    const path = join(dir, `doc${i}.json`);
    writeFileSync(path, text);
    const verdict = library.check(text);
    assert.equal(verdict.ok, false, text);
    assert.equal(toolCheck(path), `vorlite: ${path}: ${verdict.message}`);
    const applied = library.apply(text, photo.rgba, photo.width, photo.height);
    assert.equal(applied.ok, false);
    assert.equal(hash(applied.rgba), hash(photo.rgba));
  }
});

describe('brush scripts', () => {
  for (const name of scripts) {
    const path = join(toolsDir, name);
    test(`${name} replays to the native tool's bytes, at full size and with a smaller preview`, () => {
      const script = readFileSync(path, 'utf8');
      const photo = readPhoto(photoOf(path));
      const ours = library.paintRender(script, photo.rgba, photo.width, photo.height);
      assert.ok(ours.ok, ours.message);
      const native = runTool(['paint', path, join(root, 'build/photos', photoOf(path))]);
      assert.equal(hash(ours.rgba), hash(native.rgba));
      const small = library.paintRender(script, photo.rgba, photo.width, photo.height, 240);
      const nativeSmall = runTool(['paint', path, join(root, 'build/photos', photoOf(path)), '--preview-size', '240x240']);
      assert.equal(hash(small.rgba), hash(nativeSmall.rgba));
    });
  }

  // Touches fed one at a time, as pointer events deliver them, end with the
  // preview a whole replay of the recorded script shows.
  test('touches fed one by one give the preview of the recorded replay', () => {
    for (const name of ['desaturate-except.json', 'paint.json', 'blur.json']) {
      const path = join(toolsDir, name);
      const parsed = JSON.parse(readFileSync(path, 'utf8').replace(/^\/\/.*$/gm, ''));
      const photo = readPhoto(photoOf(path));
      const preview = library.preview(photo.rgba, photo.width, photo.height, 300);
      const start = (gestures) => {
        const result = library.paintStart(JSON.stringify({ ...parsed, gestures }), preview.rgba, preview.width,
          preview.height, photo.width, photo.height);
        assert.ok(result.ok, result.message);
      };
      start(parsed.gestures);
      const replayed = hash(library.paintShown());
      start([]);
      for (const g of parsed.gestures) {
        if (g.type === 'stroke') {
          library.paintStroke(g.radius, { apply: 1, erase: 2, 'color-aware': 3 }[g.mode ?? 'apply']);
          g.points.forEach((p, i) => library.paintTouch(p[0], p[1], i + 1 === g.points.length));
        } else if (g.type === 'radial') {
          library.paintShape(1, g.center[0], g.center[1], g.radius, 0);
        } else {
          library.paintShape(2, g.center[0], g.center[1], g.width, g.angle ?? 0);
        }
      }
      assert.equal(hash(library.paintShown()), replayed, name);
    }
  });

  test('a wrong script is refused with its place and problem, the photo untouched', () => {
    const photo = readPhoto('coffee.png');
    const cases = [
      ['{"tool": "hammer", "gestures": []}', /^script: tool: unknown tool "hammer"/],
      ['{"tool": "blur", "gestures": [{"type": "stroke", "radius": 5, "points": [[1, 1]]}]}',
        /^script: gestures\[0\]: the blur tool is edited with radial or linear shapes$/],
      ['{"tool": "paint", "gestures": [{"type": "stroke", "radius": 5, "points": [[1, 9999]]}]}',
        /lies outside the 600 x 400 photo$/],
      ['{"tool": "paint", "gestures": [', /^script: line 1, column \d+: invalid JSON/],
    ];
    for (const [script, expected] of cases) {
      const result = library.paintRender(script, photo.rgba, photo.width, photo.height);
      assert.equal(result.ok, false);
      assert.match(result.message, expected);
      assert.equal(hash(result.rgba), hash(photo.rgba));
    }
  });
});

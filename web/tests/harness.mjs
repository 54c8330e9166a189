// What the page's tests share: the WebAssembly module loaded under Node,
// the native tool run on the same inputs, and hashes of RGBA bytes.
import { execFileSync } from 'node:child_process';
import { createHash } from 'node:crypto';
import { mkdtempSync, readFileSync, rmSync, writeFileSync } from 'node:fs';
import { createRequire } from 'node:module';
import { tmpdir } from 'node:os';
import { dirname, join, resolve } from 'node:path';
import { fileURLToPath } from 'node:url';

import { Library } from '../library.js';
import { decodePng } from './png.mjs';

export const root = resolve(dirname(fileURLToPath(import.meta.url)), '../..');
export const moduleDir = process.env.VORLITE_WEB_MODULE ?? join(root, 'build/web/web');
export const tool = process.env.VORLITE_TOOL ?? join(root, 'build/native/cli/vorlite');
export const photos = process.env.VORLITE_PHOTOS ?? join(root, 'build/photos');

// The module as the page's worker loads it. Its loader for Node expects a
// CommonJS scope, which an ES module lacks; the bytes are handed to it.
export async function loadLibrary() {
  globalThis.__dirname = moduleDir;
  globalThis.require = createRequire(import.meta.url);
  const { default: createVorlite } = await import(join(moduleDir, 'vorlite.mjs'));
  const module = await createVorlite({ wasmBinary: readFileSync(join(moduleDir, 'vorlite.wasm')) });
  return new Library(module);
}

export function hash(rgba) {
  return createHash('sha256').update(rgba).digest('hex');
}

// A sample photo's RGBA bytes; a JPEG as the native tool decodes it
// (through a document that leaves the pixels as they are).
export function readPhoto(name) {
  return readImage(join(photos, name));
}

export function readImage(path) {
  if (!/\.jpe?g$/i.test(path)) return decodePng(readFileSync(path));
  const dir = mkdtempSync(join(tmpdir(), 'vorlite-web-'));
  try {
    const document = join(dir, 'as-is.json');
    writeFileSync(document, '{"identifier": "as-is", "processors": [{"name": "original", "parameters": {}}]}');
    return runTool(['apply', document, path]);
  } finally {
    rmSync(dir, { recursive: true, force: true });
  }
}

// Runs the native tool with the arguments, an output PNG in a fresh folder
// appended; the decoded result.
export function runTool(args) {
  return runTools([args]);
}

// Runs the native tool several times, each on the previous one's output
// (written as a PNG where the next run's input is null); the last result.
export function runTools(runs) {
  const dir = mkdtempSync(join(tmpdir(), 'vorlite-web-'));
  try {
    let previous = null;
    runs.forEach((args, i) => {
      const out = join(dir, `out${i}.png`);
      const input = args[2] ?? previous;
      execFileSync(tool, [args[0], args[1], input, out, ...args.slice(3)], { stdio: ['ignore', 'ignore', 'pipe'] });
      previous = out;
    });
    return decodePng(readFileSync(previous));
  } finally {
    rmSync(dir, { recursive: true, force: true });
  }
}

// The native tool's one-line complaint about a document.
export function toolCheck(path) {
  try {
    execFileSync(tool, ['check', path], { stdio: ['ignore', 'pipe', 'pipe'] });
    return null;
  } catch (error) {
    return error.stderr.toString().trim();
  }
}

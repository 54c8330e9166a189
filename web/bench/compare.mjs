// The WebAssembly build under Node against the native build on the same
// work, alternating the two so that both see the same machine:
//   node web/bench/compare.mjs NATIVE_BENCH WASM_BENCH [ROUNDS]
// The photo is the coffee sample enlarged to 12 megapixels; the look is the
// first bundled one with exactly five processors.
import { execFileSync } from 'node:child_process';
import { mkdtempSync, readFileSync, readdirSync, rmSync, writeFileSync } from 'node:fs';
import { tmpdir } from 'node:os';
import { join } from 'node:path';

import { decodePng } from '../tests/png.mjs';
import { loadLibrary, root } from '../tests/harness.mjs';

const [nativeBench, wasmBench, roundsArg] = process.argv.slice(2);
const rounds = Number(roundsArg ?? 5);
const repetitions = 3;

const looksDir = join(root, 'examples/effects');
const look = readdirSync(looksDir)
  .filter((n) => n.endsWith('.json'))
  .sort()
  .find((n) => JSON.parse(readFileSync(join(looksDir, n), 'utf8').replace(/^\s*\/\/.*$/gm, '')).processors.length === 5);

const dir = mkdtempSync(join(tmpdir(), 'vorlite-web-bench-'));
try {
  const photo = decodePng(readFileSync(join(root, 'build/photos/coffee.png')));
  const raw = join(dir, 'coffee.rgba');
  writeFileSync(raw, photo.rgba);
  const args = [raw, String(photo.width), String(photo.height), join(looksDir, look), String(repetitions)];
  const runs = { native: [], wasm: [] };
  for (let r = 0; r < rounds; ++r) {
    runs.native.push(JSON.parse(execFileSync(nativeBench, args)));
    runs.wasm.push(JSON.parse(execFileSync('node', ['--no-experimental-fetch', wasmBench, ...args])));
  }
  const median = (values) => values.sort((a, b) => a - b)[Math.floor(values.length / 2)];
  const row = (key, label, unit) => {
    const n = median(runs.native.map((x) => x[key]));
    const w = median(runs.wasm.map((x) => x[key]));
    console.log(`| ${label} | ${n.toFixed(3)} ${unit} | ${w.toFixed(3)} ${unit} | ${(w / n).toFixed(2)} |`);
  };
  console.log(`Medians of ${rounds} alternating rounds of ${repetitions} repetitions each, one thread, node ${process.version}.\n`);
  console.log('| work | native | WebAssembly under Node | WebAssembly / native |');
  console.log('|---|---:|---:|---:|');
  row('look_ns_per_pixel', `look "${look}" (five processors), 12 MP`, 'ns/px');
  row('preview_box_ms', 'preview box after a stroke segment, radius 40, 1080 preview', 'ms');
  await lookLatency(photo);
} finally {
  rmSync(dir, { recursive: true, force: true });
}

// What the page waits for when a look or a slider changes: every bundled
// look on a 1080 x 720 preview in the module, as the worker runs it.
async function lookLatency(photo) {
  const library = await loadLibrary();
  const width = 1080;
  const height = 720;
  const preview = new Uint8Array(width * height * 4);
  for (let y = 0; y < height; ++y) {
    for (let x = 0; x < width; ++x) {
      const from = (Math.floor((y * photo.height) / height) * photo.width + Math.floor((x * photo.width) / width)) * 4;
      preview.set(photo.rgba.subarray(from, from + 4), (y * width + x) * 4);
    }
  }
  console.log('\nEach bundled look on a 1080 x 720 preview in the module (median of 5, ms):\n');
  console.log('| look | ms |');
  console.log('|---|---:|');
  for (const name of readdirSync(looksDir).filter((n) => n.endsWith('.json')).sort()) {
    const text = readFileSync(join(looksDir, name), 'utf8');
    const times = [];
    for (let r = 0; r < 5; ++r) {
      const start = performance.now();
      library.apply(text, preview, width, height, { seed: r });
      times.push(performance.now() - start);
    }
    times.sort((a, b) => a - b);
    console.log(`| ${name} | ${times[2].toFixed(1)} |`);
  }
}

// The page in headless Chromium, driven as a person would: clicks, sliders,
// typing and pointer strokes; its exports hold against the native tool's.
//   VORLITE_SCREENSHOTS=DIR  also save screenshots of a look and a stroke
import assert from 'node:assert/strict';
import { mkdtempSync, readFileSync, readdirSync, rmSync, writeFileSync } from 'node:fs';
import { tmpdir } from 'node:os';
import { join } from 'node:path';
import { after, before, describe, test } from 'node:test';

import puppeteer from 'puppeteer-core';

import { serve } from '../serve.mjs';
import { hash, moduleDir, photos, readImage, readPhoto, root, runTool, runTools, toolCheck } from './harness.mjs';

const chromium = process.env.CHROMIUM ?? '/usr/bin/chromium';
const screenshots = process.env.VORLITE_SCREENSHOTS;
const looksDir = join(root, 'examples/effects');
const looks = readdirSync(looksDir).filter((n) => n.endsWith('.json')).sort();
const photo = 'astronaut.png'; // the first sample: the page opens it
const seed = 5;
const strength = 0.9;

let server;
let browser;
let page;
let scratch;

const idle = () => page.evaluate(() => window.vorlitePage.idle());

async function setRange(id, value) {
  await page.$eval(`#${id}`, (el, v) => {
    el.value = String(v);
    el.dispatchEvent(new Event('input', { bubbles: true }));
    el.dispatchEvent(new Event('change', { bubbles: true }));
  }, value);
}

async function setEditor(text) {
  await page.$eval('#editor', (el, t) => {
    el.value = t;
    el.dispatchEvent(new Event('input', { bubbles: true }));
  }, text);
  await idle();
}

async function exportHash() {
  const result = await page.evaluate(async () => {
    await window.vorlitePage.exportPhoto(null);
    return window.vorlitePage.lastExport;
  });
  return result.hash;
}

const canvasHash = () =>
  page.$eval('#after', (canvas) => {
    const data = canvas.getContext('2d').getImageData(0, 0, canvas.width, canvas.height).data;
    return crypto.subtle.digest('SHA-256', data).then((d) =>
      Array.from(new Uint8Array(d), (b) => b.toString(16).padStart(2, '0')).join(''));
  });

// The pointer at the centre of a photo pixel.
async function pointerAt([x, y]) {
  const box = await page.$eval('#after', (c) => {
    const r = c.getBoundingClientRect();
    return { left: r.left, top: r.top, scale: r.width / c.width };
  });
  return { x: box.left + (x + 0.5) * box.scale, y: box.top + (y + 0.5) * box.scale };
}

async function stroke(points) {
  let at = await pointerAt(points[0]);
  await page.mouse.move(at.x, at.y);
  await page.mouse.down();
  for (const p of points.slice(1)) {
    at = await pointerAt(p);
    await page.mouse.move(at.x, at.y);
  }
  await page.mouse.up();
  await idle();
}

before(async () => {
  scratch = mkdtempSync(join(tmpdir(), 'vorlite-page-'));
  ({ server } = await serve({ port: 0, module: moduleDir, photos }));
  browser = await puppeteer.launch({
    executablePath: chromium,
    headless: true,
    args: ['--no-sandbox', '--disable-gpu', '--disable-quic', '--no-first-run', '--disable-background-networking',
      '--disable-component-update', '--disable-sync', `--user-data-dir=${join(scratch, 'profile')}`],
  });
  page = await browser.newPage();
  const errors = [];
  page.on('pageerror', (e) => errors.push(e.message));
  await page.setViewport({ width: 1400, height: 860 });
  await page.goto(`http://127.0.0.1:${server.address().port}/`);
  await page.evaluate(() => window.vorlitePage.ready);
  await idle();
  assert.deepEqual(errors, []);
});

after(async () => {
  await browser?.close();
  server?.close();
  rmSync(scratch, { recursive: true, force: true });
});

describe('looks', () => {
  test('every bundled look, chosen from the list, exports the native tool\'s bytes', async () => {
    assert.deepEqual(await page.evaluate(() => window.vorlitePage.looks), looks);
    await setRange('seed', seed);
    await setRange('strength', strength);
    for (const [i, look] of looks.entries()) {
      await page.click(`.look:nth-child(${i + 1})`);
      await idle();
      const diagnostic = await page.$eval('#diagnostic', (el) => el.textContent);
      assert.match(diagnostic, /^runs: /, look);
      const native = runTool(['apply', join(looksDir, look), join(photos, photo), '--seed', String(seed),
        '--strength', String(strength)]);
      assert.equal(await exportHash(), hash(native.rgba), look);
      if (screenshots && look === 'cream-print.json') await page.screenshot({ path: join(screenshots, 'web-look.jpg'), quality: 85 });
    }
  });

  test('a broken document shows the diagnostic of vorlite check and changes nothing', async () => {
    const shown = await canvasHash();
    const broken = '{"identifier": "x",\n "processors": [{"name": "gamma", "parameters": {"gamma": "high"}}';
    const path = join(scratch, 'broken.json');
    for (const text of [broken, '{"identifier": "x", "processors": [{"name": "gamma", "parameters": {}}]}']) {
      writeFileSync(path, text);
      await setEditor(text);
      const diagnostic = await page.$eval('#diagnostic', (el) => el.textContent);
      assert.equal(`vorlite: ${path}: ${diagnostic}`, toolCheck(path));
      assert.equal(await canvasHash(), shown);
    }
  });
});

describe('brushes', () => {
  test('strokes painted with the pointer export what vorlite paint makes of the page\'s script', async () => {
    const example = join(root, 'examples/tools/red-eye.json');
    const recorded = JSON.parse(readFileSync(example, 'utf8').replace(/^\/\/.*$/gm, ''));
    await setEditor('');
    await page.click('#tab-brush');
    await page.select('#tool', 'red-eye');
    await idle();
    for (const g of recorded.gestures) {
      await setRange('radius', g.radius);
      await stroke(g.points);
    }
    const script = await page.evaluate(() => window.vorlitePage.script());
    const painted = JSON.parse(script);
    assert.deepEqual(
      painted.gestures.map((g) => ({ radius: g.radius, points: g.points })),
      recorded.gestures.map((g) => ({ radius: g.radius, points: g.points })),
    );
    const path = join(scratch, 'script.json');
    writeFileSync(path, script);
    assert.equal(await exportHash(), hash(runTool(['paint', path, join(photos, photo)]).rgba));
  });

  test('a look, then a radial shape and a stroke, undo of the stroke: vorlite apply then paint', async () => {
    const look = join(looksDir, 'golden-hour.json');
    await page.click('#clear');
    await page.select('#tool', 'desaturate-except');
    await page.select('#gesture', 'radial');
    await setEditor(readFileSync(look, 'utf8'));
    const centre = [300, 200];
    let at = await pointerAt(centre);
    await page.mouse.move(at.x, at.y);
    await page.mouse.down();
    at = await pointerAt([centre[0] + 90, centre[1]]);
    await page.mouse.move(at.x, at.y, { steps: 4 });
    await page.mouse.up();
    await idle();
    await page.select('#gesture', 'stroke');
    await setRange('radius', 30);
    await stroke([[60, 400], [120, 420], [180, 430], [240, 420]]);
    if (screenshots) await page.screenshot({ path: join(screenshots, 'web-brush.jpg'), quality: 85 });
    await page.click('#undo');
    await idle();
    const script = JSON.parse(await page.evaluate(() => window.vorlitePage.script()));
    assert.deepEqual(script.gestures, [{ type: 'radial', center: centre, radius: 90 }]);
    const path = join(scratch, 'shape.json');
    writeFileSync(path, JSON.stringify(script));
    const native = runTools([
      ['apply', look, join(photos, photo), '--seed', String(seed), '--strength', String(strength)],
      ['paint', path, null],
    ]);
    assert.equal(await exportHash(), hash(native.rgba));
  });
});

test('a JPEG sample opens with the pixels the native tool decodes', async () => {
  await setEditor('');
  await page.click('#clear');
  await page.click('.sample[title="rocket.jpg"]');
  await idle();
  assert.deepEqual(await page.evaluate(() => window.vorlitePage.preview), { width: 640, height: 427 });
  assert.equal(await exportHash(), hash(readPhoto('rocket.jpg').rgba));
});

// The JPEG with an EXIF segment that says how to turn it upright.
function withOrientation(jpeg, orientation) {
  const tiff = [0x4d, 0x4d, 0, 0x2a, 0, 0, 0, 8, 0, 1, 0x01, 0x12, 0, 3, 0, 0, 0, 1, 0, orientation, 0, 0, 0, 0, 0, 0];
  const body = Buffer.concat([Buffer.from('Exif\0\0', 'latin1'), Buffer.from(tiff)]);
  const marker = Buffer.from([0xff, 0xe1, (body.length + 2) >> 8, (body.length + 2) & 255]);
  return Buffer.concat([jpeg.subarray(0, 2), marker, body, jpeg.subarray(2)]);
}

test('a photo taken on its side is turned upright by its EXIF orientation, as the tool does', async () => {
  const path = join(scratch, 'sideways.jpg');
  writeFileSync(path, withOrientation(readFileSync(join(photos, 'rocket.jpg')), 6));
  const input = await page.$('#file');
  await input.uploadFile(path);
  await idle();
  assert.deepEqual(await page.evaluate(() => window.vorlitePage.preview), { width: 427, height: 640 });
  assert.equal(await exportHash(), hash(readImage(path).rgba));
});

test('a file that is not an image gives a clear message and keeps the photo', async () => {
  const shown = await canvasHash();
  const path = join(scratch, 'notes.png');
  writeFileSync(path, 'these are words, not pixels');
  const input = await page.$('#file');
  await input.uploadFile(path);
  await page.waitForFunction(() => !document.getElementById('notice').hidden);
  const message = await page.$eval('#notice', (el) => el.textContent);
  assert.equal(message, 'notes.png is not a photo this browser can read: open a PNG or JPEG file');
  assert.equal(await canvasHash(), shown);
});

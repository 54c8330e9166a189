// Serves the page on localhost: the page's own files, the WebAssembly
// module from the build, the bundled looks and the sample photos, each
// folder listed as index.json for the page to find them.
//   node web/serve.mjs [--port N] [--module DIR] [--photos DIR]
import { createServer } from 'node:http';
import { readFile, readdir } from 'node:fs/promises';
import { dirname, extname, join, normalize, resolve, sep } from 'node:path';
import { fileURLToPath } from 'node:url';

const here = dirname(fileURLToPath(import.meta.url));
const root = resolve(here, '..');

const TYPES = {
  '.html': 'text/html; charset=utf-8',
  '.js': 'text/javascript; charset=utf-8',
  '.mjs': 'text/javascript; charset=utf-8',
  '.css': 'text/css; charset=utf-8',
  '.json': 'application/json; charset=utf-8',
  '.wasm': 'application/wasm',
  '.png': 'image/png',
  '.jpg': 'image/jpeg',
  '.jpeg': 'image/jpeg',
};

// The folders behind the page's URL prefixes, and the files a listing shows.
export function routes({ module = join(root, 'build/web/web'), photos = join(root, 'build/photos') } = {}) {
  return [
    { prefix: '/module/', dir: module },
    { prefix: '/looks/', dir: join(root, 'examples/effects'), list: /\.json$/ },
    { prefix: '/tools/', dir: join(root, 'examples/tools'), list: /\.json$/ },
    { prefix: '/photos/', dir: photos, list: /\.(png|jpe?g)$/i },
    { prefix: '/', dir: here },
  ];
}

async function answer(table, url) {
  const path = decodeURIComponent(new URL(url, 'http://localhost').pathname);
  const route = table.find((r) => path.startsWith(r.prefix));
  const rest = path.slice(route.prefix.length) || 'index.html';
  if (rest === 'index.json' && route.list) {
    const names = (await readdir(route.dir)).filter((n) => route.list.test(n)).sort();
    return { status: 200, type: TYPES['.json'], body: JSON.stringify(names) };
  }
  const file = normalize(join(route.dir, rest));
  if (file !== route.dir && !file.startsWith(route.dir + sep)) return { status: 403, type: 'text/plain', body: 'forbidden' };
  try {
    return { status: 200, type: TYPES[extname(file)] ?? 'application/octet-stream', body: await readFile(file) };
  } catch {
    return { status: 404, type: 'text/plain', body: 'not found' };
  }
}

// Starts the server on 127.0.0.1; resolves to { server, url }.
export function serve({ port = 8080, ...folders } = {}) {
  const table = routes(folders);
  const server = createServer(async (request, response) => {
    const { status, type, body } = await answer(table, request.url);
    response.writeHead(status, { 'Content-Type': type, 'Cache-Control': 'no-cache' });
    response.end(body);
  });
  return new Promise((resolveServer, reject) => {
    server.once('error', reject);
    server.listen(port, '127.0.0.1', () => {
      resolveServer({ server, url: `http://127.0.0.1:${server.address().port}/` });
    });
  });
}

if (process.argv[1] === fileURLToPath(import.meta.url)) {
  const args = process.argv.slice(2);
  const option = (name) => {
    const i = args.indexOf(name);
    return i >= 0 ? args[i + 1] : undefined;
  };
  const { url } = await serve({
    port: Number(option('--port') ?? 8080),
    module: option('--module') && resolve(option('--module')),
    photos: option('--photos') && resolve(option('--photos')),
  });
  console.log(`vorlite page at ${url} (Ctrl-C stops)`);
}

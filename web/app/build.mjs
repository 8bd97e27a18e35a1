// Bundles the application into a folder, whose index.html is all of it; the other files make it
// installable: node build.mjs MODULES MODULE OUTPUT. MODULES is the node_modules folder of the page's
// packages, MODULE the folder of module.mjs and module.wasm.

import { copyFileSync, mkdirSync, readFileSync, writeFileSync } from 'node:fs';
import { dirname, join, resolve } from 'node:path';
import { fileURLToPath } from 'node:url';
import { bundler, filled, scriptOf } from '../../sheets/write/page/bundle.mjs';

const here = dirname(fileURLToPath(import.meta.url));
const [modules, module, output] = process.argv.slice(2).map((path) => resolve(path));
const bundle = bundler(modules);

const header = readFileSync(join(here, '../../include/vantrel.h'), 'utf8');
const enumerators = (ending) =>
  JSON.stringify([...header.matchAll(new RegExp(`^    (\\w+_${ending}) = \\d+,`, 'gm'))]
    .map(([, name]) => name));

const [worker] = bundle(join(here, 'worker.js'), { format: 'iife', loader: { '.wasm': 'binary' },
  alias: { 'module.mjs': join(module, 'module.mjs'), 'module.wasm': join(module, 'module.wasm') },
  define: { 'import.meta.url': '""' } }).outputFiles;
const { script, hash } = scriptOf(bundle, modules, join(here, 'app.js'), { define: {
  WORKER: JSON.stringify(worker.text),
  ILLUMINANTS: enumerators('\\d+DEG'),
  STATUSES: enumerators('STATUS'),
} });
mkdirSync(output, { recursive: true });
writeFileSync(join(output, 'index.html'), filled(join(here, 'app.html'), {
  policy: `default-src 'none'; script-src 'sha256-${hash}' 'wasm-unsafe-eval'; worker-src blob: 'self'; ` +
    "style-src 'unsafe-inline'; img-src 'self'; manifest-src 'self'; base-uri 'none'; form-action 'none'",
  style: bundle(join(here, 'app.css')).outputFiles[0].text.trim(),
  script,
}));
for (const name of ['LICENSE', 'THIRD-PARTY.txt']) // of what is compiled into the module
  copyFileSync(join(here, '../..', name), join(output, name));
for (const name of ['manifest.webmanifest', 'icon.svg', 'service_worker.js'])
  copyFileSync(join(here, name), join(output, name));

// What the page of the program and the application have in common: bundles of modules and of the npm
// packages that `npm ci` put into a folder node_modules, with the licences of what is in them.

import { createHash } from 'node:crypto';
import { readFileSync, readdirSync } from 'node:fs';
import { createRequire } from 'node:module';
import { join, relative, resolve, sep } from 'node:path';

export function bundler(modules) {
  const esbuild = createRequire(join(modules, 'any.js'))('esbuild');
  return (entry, options) => esbuild.buildSync({
    entryPoints: [entry],
    bundle: true,
    minify: true,
    write: false,
    nodePaths: [modules],
    target: ['chrome111', 'firefox115', 'safari16'],
    ...options,
  });
}

// The licences of what is in the bundle, each text once, after the packages that it covers.
function licences(modules, inputs) {
  const packages = new Set();
  for (const input of inputs) {
    const path = relative(modules, resolve(input)).split(sep);
    if (path[0] !== '..')
      packages.add(path.slice(0, path[0].startsWith('@') ? 2 : 1).join('/'));
  }
  const covered = new Map();
  for (const name of [...packages].sort()) {
    const file = readdirSync(join(modules, name)).find((entry) => /^licen[cs]e/i.test(entry));
    if (!file) throw new Error(`${name} comes without a licence`);
    const text = readFileSync(join(modules, name, file), 'utf8').trim().replaceAll('*/', '* /');
    covered.set(text, [...(covered.get(text) ?? []), name]);
  }
  return [...covered].map(([text, names]) => `${names.join(', ')}\n\n${text}`).join('\n\n\n');
}

// A script that may stand in a page, with the hash by which the page's policy lets it run.
export function scriptOf(bundle, modules, entry, options = {}) {
  const built = bundle(entry, { metafile: true, format: 'iife', legalComments: 'none', ...options });
  const notice = licences(modules, Object.keys(built.metafile.inputs));
  const code = `/*! This page contains:\n\n${notice}\n*/\n${built.outputFiles[0].text}`;
  const script = code.replaceAll('</script', '<\\/script').replaceAll('<!--', '<\\!--');
  return { script, hash: createHash('sha256').update(script).digest('base64') };
}

// The HTML with each @name@ replaced by its part.
export const filled = (file, parts) => readFileSync(file, 'utf8')
  .replace(/@(\w+)@/g, (whole, name) => parts[name] ?? whole);

// Bundles the page and writes it as a C++ source file: node build.mjs MODULES OUTPUT.
// MODULES is the node_modules folder that `npm ci` filled.

import { createHash } from 'node:crypto';
import { readFileSync, readdirSync, writeFileSync } from 'node:fs';
import { createRequire } from 'node:module';
import { dirname, join, relative, resolve, sep } from 'node:path';
import { fileURLToPath } from 'node:url';

const here = dirname(fileURLToPath(import.meta.url));
const [modules, output] = process.argv.slice(2).map((path) => resolve(path));
const esbuild = createRequire(join(modules, 'any.js'))('esbuild');

const bundle = (entry, options) =>
  esbuild.buildSync({
    entryPoints: [join(here, entry)],
    bundle: true,
    minify: true,
    write: false,
    nodePaths: [modules],
    target: ['chrome111', 'firefox115', 'safari16'],
    ...options,
  });

// The licences of what is in the bundle, each text once, after the packages that it covers.
function licences(inputs) {
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

const built = bundle('main.js', { metafile: true, format: 'iife', legalComments: 'none' });
const notice = licences(Object.keys(built.metafile.inputs));
const code = `/*! This page contains:\n\n${notice}\n*/\n${built.outputFiles[0].text}`;
const script = code.replaceAll('</script', '<\\/script').replaceAll('<!--', '<\\!--');
const hash = createHash('sha256').update(script).digest('base64');

const parts = {
  policy: `default-src 'none'; script-src 'sha256-${hash}'; style-src 'unsafe-inline'; ` +
    "base-uri 'none'; form-action 'none'",
  style: bundle('style.css').outputFiles[0].text.trim(),
  script,
};
const page = readFileSync(join(here, 'page.html'), 'utf8')
  .replace(/@(policy|style|script)@/g, (_, name) => parts[name]);
const [before, after] = page.split('@data@');

// Compilers need not take literals beyond 65,536 bytes.
const literals = (text) =>
  text.match(/[^]{1,15000}/gu).map((piece) => `    R"__page(${piece})__page",\n`).join('');

writeFileSync(output, `// The page, as build.mjs made it.
#include "write/page/page.h"

namespace vantrel::sheets {
namespace {
constexpr std::string_view before[] = {
${literals(before)}};
constexpr std::string_view after[] = {
${literals(after)}};
} // namespace

const std::span<const std::string_view> page_before_data = before;
const std::span<const std::string_view> page_after_data = after;
} // namespace vantrel::sheets
`);

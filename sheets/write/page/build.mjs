// Bundles the page and writes it as a C++ source file: node build.mjs MODULES OUTPUT.
// MODULES is the node_modules folder that `npm ci` filled.

import { writeFileSync } from 'node:fs';
import { dirname, join, resolve } from 'node:path';
import { fileURLToPath } from 'node:url';
import { bundler, filled, scriptOf } from './bundle.mjs';

const here = dirname(fileURLToPath(import.meta.url));
const [modules, output] = process.argv.slice(2).map((path) => resolve(path));
const bundle = bundler(modules);
const { script, hash } = scriptOf(bundle, modules, join(here, 'main.js'));

const parts = {
  policy: `default-src 'none'; script-src 'sha256-${hash}'; style-src 'unsafe-inline'; ` +
    "base-uri 'none'; form-action 'none'",
  style: bundle(join(here, 'style.css')).outputFiles[0].text.trim(),
  script,
};
const page = filled(join(here, 'page.html'), parts);
const [before, after] = page.split('@data@');

// Compilers need not take literals beyond 65,536 bytes.
const literals = (text) =>
  text.match(/[^]{1,15000}/gu).map((piece) => `    R"__page(${piece})__page"sv,\n`).join('');

writeFileSync(output, `// The page, as build.mjs made it.
#include "write/page/page.h"

namespace vantrel::sheets {
namespace {
using namespace std::string_view_literals; // which know their length without counting
constexpr std::string_view before[] = {
${literals(before)}};
constexpr std::string_view after[] = {
${literals(after)}};
} // namespace

const std::span<const std::string_view> page_before_data = before;
const std::span<const std::string_view> page_after_data = after;
} // namespace vantrel::sheets
`);

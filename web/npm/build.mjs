// Makes the folder of the npm package: node build.mjs MODULE OUTPUT. MODULE is the folder of module.mjs
// and module.wasm. The functions come from include/vantrel.h, the sizes of their arrays from the table
// of tests/library/functions.cpp.

import { copyFileSync, mkdirSync, readFileSync, writeFileSync } from 'node:fs';
import { dirname, join, resolve } from 'node:path';
import { fileURLToPath } from 'node:url';

const here = dirname(fileURLToPath(import.meta.url));
const root = join(here, '../..');
const [module, output] = process.argv.slice(2).map((path) => resolve(path));
const read = (path) => readFileSync(join(root, path), 'utf8');
const header = read('include/vantrel.h');

// Symbols by function; that of Saunderson(), which has C++ linkage, is _Z10Saundersonddd.
const symbols = new Map(read('src/exports.txt').split('\n').map((symbol) => {
  const [, length, rest] = /^_Z(\d+)(.*)/.exec(symbol) ?? [];
  return [length ? rest.slice(0, Number(length)) : symbol, symbol];
}));
const sizes = new Map([...read('tests/library/functions.cpp')
  .matchAll(/\{"(\w+)", call\(\1\),\s*"([^"]*)"\}/g)].map(([, name, sizes]) => [name, sizes.split(' ')]));

// XYZtoRGB: the names of the field stay, the first becomes small.
const camel = (name) => name.replace(/^(XYZ|CIELCh|CIELCH|CIELab|CIEYxy|CCR|[A-Z][a-z]+|[A-Z]+)/, (first) =>
  (/^(CIE)./.test(first) ? `cie${first.slice(3)}` : first === 'XYZ' ? 'xyz'
    : first[0].toLowerCase() + first.slice(1)));

const text = (comment) => comment.replace(/^\s*\*? ?/gm, '').replace(/\\([*])/g, '$1')
  .replace(/\*\//g, '').trim();
const reasonIn = (comment) => /@return (?:1; 0|true; false) ((?:.|\n)*?)(\.\s|\.$|$)/.exec(comment)?.[1]
  .replace(/\s+/g, ' ') ?? 'refused';

const TYPES = { CIELABCOORD: 'double', CIELCHCOORD: 'double', DENSITYSTRUCT: 'double',
  POLWEIGHTSTRUCT: 'double', 'unsigned int': 'unsigned' };
const VALUES = { k: 'Illuminant | Illuminant[]', s: 'Status | Status[]', r: 'Response | Response[]', d: 'Numbers',
  i: 'Numbers | Response | Response[]' };
const ENDINGS = { k: 'DEG', s: '_STATUS', r: '_RESPONSE', d: '', i: '_RESPONSE' };

const functions = [];
for (const [, comment, returns, name, list] of header.matchAll(
  /\/\*\*((?:(?!\*\/)[^])*)\*\/\s*VANTREL_API (\w+) (\w+)\(([^)]*)\);/g)) {
  if (!symbols.has(name) || !sizes.has(name)) continue;
  const declared = list === 'void' ? [] : list.split(',').map((one) => one.trim());
  const tokens = sizes.get(name).filter(Boolean);
  if (tokens.length !== declared.length) throw new Error(`${name}: ${list} against ${tokens}`);
  const args = declared.map((declaration, i) => {
    const [, type, star, own] = /^(?:const )?(\w+(?: int)?)\s*([*&]?)\s*(\w+)$/.exec(declaration);
    const [, out, core, mark] = /^(>?)(\w+)([?!]?)/.exec(tokens[i]);
    if (!star) return { name: own, kind: 'number', value: VALUES[core], ending: ENDINGS[core], whole: core !== 'd' };
    const kind = out ? 'output' : type === 'POLWEIGHTSTRUCT' ? 'weights' : 'array';
    return { name: own, kind, count: Number(core), type: TYPES[type] ?? type,
      ...(mark === '?' && !out ? { nullable: true } : {}) };
  });
  functions.push({ name, js: camel(name), args, comment: text(comment),
    succeeds: /@return (1|true);/.test(comment), reason: reasonIn(text(comment)) });
}

const constants = Object.fromEntries([...header.matchAll(/^    ([A-Z]\w+) = (-?\d+),?/gm)]
  .map(([, name, value]) => [name, Number(value)]));

// Where argument k of row i stands, or its number.
const passed = ({ kind }, k) => (kind === 'number' ? `at[${k}].values ? at[${k}].values[i] : at[${k}].begin`
  : `at[${k}].begin + i * at[${k}].step`);
const rowOf = ({ name, js, args, succeeds, reason }) => `  { name: '${name}', symbol: '_${symbols.get(name)}', js: '${js}', succeeds: ${
  succeeds}, reason: ${JSON.stringify(reason)},\n    args: ${
  JSON.stringify(args.map(({ value, ...rest }) => rest))},\n    call: (f, at, i) => f(${args.map(passed).join(', ')}) },`;

const typeOf = (argument) => (argument.kind === 'number' ? argument.value
  : argument.nullable ? 'Rows | null' : 'Rows');
const resultType = ({ type, count }) => (type === 'wchar_t' ? 'string | string[]'
  : count === 1 ? 'number | Float64Array' : 'Float64Array');
function declarationOf({ js, args, comment }) {
  const inputs = args.filter(({ kind }) => kind !== 'output');
  const outputs = args.filter(({ kind }) => kind === 'output');
  const last = inputs.findLastIndex(({ nullable }) => !nullable);
  const parameters = inputs.map((argument, i) => `${argument.name}${i > last ? '?' : ''}: ${typeOf(argument)}`);
  const result = inputs.length === 0 ? 'number' : outputs.length === 0 ? 'number | Float64Array'
    : outputs.length === 1 ? resultType(outputs[0])
      : `{ ${outputs.map((one) => `${one.name}: ${resultType(one)}`).join('; ')} }`;
  return `/**\n${comment.split('\n').map((line) => ` * ${line}`.trimEnd()).join('\n')}\n */\n` +
    `export function ${js}(${parameters.join(', ')}): ${result};\n`;
}
const union = (ending) => Object.keys(constants).filter((name) => name.endsWith(ending) && !name.startsWith('NUM_'))
  .flatMap((name) => (ending === 'DEG' ? [name] : [name, name.slice(0, -ending.length)]))
  .map((name) => `'${name}'`).join(' | ');

mkdirSync(output, { recursive: true });
const write = (name, content) => writeFileSync(join(output, name), content);
write('functions.js', `// Written by build.mjs.\n\nexport const constants = ${JSON.stringify(constants)};\n\n` +
  `export const table = [\n${functions.map(rowOf).join('\n')}\n];\n`);
write('index.js', `${readFileSync(join(here, 'index.js'), 'utf8')}
export const {
${functions.map(({ js }) => `  ${js},\n`).join('')}} = functionsOf(wasm, table, constants);
`);
write('index.d.ts', `${readFileSync(join(here, 'index.d.ts'), 'utf8')}
export type Illuminant = number | ${union('DEG')};
export type Status = number | ${union('_STATUS')};
export type Response = number | ${union('_RESPONSE')};

${functions.map(declarationOf).join('\n')}`);
const { version } = /project\(Vantrel VERSION (?<version>[\d.]+)/.exec(read('CMakeLists.txt')).groups;
write('package.json', `${JSON.stringify({
  ...JSON.parse(readFileSync(join(here, 'package.json'), 'utf8')), version }, null, 2)}\n`);
for (const name of ['rows.js', 'peaks.js', 'README.md']) copyFileSync(join(here, name), join(output, name));
copyFileSync(join(here, '../vantrel.js'), join(output, 'vantrel.js'));
for (const name of ['module.mjs', 'module.wasm']) copyFileSync(join(module, name), join(output, name));
for (const name of ['LICENSE', 'THIRD-PARTY.txt']) copyFileSync(join(root, name), join(output, name));
console.log(`${functions.length} functions`);

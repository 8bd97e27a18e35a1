// The library and measurement files in JavaScript, over the module that scripts/web builds of src/ and
// sheets/. Where the library refuses, a call throws an Error with the reason.

const encoder = new TextEncoder();
const decoder = new TextDecoder();

// What is no number would become one, null a 0.
export function requireNumbers(values, label) {
  const at = ArrayBuffer.isView(values) ? -1
    : Array.from(values).findIndex((value) => typeof value !== 'number');
  if (at >= 0) throw new TypeError(`${label} has ${values[at]} at place ${at}, no number`);
}

// `create` is what module.mjs exports, `wasmBinary` the bytes of module.wasm.
export async function load(create, wasmBinary) {
  const wasm = await create({ wasmBinary, locateFile: (name) => name });
  const left = new FinalizationRegistry((pointer) => wasm._vantrel_close(pointer));

  const allocate = (size) => {
    const at = wasm._malloc(size) >>> 0;
    if (!at) throw new Error('not enough memory');
    return at;
  };
  // A number that JSON lacks would travel as null, which is none.
  const optionsOf = (options) => JSON.stringify(options, (name, value) => {
    if (typeof value === 'number' && !Number.isFinite(value))
      throw new TypeError(`an option holds ${value}, no number`);
    return value;
  });
  const textAt = (at) => decoder.decode(wasm.HEAPU8.subarray(at, wasm.HEAPU8.indexOf(0, at)));

  // Calls with each argument as the library takes it: bytes, numbers and texts are copied in and freed
  // again; a function is told how far the work is.
  function ask(name, ...given) {
    const copies = [];
    let teller = 0;
    let thrown; // by a teller, which the module must not see
    const copy = (bytes, end = 0) => {
      const at = allocate(bytes.length + end);
      copies.push(at);
      wasm.HEAPU8.set(bytes, at);
      if (end) wasm.HEAPU8[at + bytes.length] = 0;
      return at;
    };
    const passed = (value) => {
      if (typeof value === 'string') return copy(encoder.encode(value), 1);
      if (ArrayBuffer.isView(value))
        return copy(new Uint8Array(value.buffer, value.byteOffset, value.byteLength));
      if (typeof value !== 'function') return value;
      teller = wasm.addFunction((user, what, share) => {
        if (thrown) return;
        try {
          value(textAt(what), share);
        } catch (error) {
          thrown = { error };
        }
      }, 'viid');
      return teller;
    };
    try {
      const answer = wasm[`_vantrel_${name}`](...given.map(passed)) >>> 0;
      const at = wasm._vantrel_answer_text(answer) >>> 0;
      const said = decoder.decode(
        wasm.HEAPU8.subarray(at, at + (wasm._vantrel_answer_size(answer) >>> 0)));
      const ok = wasm._vantrel_answer_ok(answer);
      wasm._vantrel_answer_free(answer);
      if (thrown) throw thrown.error;
      if (!ok) throw new Error(said);
      return said;
    } finally {
      copies.forEach((at) => wasm._free(at));
      if (teller) wasm.removeFunction(teller);
    }
  }

  class Sheet {
    #pointer;
    #about;
    constructor(call) {
      const place = allocate(4);
      const memory = () => new DataView(wasm.HEAPU8.buffer);
      memory().setUint32(place, 0);
      try {
        this.#about = JSON.parse(call(place));
        this.#pointer = memory().getUint32(place, true);
        left.register(this, this.#pointer, this);
      } catch (error) {
        wasm._vantrel_close(memory().getUint32(place, true));
        throw error;
      } finally {
        wasm._free(place);
      }
    }
    get pointer() {
      if (!this.#pointer) throw new Error(`${this.file} is closed`);
      return this.#pointer;
    }
    get file() { return this.#about.file; }
    get patches() { return this.#about.patches; }
    get warnings() { return this.#about.warnings; }
    get names() {
      return Array.from({ length: this.patches }, (_, i) =>
        textAt(wasm._vantrel_patch_name(this.pointer, i) >>> 0));
    }
    get ids() {
      return Array.from({ length: this.patches }, (_, i) =>
        textAt(wasm._vantrel_patch_id(this.pointer, i) >>> 0));
    }
    // A row of 31 percentages for each patch, or null of colours alone.
    get spectra() {
      const size = this.patches * 31;
      const at = allocate(size * 8);
      try {
        if (!wasm._vantrel_spectra(this.pointer, at)) return null;
        return new Float64Array(wasm.HEAPU8.buffer, at, size).slice();
      } finally {
        wasm._free(at);
      }
    }
    close() { // what is not closed goes with the object, at some time
      if (!this.#pointer) return;
      left.unregister(this);
      wasm._vantrel_close(this.#pointer);
      this.#pointer = 0;
    }
  }

  const answered = (text, { format }) =>
    (['json', 'page'].includes(format ?? 'json') ? JSON.parse(text) : text);
  const pointerOf = (sheet) => {
    if (sheet instanceof Sheet) return sheet.pointer;
    throw new TypeError('what is no sheet of read() or readSpectra() was given for one');
  };
  const pointersOf = (sheets) => Uint32Array.from([sheets].flat(), pointerOf);
  const tellerOf = (tell) => {
    if (typeof (tell ?? load) === 'function') return tell ?? 0;
    throw new TypeError('what is told the progress is no function');
  };
  function bytesOf(given) {
    if (typeof given === 'string') return encoder.encode(given);
    if (ArrayBuffer.isView(given)) return new Uint8Array(given.buffer, given.byteOffset, given.byteLength);
    if (Array.isArray(given) || /^\[object (Shared)?ArrayBuffer\]$/.test(Object.prototype.toString.call(given)))
      return new Uint8Array(given);
    throw new TypeError('read() takes a text or the bytes of a file');
  }

  const answers = {
    // A text as the library writes it.
    report: (sheets, { secondSheet, ...options } = {}, tell) => {
      const pointers = pointersOf(sheets);
      return ask('report', pointers, pointers.length, secondSheet ? pointerOf(secondSheet) : 0,
        optionsOf(options), tellerOf(tell), 0);
    },
    compare: (aims, sheet, options = {}, tell) =>
      ask('compare', pointerOf(aims), pointerOf(sheet), optionsOf(options), tellerOf(tell), 0),
    run: (sheets, aims, options = {}) => {
      const pointers = pointersOf(sheets);
      return ask('run', pointers, pointers.length, pointerOf(aims), optionsOf(options));
    },
    predict: (sheet, options = {}) => ask('predict', pointerOf(sheet), optionsOf(options)),
    ink: (sheet, options = {}) => ask('ink', pointerOf(sheet), optionsOf(options)),
  };

  return {
    wasm,
    answers,
    // CGATS text, CSV or CxF, as bytes or a text.
    read(given, { name = 'sheet', ...options } = {}, tell) {
      const bytes = bytesOf(given);
      return new Sheet((place) => ask('open', `${name}`, bytes, bytes.length, optionsOf(options), place,
        tellerOf(tell), 0));
    },
    // Rows of reflectances in memory.
    readSpectra(spectra, { name = 'spectra', names, bands = 31, ...options } = {}) {
      requireNumbers(spectra, 'spectra of readSpectra()');
      const rows = spectra.length / bands;
      if (!Number.isInteger(rows) || (names && names.length !== rows))
        throw new Error(`${spectra.length} values are no rows of ${bands}, with a name each`);
      const texts = (names ?? []).map((text) => encoder.encode(`${text}\0`));
      if (texts.some((text) => text.indexOf(0) !== text.length - 1))
        throw new TypeError('a name holds a character 0');
      const at = allocate(texts.reduce((size, { length }) => size + length, 1));
      let end = at;
      const places = texts.map((text) => {
        wasm.HEAPU8.set(text, end);
        return (end += text.length) - text.length;
      });
      try {
        return new Sheet((place) => ask('open_spectra', `${name}`, Float64Array.from(spectra), rows, bands,
          names ? Uint32Array.from(places) : 0, optionsOf(options), place));
      } finally {
        wasm._free(at);
      }
    },
    report: (sheets, options = {}, tell) => answered(answers.report(sheets, options, tell), options),
    compare: (aims, sheet, options = {}, tell) =>
      answered(answers.compare(aims, sheet, options, tell), options),
    run: (sheets, aims, options = {}) => answered(answers.run(sheets, aims, options), options),
    predict: (sheet, options = {}) => answered(answers.predict(sheet, options), options),
    ink: (sheet, options = {}) => answered(answers.ink(sheet, options), options),
  };
}

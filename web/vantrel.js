// The library and measurement files in JavaScript, over the module that scripts/web builds of src/ and
// sheets/. Where the library refuses, a call throws an Error with the reason.

const encoder = new TextEncoder();
const decoder = new TextDecoder();

// `create` is what module.mjs exports, `wasmBinary` the bytes of module.wasm.
export async function load(create, wasmBinary) {
  const wasm = await create({ wasmBinary, locateFile: (name) => name });
  const left = new FinalizationRegistry((pointer) => wasm._vantrel_close(pointer));

  const allocate = (size) => {
    const at = wasm._malloc(size) >>> 0;
    if (!at) throw new Error('not enough memory');
    return at;
  };
  const textAt = (at) => decoder.decode(wasm.HEAPU8.subarray(at, wasm.HEAPU8.indexOf(0, at)));

  // Calls with each argument as the library takes it: bytes, numbers and texts are copied in and freed
  // again; a function is told how far the work is.
  function ask(name, ...given) {
    const copies = [];
    let teller = 0;
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
      teller = wasm.addFunction((user, what, share) => value(textAt(what), share), 'viid');
      return teller;
    };
    try {
      const answer = wasm[`_vantrel_${name}`](...given.map(passed)) >>> 0;
      const at = wasm._vantrel_answer_text(answer) >>> 0;
      const said = decoder.decode(
        wasm.HEAPU8.subarray(at, at + (wasm._vantrel_answer_size(answer) >>> 0)));
      const ok = wasm._vantrel_answer_ok(answer);
      wasm._vantrel_answer_free(answer);
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
      try {
        this.#about = JSON.parse(call(place));
        this.#pointer = new DataView(wasm.HEAPU8.buffer).getUint32(place, true);
        left.register(this, this.#pointer, this);
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

  const answered = (text, { format = 'json' }) =>
    (format === 'json' || format === 'page' ? JSON.parse(text) : text);
  const list = (sheets) => [sheets].flat();

  return {
    wasm,
    // CGATS text, CSV or CxF, as bytes or a text.
    read(bytes, { name = 'sheet', ...options } = {}, tell = 0) {
      const given = typeof bytes === 'string' ? encoder.encode(bytes) : new Uint8Array(bytes);
      return new Sheet((place) =>
        ask('open', name, given, given.length, JSON.stringify(options), place, tell, 0));
    },
    // Rows of reflectances in memory.
    readSpectra(spectra, { name = 'spectra', names, bands = 31, ...options } = {}) {
      const rows = spectra.length / bands;
      if (!Number.isInteger(rows) || (names && names.length !== rows))
        throw new Error(`${spectra.length} values are no rows of ${bands}, with a name each`);
      const texts = encoder.encode((names ?? []).map((text) => `${text}\0`).join(''));
      const at = allocate(texts.length + 1);
      wasm.HEAPU8.set(texts, at);
      const places = [];
      for (let place = at; places.length < rows && names; place = wasm.HEAPU8.indexOf(0, place) + 1)
        places.push(place);
      try {
        return new Sheet((place) => ask('open_spectra', name, Float64Array.from(spectra), rows, bands,
          names ? Uint32Array.from(places) : 0, JSON.stringify(options), place));
      } finally {
        wasm._free(at);
      }
    },
    report: (sheets, { secondSheet, ...options } = {}, tell = 0) =>
      answered(ask('report', Uint32Array.from(list(sheets), (sheet) => sheet.pointer),
        list(sheets).length, secondSheet?.pointer ?? 0, JSON.stringify(options), tell, 0), options),
    compare: (aims, sheet, options = {}, tell = 0) =>
      answered(ask('compare', aims.pointer, sheet.pointer, JSON.stringify(options), tell, 0), options),
    run: (sheets, aims, options = {}) =>
      answered(ask('run', Uint32Array.from(list(sheets), (sheet) => sheet.pointer), list(sheets).length,
        aims.pointer, JSON.stringify(options)), options),
    predict: (sheet, options = {}) =>
      answered(ask('predict', sheet.pointer, JSON.stringify(options)), options),
    ink: (sheet, options = {}) =>
      answered(ask('ink', sheet.pointer, JSON.stringify(options)), options),
  };
}

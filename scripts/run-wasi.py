"""Runs a WebAssembly program under wasmtime, with the files of the current folder."""

import sys

import wasmtime

engine = wasmtime.Engine()
linker = wasmtime.Linker(engine)
linker.define_wasi()
store = wasmtime.Store(engine)
wasi = wasmtime.WasiConfig()
wasi.argv = sys.argv[1:]
wasi.preopen_dir(".", ".")
wasi.inherit_stdout()
wasi.inherit_stderr()
store.set_wasi(wasi)
program = linker.instantiate(store, wasmtime.Module.from_file(engine, sys.argv[1]))
try:
    program.exports(store)["_start"](store)
except wasmtime.ExitTrap as end:
    sys.exit(end.code)
